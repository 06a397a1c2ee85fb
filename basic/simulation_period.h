#pragma once

#include <cstdint>

#include "core/date_time.h"
#include "core/file_selector.h"
#include "core/table_kvs.h"

namespace gridbay {

// Start, time step (seconds) and number of steps of the simulation. The model holds the number of points in
// time, one more than the number of steps on file.
class CSimulationPeriodKvs final : public TableKvs<CSimulationPeriodKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t noPointsInTime = 101;
  float timeStepInterval = 30.0F;
  DateTime start = DateTime::of({1990, 1, 1, 12, 0, 0});
  std::int32_t warmUpPeriod = 0;  // its last time step

  // One less on file. A load adds one whether or not the keyword was there.
  struct StepsRow {
    std::string_view name;

    void save(const CSimulationPeriodKvs& period, KvsFile& file, const std::string& documentPath) const;
    void load(CSimulationPeriodKvs& period, KvsSection from, const std::string& documentPath) const;
    void copy(CSimulationPeriodKvs& period, const CSimulationPeriodKvs& other) const {
      period.noPointsInTime = other.noPointsInTime;
    }
    static constexpr auto members() { return std::tuple(&CSimulationPeriodKvs::noPointsInTime); }
  };

  static constexpr auto table() {
    return section("SIMULATION_PERIOD", StepsRow{"Number_Of_Timesteps"},
                   keyword("Time_Step_Interval", &CSimulationPeriodKvs::timeStepInterval),
                   keyword("Warm_Up_Period", &CSimulationPeriodKvs::warmUpPeriod),
                   keyword("Start_Time", &CSimulationPeriodKvs::start));
  }

  unsigned Validate(ValidationList& messages, int deep) override;

  // The number of the last time step; the first is 0.
  std::int32_t LastTimeStep() const;
  // The moment of the last time step.
  DateTime End() const;
  // Requires of a data file that it covers the simulation.
  void SetRequestPeriod(CVdFileSelectorDlg& request) const;
};

}  // namespace gridbay
