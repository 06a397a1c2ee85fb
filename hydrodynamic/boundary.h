#pragma once

#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/list_kvs.h"
#include "core/selections.h"
#include "hydrodynamic/texts.h"

namespace gridbay {

class CBoundaryObjectKvs;

// What drives the flow at one open boundary: a level or a flux, how it varies in time and along the boundary,
// how a level is tilted, and where the flow direction comes from. Values in base units.
class CNhdBoundaryObjectKvs final : public TableKvs<CNhdBoundaryObjectKvs> {
 public:
  static constexpr std::int32_t kLevel = 1;
  static constexpr std::int32_t kFlux = 2;

  enum DataFormat : std::int32_t {
    kConstant = 1,
    kSineSeries = 2,
    kType0File = 3,
    kType1File = 4,
    kTransferFile = 5,
    kRatingCurve = 7,
  };

  using TableKvs::TableKvs;

  std::int32_t formulation = kLevel;
  std::int32_t dataFormat = kConstant;
  float value = 0;
  std::int32_t fabType = 12;      // 0, 1, 2 or 12
  std::int32_t tiltType = -1;     // -1 none, 0 non-linear, 1 linear
  std::int32_t tiltingPoint = 0;  // J or K of the boundary point that stays fixed
  double relaxationFactor = 0.5;
  UTsbSelection dataFile{1};
  float referenceLevel = 0;
  float range = 1.0F;  // peak to peak
  float period = 43200.0F;
  float phase = 0;
  bool enableUserDirections = false;
  UTsbSelection directionFile{1};

  // A stored 3 is the list's fourth choice, which is 12 on file.
  struct FabTypeRow {
    std::string_view name;

    void save(const CNhdBoundaryObjectKvs& object, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdBoundaryObjectKvs& object, KvsSection from, const std::string& documentPath) const;
    void copy(CNhdBoundaryObjectKvs& object, const CNhdBoundaryObjectKvs& other) const {
      object.fabType = other.fabType;
    }
    static constexpr auto members() { return std::tuple(&CNhdBoundaryObjectKvs::fabType); }
  };

  static constexpr auto table() {
    using Self = CNhdBoundaryObjectKvs;
    return keywords(
        keyword("Formulation", &Self::formulation), keyword("Data_Format", &Self::dataFormat),
        keyword("Value", &Self::value), FabTypeRow{"FAB_Type"}, keyword("Tilt_Type", &Self::tiltType),
        keyword("Tilting_Point", &Self::tiltingPoint),
        notCopied(keyword("Relaxation_Factor", &Self::relaxationFactor)), selection(&Self::dataFile, 1),
        notCopied(section("SINUSOIDAL_BOUNDARY", keyword("Reference_Level", &Self::referenceLevel),
                          keyword("Range", &Self::range), keyword("Period", &Self::period),
                          keyword("Phase", &Self::phase))),
        section("USER_DIRECTIONS", keyword("Enable_User_Directions", &Self::enableUserDirections),
                selection(&Self::directionFile, 1)));
  }

  using TableKvs::Validate;
  // Number from 1, as in the list of boundaries.
  unsigned Validate(ValidationList& messages, int deep, int number);
  // All that CopyFrom takes over, and the sine series and the relaxation factor.
  void copyWhole(const CNhdBoundaryObjectKvs& other);

  // Changes the data format with what depends on it: the number of items chosen, and the FAB type. A format
  // that is set already changes nothing.
  void SetDataFormat(std::int32_t format);
  bool isFromFile() const { return dataFormat != kConstant && dataFormat != kSineSeries; }
  // The quantity of its values; of what its cell of data holds, a file's items included.
  int quantity() const;
  int dataQuantity() const;
  // What the data file, and the file of flow directions, of boundary `number` must be.
  void RequestDataFile(CVdFileSelectorDlg& selector, int number);
  void RequestDirectionFile(CVdFileSelectorDlg& selector, int number);

 private:
  CBoundaryObjectKvs* boundary(int number);
  void finishRequest(CVdFileSelectorDlg& selector);
};

// The conditions of all open boundaries; follows their count.
class CNhdBoundaryKvs final : public ListKvs<CNhdBoundaryKvs, CNhdBoundaryObjectKvs> {
 public:
  using ListKvs::ListKvs;

  static constexpr auto table() {
    return section("OPEN_BOUNDARY", items("BOUNDARY_%d", texts::hdBoundarySectionMissing));
  }

  void SetNoBoundaries(int n) { SetCount(n); }
};

}  // namespace gridbay
