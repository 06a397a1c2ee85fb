#pragma once

#include <fmt/format.h>

#include <algorithm>
#include <cstdlib>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "pages/form.h"
#include "pages/grid_wnd.h"

namespace gridbay::test {

// A grid whose cells a test holds itself. It counts what it is asked.
class FreeGrid : public CV27SetupGridWnd {
 public:
  struct Column {
    std::string header;
    int width = 60;
    CellStyle style = {};  // of its cells
    int span = 1;          // of its header
  };

  FreeGrid(std::vector<Column> columns, int rows) : columns_(std::move(columns)) { setRows(rows); }

  void setRows(int rows) {
    while (static_cast<int>(cells.size()) < rows) {
      std::vector<CellStyle> row;
      for (const Column& column : columns_) row.push_back(column.style);
      cells.push_back(row);
      looks.emplace_back();
    }
    cells.resize(static_cast<std::size_t>(rows));
    looks.resize(static_cast<std::size_t>(rows));
  }
  CellStyle& at(int row, int col) {
    return cells[static_cast<std::size_t>(row) - 1][static_cast<std::size_t>(col) - 1];
  }
  // A title above rows, across all columns.
  void title(int row, std::string_view text) {
    for (int col = 1; col <= GetColCount(); ++col) at(row, col) = {.isHeading = true};
    at(row, 1).value = text;
  }

  int GetRowCount() override { return static_cast<int>(cells.size()); }
  int GetColCount() override { return static_cast<int>(columns_.size()); }
  std::string GetColHeader(int col) override {
    return col == 0 ? "" : columns_[static_cast<std::size_t>(col) - 1].header;
  }
  std::string GetRowHeader(int row) override {
    return rowHeader ? rowHeader(row) : CV27SetupGridWnd::GetRowHeader(row);
  }
  int GetColWidth(int col) override {
    return col == 0 ? rowHeaderWidth : columns_[static_cast<std::size_t>(col) - 1].width;
  }
  bool ShowsHeaders() const override { return showsHeaders; }
  int GetHeaderSpan(int col) override { return columns_[static_cast<std::size_t>(col) - 1].span; }
  RowLook GetRowLook(int row) override { return looks[static_cast<std::size_t>(row) - 1]; }
  bool IsEnabled() override { return enabled; }
  void OnCurrentRow(int row) override { currentRows.push_back(row); }

  int StoreStyleRowCol(int row, int col, std::string_view text) override {
    ++stores;
    if (!at(row, col).takesValue() || (accepts && !accepts(row, col, text))) return 0;
    at(row, col).value = text;
    return 1;
  }
  void OnClickedButtonRowCol(int row, int col) override {
    if (at(row, col).enabled) pressed.emplace_back(row, col);
  }

  std::vector<std::vector<CellStyle>> cells;
  std::vector<RowLook> looks;
  std::function<bool(int row, int col, std::string_view text)> accepts;
  std::function<std::string(int row)> rowHeader;
  bool enabled = true;
  bool showsHeaders = true;
  int rowHeaderWidth = 30;
  int asked = 0;
  int lastAsked = 0;  // the highest row
  int stores = 0;
  std::vector<int> currentRows;
  std::vector<std::pair<int, int>> pressed;

 protected:
  bool styleOf(int row, int col, CellStyle& style) override {
    ++asked;
    lastAsked = std::max(lastAsked, row);
    style = at(row, col);
    return true;
  }
  Stored storeCell(int, int, std::string_view) override { return Stored::refused; }

 private:
  std::vector<Column> columns_;
};

inline bool isNumber(std::string_view text) {
  const std::string copy(text);
  char* end = nullptr;
  std::strtod(copy.c_str(), &end);
  return !copy.empty() && *end == '\0';
}

// Marks a number's control as wrong while its text is none, as the frame of the pages does.
inline Control& checked(Control& control) {
  return control.Changed([&control] {
    control.fault = isNumber(control.text)
                        ? std::string()
                        : fmt::format("{}: \"{}\" is not a number", control.name(), control.text);
  });
}

// Cells of all kinds: a row to edit, one that is read only, and one that is disabled.
class GridOfAllKinds final : public FreeGrid {
 public:
  enum Column { kName = 1, kLevel, kType, kProjection, kOn, kFile, kBrowse, kItems, kView };

