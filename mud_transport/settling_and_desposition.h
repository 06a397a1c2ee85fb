#pragma once

#include "families/layer_values.h"
#include "families/part_row.h"

namespace gridbay {

// The share of a fraction in the bed when the calculation begins.
class CNmtSettlingAndDespositionBedCompositionMapKvs final
    : public AreaMapKvs<CNmtSettlingAndDespositionBedCompositionMapKvs,
                        PageId::mtSettlingAndDespositionBedComposition> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtSettlingAndDespositionBedCompositionKvs final
    : public ConstantOrMapsKvs<CNmtSettlingAndDespositionBedCompositionKvs,
                               CNmtSettlingAndDespositionBedCompositionMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 1;

  static constexpr auto table() { return section("Initial_bed_composition", valueRows(), mapRows()); }
};

// How fast a fraction is eroded (g/m²/s).
class CNmtSettlingAndDespositionErosionMapKvs final
    : public AreaMapKvs<CNmtSettlingAndDespositionErosionMapKvs, PageId::mtSettlingAndDespositionErosion> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtSettlingAndDespositionErosionKvs final
    : public ConstantOrMapsKvs<CNmtSettlingAndDespositionErosionKvs,
                               CNmtSettlingAndDespositionErosionMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 0.005F;

  static constexpr auto table() { return section("EROSION_COEFFICIENTS", valueRows(), mapRows()); }
};

// How one component settles, and is taken up from the bed again. Velocities in m/s.
class CNmtSettlingAndDespositionComponentKvs final : public TableKvs<CNmtSettlingAndDespositionComponentKvs> {
 public:
  explicit CNmtSettlingAndDespositionComponentKvs(CKvsBase* parent) : TableKvs(parent) {}

  float criticalVelocityForDeposition = 0.1F;
  float criticalVelocityForErosion = 0.3F;
  float relativeHeightOfCentroid = 0.3F;  // above the bed, of the depth
  float meanSettlingVelocity = 0.0005F;
  CNmtSettlingAndDespositionBedCompositionKvs bedComposition{this};
  CNmtSettlingAndDespositionErosionKvs erosion{this};

  static constexpr auto table() {
    using Self = CNmtSettlingAndDespositionComponentKvs;
    return keywords(keyword("Critical_Velocity_For_Deposition", &Self::criticalVelocityForDeposition),
                    keyword("Critical_Velocity_For_Erosion", &Self::criticalVelocityForErosion),
                    keyword("Relative_Height_Of_Centroid", &Self::relativeHeightOfCentroid),
                    keyword("Mean_Settling_Velocity", &Self::meanSettlingVelocity),
                    part(&Self::bedComposition), part(&Self::erosion));
  }

  void SetNoAreas(int n) {
    bedComposition.SetCount(n);
    erosion.SetCount(n);
  }

  unsigned Validate(ValidationList& messages, int deep) override {
    const unsigned faults = bedComposition.Validate(messages, deep);
    return faults + erosion.Validate(messages, deep);
  }
};

// How all components settle in the multi fraction task. Salinity, where it is one of them, is the first.
class CNmtSettlingAndDespositionKvs final
    : public ListKvs<CNmtSettlingAndDespositionKvs, CNmtSettlingAndDespositionComponentKvs> {
 public:
  using ListKvs::ListKvs;

  static constexpr auto table() { return section("SETTLING_AND_DEPOSITION", items("COMPONENT_%d")); }
  void initialise(CNmtSettlingAndDespositionComponentKvs& component, int) {
    component.SetNoAreas(areaCount(*this));
  }

  // The model has n areas now.
  void SetNoAreas(int n) {
    for (int number = 1; number <= GetCount(); ++number) GetItem(number)->SetNoAreas(n);
  }
};

}  // namespace gridbay
