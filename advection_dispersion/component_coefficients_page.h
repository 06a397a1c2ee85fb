#pragma once

#include <string>

#include "advection_dispersion/transported.h"
#include "families/root_member.h"
#include "pages/cell_grid.h"

namespace gridbay {

// A row for each component that the coefficient means anything to. `member` is that of the root that holds
// the coefficients, a ComponentCoefficientsKvs; `Words` has the kind of their files as `kFile`.
template <auto member, class Words>
class ComponentCoefficientsGrid : public ColumnGrid {
  int RowHeaderWidth() override { return 100; }
  std::string RowHeader(GridRow row) override {
    return AdComponents::name(GetKvs(), rootMember<member>(GetKvs()).MeantNumber(row.item));
  }
  void LayOut() override {
    Rows([this] { return rootMember<member>(GetKvs()).MeantCount(); });
    const auto value = [this](GridRow row) { return rootMember<member>(GetKvs()).MeantItem(row.item); };
    using Coefficient = std::remove_pointer_t<decltype(value(GridRow{}))>;
    const auto hasFormat = [value](std::int32_t format) {
      return [value, format](GridRow row) { return value(row) != nullptr && value(row)->format == format; };
    };
    List("Given as", 95, value, &Coefficient::format,
         Choices::lines("Constant value\r\nType 0 data file\r\n"));
    Number("Value", 75, value, &Coefficient::value, Coefficient::kQuantity)
        .EnabledIf(hasFormat(Coefficient::kConstant));
    File({.file = fileOf(value, &Coefficient::file, Words::kFile, &Coefficient::RequestDataFile),
          .header = "FileName",
          .width = 160,
          .browseWidth = 20,
          .enabled = hasFormat(Coefficient::kTimeSeries)});
  }
};

template <std::int32_t dialogTemplate, PageId id, class CoefficientsGrid>
class ComponentCoefficientsDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 private:
  void DoDataExchange(Form& form) override { form.Grid("Coefficients", grid_); }

  CoefficientsGrid grid_;
};

}  // namespace gridbay
