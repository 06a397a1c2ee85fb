#pragma once

#include <string>

#include "basic/source_sink.h"
#include "families/data_files.h"
#include "families/entry_constants.h"
#include "families/transport_page_texts.h"
#include "pages/cell_grid.h"

namespace gridbay {

// What each source brings, with a column for each entry; an isolated sink brings nothing. `list` is the
// member of the root that holds it, a SourceValuesListKvs.
template <auto list, class Module>
class SourceValuesGrid : public ColumnGrid {
  int LayoutKey() override { return Module::count(GetKvs()); }
  std::string CornerHeader() override { return "Source Sink"; }
  int RowHeaderWidth() override { return 110; }
  std::string RowHeader(GridRow row) override {
    const CSourceSinkObjectKvs* source = parts<BasicParts>().sourceSink->GetItem(row.item);
    return formatted(texts::placeHeader, row.item, source == nullptr ? "" : source->Text());
  }
  void LayOut() override {
    const auto values = RowsOf(list);
    using Values = std::remove_pointer_t<decltype(values(GridRow{}))>;
    const auto isSource = [source = itemOf(&BasicParts::sourceSink)](GridRow row) {
      const CSourceSinkObjectKvs* held = source(row);
      return held == nullptr || held->type != CSourceSinkObjectKvs::kIsolatedSink;
    };
    const auto hasFormat = [isSource, values](std::int32_t format) {
      return [=](GridRow row) { return isSource(row) && values(row)->format == format; };
    };
    List("Given as", 100, values, &Values::format, Choices::lines("Constant value\r\nType 0 data file\r\n"))
        .EnabledIf(isSource);
    for (int entry = 1; entry <= LayoutKey(); ++entry) {
      const auto constant = [values, entry](GridRow row) { return values(row)->Constant(entry); };
      [[maybe_unused]] Column& column =
          Number(Module::name(GetKvs(), entry), 80, constant, [this, entry](GridRow row) {
            return Module::sourceQuantity(GetKvs(), entry, row.item);
          }).EnabledIf([constant, isConstant = hasFormat(Values::kConstant)](GridRow row) {
            return isConstant(row) && constant(row) != nullptr;
          });
      if constexpr (HasTips<Module>)
        column.Tip([this, entry](GridRow) { return Module::tip(GetKvs(), document().units(), entry); });
    }
    File({.file = fileOf(values, &Values::file, texts::timeSeriesFile, &Values::RequestDataFile),
          .header = "File name",
          .width = 200,
          .enabled = hasFormat(Values::kTimeSeries)});
  }
};

template <std::int32_t dialogTemplate, PageId id, class ValuesGrid>
class SourceValuesDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 private:
  void DoDataExchange(Form& form) override { form.Grid("Source concentrations", values_); }

  ValuesGrid values_;
};

}  // namespace gridbay