  GridOfAllKinds()
      : FreeGrid(
            {{"Name", 120, {.value = "Weir at the gate"}},
             {"Level", 60, {.value = "-12.5", .align = CellAlign::right, .toolTip = "m"}},
             {"Type",
              90,
              {.value = "Constant", .kind = CellKind::dropDown, .choices = {"Constant", "From file"}}},
             {"Projection", 90, {.value = "UTM-32", .kind = CellKind::mapProjection}},
             {"On", 40, {.value = "1", .kind = CellKind::checkBox}},
             {"Data file", 160, {.value = "results/of/a/long/run/north.tsb2", .kind = CellKind::resultFile}},
             {"", 20, {.value = "...", .kind = CellKind::button}},
             {"Output items",
              140,
              {.value = "31",
               .kind = CellKind::multiChoice,
               .choices = {"Water level", "Flux in J", "Flux in K", "Speed", "Direction"}}},
             {"", 45, {.value = "View...", .kind = CellKind::button}}},
            3) {
    for (int col = 1; col <= GetColCount(); ++col) {
      at(2, col).readOnly = true;
      at(3, col).enabled = false;
    }
    at(2, kItems).value = "5";
    at(3, kItems).value = "0";
  }
};

// Titles with rows of areas below, a second row of headers, and headers over several columns.
class BandedGrid final : public FreeGrid {
 public:
  BandedGrid(int components, int areas)
      : FreeGrid({{"", 120, {.readOnly = true}},
                  {"Head  loss factors", 65, {.value = "0.5", .align = CellAlign::right}, 3},
                  {"", 65, {.value = "1.25", .align = CellAlign::right}, 0},
                  {"", 65, {.value = "10", .align = CellAlign::right}, 0},
                  {"File name", 160, {.value = "initial/salt.tsb2"}},
                  {"View...", 45, {.value = "View...", .kind = CellKind::button}}},
                 1 + components * (1 + areas)) {
    const std::vector<std::string> second{"", "In flow", "Out flow", "Free flow", "Maps of the area", ""};
    for (int col = 1; col <= GetColCount(); ++col)
      at(1, col) = {.value = second[static_cast<std::size_t>(col) - 1], .isHeader = true};
    at(1, 5).span = 2;
    looks[0] = {.height = 1.5, .lineBelow = true};
    int row = 2;
    for (int component = 1; component <= components; ++component) {
      title(row++, fmt::format("Component {}", component));
      for (int area = 1; area <= areas; ++area, ++row) {
        at(row, 1).value = fmt::format("Area {}", area);
        if (area == areas) looks[static_cast<std::size_t>(row) - 1].lineBelow = true;
      }
    }
    rowHeaderWidth = 0;
  }
};

// The control that is tied to a variable.
inline Control& of(Form& form, const void* variable) {
  for (Control& control : form.controls()) {
    const auto isTied = [variable](const auto& tied) {
      if constexpr (std::is_pointer_v<std::remove_cvref_t<decltype(tied)>>) {
        return static_cast<const void*>(tied) == variable;
      } else {
        return false;
      }
    };
    if (std::visit(isTied, control.variable)) return control;
  }
  std::abort();
}

// A page with every kind of control, in frames, rows and side by side.
class ShowcaseForm {
 public:
  ShowcaseForm() {
    form.Group("Simulation", [this] {
      checked(form.DDX_Text("Last step:", last_)).Spin(0, 18, [this](int delta) {
        last_ = std::clamp(last_ + delta, 0, 18);
        of(form, &last_).text = std::to_string(last_);
      });
      checked(form.DDX_VDedit("Time step interval:", step_, 100212));
      form.DDX_Text("Start date:", start_).kind = ControlKind::dateTime;
      form.DDX_Text("End:", end_).ReadOnly();
    });
    form.Group("Flooding and drying",
               [this] {
                 form.DDX_Check("Enable flooding and drying", enable_);
                 checked(form.DDX_VDedit("Drying depth:", drying_, 100280));
                 checked(form.DDX_VDedit("Flooding depth:", flooding_, 100280));
                 form.Group("Limits", [this] {
                   checked(form.DDX_VDedit("Lowest:", lowest_, 100000));
                   checked(form.DDX_VDedit("Highest:", highest_, 100000)).Beside();
                 });
               })
        .Beside();
    form.DDX_Radio("Type", {"Cold start", "Hot start"}, type_);
    form.DDX_Radio("Formulation",
                   {"No viscosity", "Constant, by the velocity", "Constant, by the flux",
                    "Smagorinsky, by the velocity"},
                   formulation_)
        .choiceEnabled = {true, true, false, true};
    form.Group("Evaporation", [this] { rain(0); });
    form.Group("Precipitation", [this] { rain(1); }).Beside();
    form.Group("Initial fields", [this] {
      form.DDX_Text("Bathymetry file:", file_).isFile = true;
      form.Button("...", [] {}).Beside();
      form.Button("View...", [] {}).Beside();
      form.DDX_Text("Title:", title_);
      form.DDX_Text("Size of the results:", size_).kind = ControlKind::label;
    });
    form.DDX_Control("Cells", cells);
    form.DDX_Control("Greyed", greyed);
    greyed.enabled = false;
    form.show({});
    Control& wrong = of(form, &highest_);
    wrong.text = "deep";
    wrong.onChange();
  }

  Form form;
  GridOfAllKinds cells;
  FreeGrid greyed{
      {{"Name", 120, {.value = "North"}}, {"Value", 60, {.value = "3", .align = CellAlign::right}}}, 2};

 private:
  void rain(std::size_t i) {
    form.DDX_CBIndex("Given as", {"Constant", "Type 0", "Type 2"}, kind_[i]);
    checked(form.DDX_VDedit("Value", value_[i], 100088));
    Control& file = form.DDX_Text("File name", rainFile_[i]);
    file.isFile = true;
    file.enabled = i == 1;
    form.Button("...", [] {}).Beside().enabled = i == 1;
    form.Button("View...", [] {}).Beside().enabled = false;
  }

  std::int32_t last_ = 12;
  double step_ = 3;
  std::string start_ = "2026-03-21 06:00:00";
  std::string end_ = "2026-03-21 18:00:00";
  std::int32_t enable_ = 1;
  double drying_ = 0.02;
  double flooding_ = 0.05;
  double lowest_ = -10;
  double highest_ = 25;
  std::int32_t type_ = 0;
  std::int32_t formulation_ = 1;
  std::int32_t kind_[2] = {0, 2};
  double value_[2] = {0, 0};
  std::string rainFile_[2] = {"", "forcing/rain.tsb2"};
  std::string file_ = "grids/of/the/estuary/estuary-at-90-metres.tsb2";
  std::string title_ = "Spring tide";
  std::string size_ = "12.5 MB";
};

}  // namespace gridbay::test
