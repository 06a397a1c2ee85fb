#include "structures/weir_page.h"

#include <array>

#include "platform/units/units.h"
#include "structures/page_texts.h"
#include "structures/structures_parts.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

using Object = CNhdWeirObjectKvs;

constexpr std::array kLosses{"In flow+", "Out flow+", "Free flow+", "In flow-", "Out flow-", "Free flow-"};
static_assert(kLosses.size() == std::tuple_size_v<decltype(Object::headLoss)>);

constexpr int kNoQuantity = 0;

// In the order of the grid.
Choices types() {
  return Choices::lines("Broad crested weir\r\nWeir formula 1\r\nWeir formula 2 (Honma)",
                        {Object::kBroadCrested, Object::kFormula1, Object::kFormula2})
      .Otherwise(0);
}

}  // namespace

void CWeirGrid::LayOut() {
  const auto weir = RowsOf(&StructureParts::nhdWeir);
  PlaceColumns(weir);
  List("Type", 130, weir, &Object::type, types());
  ValveColumn(weir);
  AlphaZeroColumn(weir);
  HeadLossColumns(texts::weirHeadLosses.format, kLosses,
                  [weir](GridRow row, std::size_t place) { return &weir(row)->headLoss[place]; });
}

void CWeirDataGrid::LayOut() {
  constexpr int kWidth = 75;
  const auto weir = RowsOf(&StructureParts::nhdWeir);
  const auto isOf = [weir](Object::Type type) {
    return [weir, type](GridRow row) { return weir(row)->type == type; };
  };
  const auto number = [&](const char* header, double Object::*value, int quantity) -> Column& {
    return Number("", kWidth, weir, value, quantity).SubHeader(header);
  };
  // The first column of a group has the type that it is for above it.
  const auto group = [](Column& column, Object::Type type, int columns) {
    column.HeaderSpan(columns).header = types().textOf(type);
  };
  const auto broad = isOf(Object::kBroadCrested);
  group(number("Datum", &Object::datum, item::kLevel).EnabledIf(broad), Object::kBroadCrested, 2);
  LevelWidthColumn(weir).SubHeader("Geometry").EnabledIf(broad);

  const auto formula1 = isOf(Object::kFormula1);
  group(number("Width", &Object::width1, item::kLevel).EnabledIf(formula1), Object::kFormula1, 5);
  number("Height", &Object::height1, item::kLevel).EnabledIf(formula1);
  number("Weir coeff.", &Object::coefficient1, item::kChezyNumber).EnabledIf(formula1);
  number(" Weir exp.", &Object::exponent1, kNoQuantity).EnabledIf(formula1);
  number("Invert level", &Object::invertLevel1, item::kLevel).EnabledIf(formula1);

  const auto formula2 = isOf(Object::kFormula2);
  group(number("Width", &Object::width2, item::kLevel).EnabledIf(formula2), Object::kFormula2, 3);
  number("Crest level", &Object::crestLevel2, item::kLevel).EnabledIf(formula2);
  number("Weir coeff.", &Object::coefficient2, item::kChezyNumber).EnabledIf(formula2);
}

void CNHdWeirDlg::DoDataExchange(Form& form) {
  AddStructureCount(form, "Number of weirs", objectOf(&StructureParts::nhdWeir));
  form.Grid("Weirs", grid_);
  form.Grid("Weir data", dataGrid_);
}

}  // namespace gridbay
