#pragma once

#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/list_kvs.h"
#include "core/selections.h"
#include "families/kind_row.h"
#include "hydrodynamic/texts.h"

namespace gridbay {

class CSourceSinkObjectKvs;

// What flows at one location of the list of sources and sinks. Values in base units.
class CNhdSourceSinkObjectKvs final : public TableKvs<CNhdSourceSinkObjectKvs> {
 public:
  static constexpr std::int32_t kConstant = 0;
  static constexpr std::int32_t kFromFile = 1;

  using TableKvs::TableKvs;

  std::int32_t dataFormat = kConstant;
  float outletDirection = 0;
  float constantMagnitude = 0;  // discharge
  float constantVelocity = 0;
  UTsbSelection dataFile{2};  // magnitude and velocity; magnitude alone for an isolated sink
  std::string itemMagnitude;
  std::string itemVelocity;

  static constexpr auto table() {
    using Self = CNhdSourceSinkObjectKvs;
    return keywords(keyword("Outlet_Dir", &Self::outletDirection), keyword("Data_Format", &Self::dataFormat),
                    keyword("Constant_Magnitude", &Self::constantMagnitude),
                    keyword("Constant_Velocity", &Self::constantVelocity), selection(&Self::dataFile, 2),
                    keyword("Item_Magnitude", &Self::itemMagnitude),
                    keyword("Item_Velocity", &Self::itemVelocity));
  }

  using TableKvs::Validate;
  // Number from 1, as in the list of locations. The selection of a file takes its number of items.
  unsigned Validate(ValidationList& messages, int deep, int number);

  // The number of items that the file of location `number` must give: an isolated sink has no velocity.
  int NoItems(int number);
  // What that file must be, and its items, as many as it must give.
  void RequestDataFile(CVdFileSelectorDlg& selector, int number);
};

// Evaporation and precipitation of the whole model, and what flows at its sources and sinks; the list follows
// the count of locations.
class CNhdSourceSinkKvs final : public ListKvs<CNhdSourceSinkKvs, CNhdSourceSinkObjectKvs> {
 public:
  enum Kind : std::int32_t { kConstant = 0, kTimeSeries = 1, kMap = 2 };

  using ListKvs::ListKvs;

  float evaporation = 0;
  float precipitation = 0;
  std::int32_t evaporationKind = kConstant;
  std::int32_t precipitationKind = kConstant;
  UTsbSelection evaporationFile{1};
  UTsbSelection precipitationFile{1};
  bool netPrecipitation = false;  // the precipitation has the evaporation in it already
  bool rainOnDryLand = true;

  // The sections of the two files have the names of the constants before them.
  static constexpr auto table() {
    using Self = CNhdSourceSinkKvs;
    return section("SOURCE_AND_SINK", notCopied(kindRow("EvaporationType", &Self::evaporationKind)),
                   keyword("Evaporation", &Self::evaporation),
                   notCopied(section("Evaporation", selection(&Self::evaporationFile, 1))),
                   notCopied(keyword("NetPrecipitation", &Self::netPrecipitation)),
                   notCopied(kindRow("PrecipitationType", &Self::precipitationKind)),
                   keyword("Precipitation", &Self::precipitation),
                   notCopied(section("Precipitation", selection(&Self::precipitationFile, 1))),
                   items("SOURCE_SINK_%d", texts::hdSourceSectionMissing),
                   notCopied(keyword("RainOnDryLand", &Self::rainOnDryLand)));
  }

  unsigned Validate(ValidationList& messages, int deep) override;

  // What the file of the evaporation, and of the precipitation, must be.
  void RequestEvaporation(CVdFileSelectorDlg& selector);
  void RequestPrecipitation(CVdFileSelectorDlg& selector);

  // Whether rain falls, and whether water evaporates, also as a part of net precipitation. The concentrations
  // in rain and evaporation are asked for then.
  bool HasPrecipitation() const { return precipitationKind != kConstant || precipitation > 0; }
  bool HasEvaporation() const {
    return evaporationKind != kConstant || evaporation > 0 || (HasPrecipitation() && netPrecipitation);
  }

 private:
  void requestKind(CVdFileSelectorDlg& selector, CVdRqTsbItem& request, std::int32_t kind);
};

}  // namespace gridbay
