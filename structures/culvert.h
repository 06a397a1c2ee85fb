#pragma once

#include <array>
#include <cstdint>

#include "structures/line_structure.h"

namespace gridbay {

// A culvert, or several alike beside each other. Values in base units.
class CNhdCulvertObjectKvs final : public TableKvs<CNhdCulvertObjectKvs>, public LineStructure {
 public:
  enum GeometryType : std::int32_t { kRectangular = 0, kCircular = 1, kIrregular = 2 };

  using TableKvs::TableKvs;

  std::int32_t sectionType = 0;  // 0 closed, 1 open
  std::int32_t geometryType = kRectangular;
  double sectionWidth = 1;  // of a rectangle
  double sectionHeight = 1;
  double diameter = 1;  // of a circle
  double length = 1;
  double upstreamInvert = 0;
  double downstreamInvert = 0;
  double manningN = 0.013;  // s/m^(1/3)
  std::int32_t numberOfCulverts = 1;
  // Inflow, outflow, free overflow and bends, of positive and then of negative flow.
  std::array<double, 8> headLoss{0.5, 1, 1, 0, 0.5, 1, 1, 0};

  static constexpr auto table() {
    using Self = CNhdCulvertObjectKvs;
    return lineStructureTable(
        values("Attributes", &Self::upstreamInvert, &Self::downstreamInvert, &Self::length, &Self::manningN,
               &Self::numberOfCulverts, &Self::valve, &Self::sectionType),
        section("Geometry", keyword("Type", &Self::geometryType),
                values("Rectangular", &Self::sectionWidth, &Self::sectionHeight),
                keyword("Cicular_Diameter", &Self::diameter), LevelWidthRow{"Irregular"}),
        keyword("HeadLossFactors", &Self::headLoss));
  }
};

class CNhdCulvertKvs final : public LineStructureList<CNhdCulvertKvs, CNhdCulvertObjectKvs> {
 public:
  static constexpr bool kChecksItemsAlways = true;

  using LineStructureList::LineStructureList;

  static constexpr auto table() {
    return section("CULVERTS", repeatedItems("number_of_Culverts", "Culvert_data"));
  }
};

}  // namespace gridbay
