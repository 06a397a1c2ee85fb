#pragma once

#include <string>

#include "families/entry_constants.h"
#include "families/root_member.h"
#include "families/transport_page_texts.h"
#include "pages/cell_grid.h"

namespace gridbay {

// A constant for each entry, while the concentrations are given so. `member` is that of the root that holds
// them, a SurfaceValuesKvs.
template <auto member, class Module>
class SurfaceValuesGrid : public ColumnGrid {
  int RowHeaderWidth() override { return 140; }
  std::string RowHeader(GridRow row) override { return Module::name(GetKvs(), row.item); }
  void LayOut() override {
    Rows([this] { return Module::count(GetKvs()); });
    const auto constant = [this](GridRow row) {
      auto& values = rootMember<member>(GetKvs());
      return values.format == values.kConstant ? values.Constant(row.item) : nullptr;
    };
    [[maybe_unused]] Column& column =
        Number("Value", 120, constant, [this](GridRow row) { return Module::quantity(GetKvs(), row.item); });
    if constexpr (HasTips<Module>)
      column.Tip([this](GridRow row) { return Module::tip(GetKvs(), document().units(), row.item); });
  }
};

template <std::int32_t dialogTemplate, PageId id, auto member, class ValuesGrid>
class SurfaceValuesDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 private:
  void DoDataExchange(Form& form) override {
    const auto values = this->objectOf(member);
    using Values = std::remove_reference_t<decltype(values())>;
    form.List("Given as",
              Choices{{Values::kFromAmbientWater, "From Ambient Water"},
                      {Values::kConstant, "Constant Value"},
                      {Values::kTimeSeries, "Type 0 data file"},
                      {Values::kMap, "Type 2 data file"}}
                  .Otherwise(1),
              values, &Values::format);
    const auto kind = [values](GridRow) {
      return values().format == Values::kMap ? texts::surfaceMapFile : texts::surfaceSeriesFile;
    };
    const auto request = [values](CVdFileSelectorDlg& selector, GridRow) {
      values().RequestDataFile(selector);
    };
    this->AddFile(form, "Data File",
                  fileOf([values](GridRow) { return &values(); }, &Values::file, kind, request))
        .EnabledIf([values] { return values().IsFile(); });
    form.Grid("Constant concentrations", grid_);
  }

  ValuesGrid grid_;
};

}  // namespace gridbay
