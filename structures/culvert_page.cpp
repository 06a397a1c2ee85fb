#include "structures/culvert_page.h"

#include <array>

#include "platform/units/units.h"
#include "structures/culvert.h"
#include "structures/page_texts.h"
#include "structures/structure_choices.h"
#include "structures/structures_parts.h"

namespace gridbay {
namespace {

using Culvert = CNhdCulvertObjectKvs;

constexpr std::array kLosses{"In flow+", "Out flow+", "Free flow+", "Bends+",
                             "In flow-", "Out flow-", "Free flow-", "Bends-"};
static_assert(kLosses.size() == std::tuple_size_v<decltype(Culvert::headLoss)>);

}  // namespace

void CCulvertGrid::LayOut() {
  const auto culvert = RowsOf(&StructureParts::nhdCulvert);
  PlaceColumns(culvert);
  ValveColumn(culvert);
  AlphaZeroColumn(culvert);
  HeadLossColumns(texts::culvertHeadLosses.format, kLosses,
                  [culvert](GridRow row, std::size_t place) { return &culvert(row)->headLoss[place]; });
}

void CCulvertDataGrid::LayOut() {
  constexpr int kWidth = 75;
  constexpr int kLongWidth = 105;
  const auto culvert = RowsOf(&StructureParts::nhdCulvert);
  const auto isOf = [culvert](Culvert::GeometryType type) {
    return [culvert, type](GridRow row) { return culvert(row)->geometryType == type; };
  };
  const auto isCircular = isOf(Culvert::kCircular);
  const auto isRectangular = isOf(Culvert::kRectangular);
  List("Geometry Type", 140, culvert, &Culvert::geometryType, culvertGeometries());
  LevelWidthColumn(culvert).EnabledIf(isOf(Culvert::kIrregular)).header = "Geometry";
  List("Section Type", 80, culvert, &Culvert::sectionType, Choices::lines("Closed\r\nOpen"))
      .EnabledIf([isCircular](GridRow row) { return !isCircular(row); });
  Number("Circular", kWidth, culvert, &Culvert::diameter, item::kLevel)
      .SubHeader("Diameter")
      .EnabledIf(isCircular);
  Number("Rectangular", kWidth, culvert, &Culvert::sectionWidth, item::kLevel)
      .SubHeader("Width")
      .HeaderSpan(2)
      .EnabledIf(isRectangular);
  Number("", kWidth, culvert, &Culvert::sectionHeight, item::kLevel)
      .SubHeader("Height")
      .EnabledIf(isRectangular);
  Number("Upstream invert", kLongWidth, culvert, &Culvert::upstreamInvert, item::kLevel);
  Number("Downstream invert", kLongWidth, culvert, &Culvert::downstreamInvert, item::kLevel);
  Number("Length", kWidth, culvert, &Culvert::length, item::kLevel);
  Number("Mannings n", kWidth, culvert, &Culvert::manningN);
  Integer("No of culverts", kWidth, culvert, &Culvert::numberOfCulverts).Right();
}

void CNHdCulvertDlg::DoDataExchange(Form& form) {
  AddStructureCount(form, "Number of culverts", objectOf(&StructureParts::nhdCulvert));
  form.Grid("Culverts", grid_);
  form.Grid("Culvert data", dataGrid_);
}

}  // namespace gridbay
