#include "basic/simulation_period.h"

#include <algorithm>
#include <limits>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/texts.h"
#include "core/table_code.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr float kShortestStep = 0.01F;

std::int32_t saturated(std::int64_t number) {
  using Limits = std::numeric_limits<std::int32_t>;
  return static_cast<std::int32_t>(std::clamp<std::int64_t>(number, Limits::min(), Limits::max()));
}

}  // namespace

void CSimulationPeriodKvs::StepsRow::save(const CSimulationPeriodKvs& period, KvsFile& file,
                                          const std::string&) const {
  kvsPutParam(file, name, period.LastTimeStep());
}

void CSimulationPeriodKvs::StepsRow::load(CSimulationPeriodKvs& period, KvsSection from,
                                          const std::string&) const {
  kvsGetParam(from, name, &period.noPointsInTime, 1, 1);
  period.noPointsInTime = saturated(std::int64_t{period.noPointsInTime} + 1);
}

unsigned CSimulationPeriodKvs::Validate(ValidationList& messages, int) {
  const auto fault = [&messages](const Text& text) {
    return report(messages, PageId::simulationPeriod, Severity::fault, text);
  };
  auto* basic = parts<BasicParts>();
  const bool hotStart = basic != nullptr && basic->bathymetry->hotStart != 0;
  unsigned faults = 0;
  if (timeStepInterval < kShortestStep) faults += fault(texts::timeStepTooSmall);
  if (noPointsInTime < 0) faults += fault(texts::negativeTimeSteps);
  if (warmUpPeriod < 0) faults += fault(texts::negativeWarmUp);
  if (warmUpPeriod > noPointsInTime && hotStart) faults += fault(texts::warmUpTooLong);
  return faults;
}

std::int32_t CSimulationPeriodKvs::LastTimeStep() const {
  return saturated(std::int64_t{noPointsInTime} - 1);
}

DateTime CSimulationPeriodKvs::End() const {
  const double stepDays = qunConvertUnit(unit::kSecond, unit::kDay, timeStepInterval).value_or(0);
  return start.plusDays(stepDays * (double{static_cast<double>(noPointsInTime)} - 1));
}

void CSimulationPeriodKvs::SetRequestPeriod(CVdFileSelectorDlg& request) const {
  request.SetRequestPeriod(start, End());
}

}  // namespace gridbay
