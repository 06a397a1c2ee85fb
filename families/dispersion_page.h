#pragma once

#include <algorithm>
#include <string>

#include "families/root_member.h"
#include "families/transport_page_texts.h"
#include "pages/cell_grid.h"
#include "platform/units/units.h"

namespace gridbay {

// The maps of one direction, a row for each area. `member` is that of the root that holds the dispersion, a
// DispersionCoefKvs.
template <auto member>
class DispersionCoefGrid : public ColumnGrid {
 public:
  using Coefs = RootMember<member>;
  enum class Direction { x, y };

  explicit DispersionCoefGrid(Direction direction) : direction_(direction) {}

  bool IsEnabled() override {
    const Coefs& held = coefs();
    return held.proportional == 0 && format() == Coefs::kFromFile;
  }

 private:
  Coefs& coefs() { return rootMember<member>(GetKvs()); }
  std::int32_t format() { return direction_ == Direction::x ? coefs().formatX : coefs().formatY; }

  int RowHeaderWidth() override { return 35; }
  void LayOut() override {
    Rows([this] { return std::min(coefs().filesX.GetCount(), coefs().filesY.GetCount()); });
    const auto area = [this](GridRow row) {
      return (direction_ == Direction::x ? coefs().filesX : coefs().filesY).GetItem(row.item);
    };
    using AreaFile = std::remove_pointer_t<decltype(area(GridRow{}))>;
    File({.file = fileOf(area, &AreaFile::file, texts::dispersionFile, &AreaFile::RequestDataFile),
          .header = "FileName",
          .width = 180,
          .browse = "..."});
  }

  Direction direction_;
};

template <std::int32_t dialogTemplate, PageId id, auto member>
class DispersionCoefDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 private:
  using CoefGrid = DispersionCoefGrid<member>;
  using Coefs = typename CoefGrid::Coefs;

  void DoDataExchange(Form& form) override {
    constexpr int kQuantity = item::kDispersionCoefficient;
    const auto coefs = this->objectOf(member);
    const auto isProportional = [coefs] { return coefs().proportional != 0; };
    const auto isIndependent = [coefs] { return coefs().proportional == 0; };
    form.Radio("Dispersion", Choices::numbered({"Independent of the current", "Proportional to the current"}),
               coefs, &Coefs::proportional);
    form.Group("Proportional to the Current",
               [&] {
                 form.Number("Proportionality factor in x- direction:", coefs, &Coefs::factorX, kQuantity);
                 form.Number("Proportionality factor in y- direction:", coefs, &Coefs::factorY, kQuantity);
                 form.Number("Min. value:", coefs, &Coefs::minimum, kQuantity);
                 form.Number("Max. value:", coefs, &Coefs::maximum, kQuantity);
               })
        .EnabledIf(isProportional);
    form.Group("Independent of the Current", [&] {
      const auto direction = [&](std::string_view label, std::string_view gridLabel, auto format,
                                 auto constant, CoefGrid& grid) {
        form.List(label, Choices::numbered({"Constant", "From file"}), coefs, format)
            .EnabledIf(isIndependent);
        form.Number("Constant:", coefs, constant, kQuantity).EnabledIf([=] {
          return isIndependent() && coefs().*format == Coefs::kConstant;
        });
        form.Grid(gridLabel, grid);
      };
      direction("X-dir. given as:", "X-direction", &Coefs::formatX, &Coefs::constantX, gridX_);
      direction("Y-dir. given as:", "Y-direction", &Coefs::formatY, &Coefs::constantY, gridY_);
    });
  }

  CoefGrid gridX_{CoefGrid::Direction::x};
  CoefGrid gridY_{CoefGrid::Direction::y};
};

}  // namespace gridbay
