#pragma once

#include <string>

#include "basic/boundary.h"
#include "families/data_files.h"
#include "families/entry_constants.h"
#include "families/root_member.h"
#include "families/transport_page_texts.h"
#include "pages/cell_grid.h"

namespace gridbay {

// How the concentrations at each open boundary are given. `list` is the member of the root that holds them, a
// BoundaryValuesListKvs.
template <auto list, class Module>
class BoundaryValuesGrid : public ColumnGrid {
  std::string CornerHeader() override { return "Boundary"; }
  int RowHeaderWidth() override { return 120; }
  std::string RowHeader(GridRow row) override {
    const CBoundaryObjectKvs* boundary = parts<BasicParts>().boundary->GetItem(row.item);
    return formatted(texts::placeHeader, row.item, boundary == nullptr ? "" : boundary->Text());
  }
  void LayOut() override {
    const auto values = RowsOf(list);
    using Values = std::remove_pointer_t<decltype(values(GridRow{}))>;
    const auto isFile = [values](GridRow row) {
      return values(row)->format == Values::kTimeSeries || values(row)->format == Values::kProfile;
    };
    const auto kind = [values](GridRow row) {
      return values(row)->format == Values::kProfile ? texts::profileFile : texts::timeSeriesFile;
    };
    List("Given as", 90, values, &Values::format,
         Choices::lines("Constant value\r\nType 0 data file\r\nType 1 data file\r\n"));
    File({.file = fileOf(values, &Values::file, kind, &Values::RequestDataFile),
          .header = "File name",
          .width = 190,
          .view = "View",
          .enabled = isFile});
  }
};

// The constants: a row for each entry, a column for each boundary.
template <auto list, class Module>
class BoundaryConstantsGrid : public ColumnGrid {
 public:
  RowLook GetRowLook(int row) override {
    constexpr double kTwoLines = 1.8;
    RowLook look = ColumnGrid::GetRowLook(row);
    if (GetRowHeader(row).find('\n') != std::string::npos) look.height = kTwoLines;
    return look;
  }

 private:
  int LayoutKey() override { return rootMember<list>(GetKvs()).GetCount(); }
  int RowHeaderWidth() override { return 120; }
  std::string RowHeader(GridRow row) override { return Module::name(GetKvs(), row.item); }
  void LayOut() override {
    Rows([this] { return LayoutKey() == 0 ? 0 : Module::count(GetKvs()); });
    const auto values = itemOf(list);
    for (int boundary = 1; boundary <= LayoutKey(); ++boundary) {
      const auto constant = [values, boundary](GridRow row) {
        return values({boundary})->Constant(row.item);
      };
      const auto isConstant = [constant, values, boundary](GridRow row) {
        auto* held = values({boundary});
        return constant(row) != nullptr && held->format == std::remove_pointer_t<decltype(held)>::kConstant;
      };
      [[maybe_unused]] Column& column =
          Number(formatted(texts::boundaryHeader, boundary), 90, constant, [this](GridRow row) {
            return Module::quantity(GetKvs(), row.item);
          }).EnabledIf(isConstant);
      if constexpr (HasTips<Module>)
        column.Tip([this](GridRow row) { return Module::tip(GetKvs(), document().units(), row.item); });
    }
  }
};

template <std::int32_t dialogTemplate, PageId id, class UpperGrid, class LowerGrid>
class BoundaryValuesDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 private:
  void DoDataExchange(Form& form) override {
    form.Grid("Boundary concentrations", values_);
    form.Grid("Constant concentrations", constants_);
  }

  UpperGrid values_;
  LowerGrid constants_;
};

}  // namespace gridbay
