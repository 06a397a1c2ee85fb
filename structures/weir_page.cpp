#include "structures/weir_page.h"

#include <array>

#include "platform/units/units.h"
#include "structures/page_texts.h"
#include "structures/structure_choices.h"
#include "structures/structures_parts.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

using Weir = CNhdWeirObjectKvs;

constexpr std::array kLosses{"In flow+", "Out flow+", "Free flow+", "In flow-", "Out flow-", "Free flow-"};
static_assert(kLosses.size() == std::tuple_size_v<decltype(Weir::headLoss)>);

constexpr int kNoQuantity = 0;

}  // namespace

void CWeirGrid::LayOut() {
  const auto weir = RowsOf(&StructureParts::nhdWeir);
  PlaceColumns(weir);
  List("Type", 130, weir, &Weir::type, weirTypes());
  ValveColumn(weir);
  AlphaZeroColumn(weir);
  HeadLossColumns(texts::weirHeadLosses.format, kLosses,
                  [weir](GridRow row, std::size_t place) { return &weir(row)->headLoss[place]; });
}

void CWeirDataGrid::LayOut() {
  constexpr int kWidth = 75;
  const auto weir = RowsOf(&StructureParts::nhdWeir);
  const auto isOf = [weir](Weir::Type type) {
    return [weir, type](GridRow row) { return weir(row)->type == type; };
  };
  const auto number = [&](const char* header, double Weir::*value, int quantity) -> Column& {
    return Number("", kWidth, weir, value, quantity).SubHeader(header);
  };
  // The first column of a group has the type that it is for above it.
  const auto group = [](Column& column, Weir::Type type, int columns) {
    column.HeaderSpan(columns).header = weirTypes().textOf(type);
  };
  const auto broad = isOf(Weir::kBroadCrested);
  group(number("Datum", &Weir::datum, item::kLevel).EnabledIf(broad), Weir::kBroadCrested, 2);
  LevelWidthColumn(weir).SubHeader("Geometry").EnabledIf(broad);

  const auto formula1 = isOf(Weir::kFormula1);
  group(number("Width", &Weir::width1, item::kLevel).EnabledIf(formula1), Weir::kFormula1, 5);
  number("Height", &Weir::height1, item::kLevel).EnabledIf(formula1);
  number("Weir coeff.", &Weir::coefficient1, item::kChezyNumber).EnabledIf(formula1);
  number(" Weir exp.", &Weir::exponent1, kNoQuantity).EnabledIf(formula1);
  number("Invert level", &Weir::invertLevel1, item::kLevel).EnabledIf(formula1);

  const auto formula2 = isOf(Weir::kFormula2);
  group(number("Width", &Weir::width2, item::kLevel).EnabledIf(formula2), Weir::kFormula2, 3);
  number("Crest level", &Weir::crestLevel2, item::kLevel).EnabledIf(formula2);
  number("Weir coeff.", &Weir::coefficient2, item::kChezyNumber).EnabledIf(formula2);
}

void CNHdWeirDlg::DoDataExchange(Form& form) {
  AddStructureCount(form, "Number of weirs", objectOf(&StructureParts::nhdWeir));
  form.Grid("Weirs", grid_);
  form.Grid("Weir data", dataGrid_);
}

}  // namespace gridbay
