#include "structures/culvert_page.h"

#include <array>

#include "platform/units/units.h"
#include "structures/culvert.h"
#include "structures/page_texts.h"
#include "structures/structures_parts.h"

namespace gridbay {
namespace {

using Object = CNhdCulvertObjectKvs;

constexpr std::array kLosses{"In flow+", "Out flow+", "Free flow+", "Bends+",
                             "In flow-", "Out flow-", "Free flow-", "Bends-"};
static_assert(kLosses.size() == std::tuple_size_v<decltype(Object::headLoss)>);

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
  const auto isOf = [culvert](Object::GeometryType type) {
    return [culvert, type](GridRow row) { return culvert(row)->geometryType == type; };
  };
  const auto isCircular = isOf(Object::kCircular);
  const auto isRectangular = isOf(Object::kRectangular);
  List("Geometry Type", 140, culvert, &Object::geometryType,
       Choices::lines("Rectangular\r\nCircular\r\nIrregular, level-width"));
  LevelWidthColumn(culvert).EnabledIf(isOf(Object::kIrregular)).header = "Geometry";
  List("Section Type", 80, culvert, &Object::sectionType, Choices::lines("Closed\r\nOpen"))
      .EnabledIf([isCircular](GridRow row) { return !isCircular(row); });
  Number("Circular", kWidth, culvert, &Object::diameter, item::kLevel)
      .SubHeader("Diameter")
      .EnabledIf(isCircular);
  Number("Rectangular", kWidth, culvert, &Object::sectionWidth, item::kLevel)
      .SubHeader("Width")
      .HeaderSpan(2)
      .EnabledIf(isRectangular);
  Number("", kWidth, culvert, &Object::sectionHeight, item::kLevel)
      .SubHeader("Height")
      .EnabledIf(isRectangular);
  Number("Upstream invert", kLongWidth, culvert, &Object::upstreamInvert, item::kLevel);
  Number("Downstream invert", kLongWidth, culvert, &Object::downstreamInvert, item::kLevel);
  Number("Length", kWidth, culvert, &Object::length, item::kLevel);
  Number("Mannings n", kWidth, culvert, &Object::manningN);
  Integer("No of culverts", kWidth, culvert, &Object::numberOfCulverts).Right();
}

void CNHdCulvertDlg::DoDataExchange(Form& form) {
  AddStructureCount(form, "Number of culverts", objectOf(&StructureParts::nhdCulvert));
  form.Grid("Culverts", grid_);
  form.Grid("Culvert data", dataGrid_);
}

}  // namespace gridbay
