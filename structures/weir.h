#pragma once

#include <array>
#include <cstdint>

#include "core/file_name.h"
#include "structures/line_structure.h"
#include "structures/texts.h"

namespace gridbay {

// A weir. Values in base units.
class CNhdWeirObjectKvs final : public TableKvs<CNhdWeirObjectKvs>, public LineStructure {
 public:
  enum Type : std::int32_t { kBroadCrested = 0, kFormula1 = 2, kFormula2 = 3 };

  using TableKvs::TableKvs;

  std::int32_t type = kBroadCrested;
  std::int32_t geometryAttribute = 0;  // no page has it
  double datum = 0;                    // of the levels in the table
  // Formula 1.
  double width1 = 1;
  double height1 = 1;
  double coefficient1 = 1.838;
  double exponent1 = 1.5;
  double invertLevel1 = 1;
  // Formula 2 (Honma).
  double width2 = 1;
  double crestLevel2 = 1;
  double coefficient2 = 1.838;
  // Formula 3 (extended Honma), which no page has: it passes through.
  std::array<double, 14> formula3{0, 0, 0, 0.6, 1.02, 1.37, 1, 0.03, 1.018, 1, 0, 2.6, 1, 0.7};
  // Inflow, outflow and free overflow, of positive and then of negative flow.
  std::array<double, 6> headLoss{0.5, 1, 1, 0.5, 1, 1};

  static constexpr auto table() {
    using Self = CNhdWeirObjectKvs;
    return lineStructureTable(
        values("Attributes", &Self::type, &Self::valve), keyword("HeadLossFactors", &Self::headLoss),
        values("WeirFormulaParam", &Self::width1, &Self::height1, &Self::coefficient1, &Self::exponent1,
               &Self::invertLevel1),
        values("WeirFormula2Param", &Self::width2, &Self::crestLevel2, &Self::coefficient2),
        keyword("WeirFormula3Param", &Self::formula3),
        section("Geometry", values("Attributes", &Self::geometryAttribute, &Self::datum),
                LevelWidthRow{"Level_Width"}));
  }
};

// The weirs, and the head of the section of all structures.
class CNhdWeirKvs final : public LineStructureList<CNhdWeirKvs, CNhdWeirObjectKvs> {
 public:
  using LineStructureList::LineStructureList;

  UFileName crossSectionFile;
  std::string crossSectionDataBridge = "xns11";
  std::int32_t versionMajor = 1;
  std::int32_t versionMinor = 1;

  static constexpr auto table() {
    using Self = CNhdWeirKvs;
    return keywords(values("Structure_Version", &Self::versionMajor, &Self::versionMinor),
                    section("CROSSSECTIONS", keyword("CrossSectionDataBridge", &Self::crossSectionDataBridge),
                            keyword("CrossSectionFile", &Self::crossSectionFile)),
                    section("WEIR", repeatedItems("number_of_weirs", "weir_data")));
  }

  void initialise(CNhdWeirObjectKvs& weir, int number) { weir.name = formatted(texts::weirName, number); }
};

}  // namespace gridbay
