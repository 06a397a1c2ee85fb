#include "compare/page_contents.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>

#include "core/number_text.h"
#include "pages/grid_wnd.h"
#include "pages/scan.h"

namespace gridbay {
namespace {

// On one line, with single blanks.
std::string onOneLine(std::string_view text) {
  std::string line;
  for (const char c : trimmed(text)) {
    const bool isBlank = c == ' ' || c == '\n' || c == '\t' || c == '\r';
    if (!isBlank) line += c;
    if (isBlank && !line.ends_with(' ')) line += ' ';
  }
  return line;
}

std::string withoutColon(std::string text) {
  std::erase(text, '&');
  while (text.ends_with(':') || text.ends_with(' ')) text.pop_back();
  return text;
}

std::string switchText(bool isOn) {
  return isOn ? "on" : "off";
}

std::string choiceText(const std::vector<std::string>& choices, int index) {
  if (index < 0 || index >= static_cast<int>(choices.size())) return {};
  return withoutColon(onOneLine(choices[static_cast<std::size_t>(index)]));
}

std::string valueOf(const Control& control) {
  if (control.absent) return {};
  if (control.kind == ControlKind::check) return switchText(control.index == 1);
  if (control.isIndexed()) return choiceText(control.choices, control.index);
  return control.unit.empty() || control.text.empty() ? control.text : control.text + ' ' + control.unit;
}

// A field with no name of its own has that of its frame.
std::string nameOf(const Control& control) {
  std::string name = onOneLine(control.name());
  for (const Control* group = control.group; group != nullptr && name.empty(); group = group->group)
    name = onOneLine(group->name());
  return name;
}

std::string valueOf(const CellStyle& cell) {
  if (cell.kind == CellKind::checkBox) return switchText(cell.value == "1");
  if (cell.kind == CellKind::dropDown) return withoutColon(onOneLine(cell.value));
  if (cell.kind != CellKind::multiChoice) return onOneLine(cell.value);
  const double bits = doubleOfText(cell.value).value_or(0);
  std::string chosen;
  for (std::size_t i = 0; i < cell.choices.size() && i < 53; ++i) {
    if ((static_cast<std::uint64_t>(bits) >> i & 1U) == 0) continue;
    chosen += (chosen.empty() ? "" : ", ") + onOneLine(cell.choices[i]);
  }
  return chosen.empty() ? "None" : chosen;
}

// What an undo calls an edit of a cell is the name of the cell.
struct CellNames : CV27SetupGridWnd {
  static std::string of(CV27SetupGridWnd& grid, int row, int col) {
    return (grid.*(&CellNames::editName))(row, col);
  }
};

class TableReader {
 public:
  explicit TableReader(CV27SetupGridWnd& grid)
      : grid_(grid), columns_(grid.GetColCount()), shown_{.columns = columnNames(grid)} {}

  ShownTable read() {
    const int rows = grid_.GetRowCount();
    for (int row = 1; row <= rows; ++row) readRow(row);
    return std::move(shown_);
  }

 private:
  static std::vector<std::string> columnNames(CV27SetupGridWnd& grid) {
    std::vector<std::string> names;
    for (int col = 1; col <= grid.GetColCount(); ++col) {
      std::string name = grid.ShowsHeaders() ? onOneLine(grid.GetColHeader(col)) : std::string();
      // One that is covered belongs to the header that covers it.
      if (name.empty() && !names.empty() && grid.GetHeaderSpan(col) == 0) name = names.back();
      names.push_back(withoutColon(std::move(name)));
    }
    return names;
  }

  void readRow(int row) {
    ShownTable::Row read{.number = row};
    std::vector<CellStyle> styles(static_cast<std::size_t>(columns_));
    for (int col = 1; col <= columns_; ++col)
      grid_.GetStyleRowCol(row, col, styles[static_cast<std::size_t>(col) - 1]);
    if (!styles.empty() && styles.front().isHeading) {
      heading_ = withoutColon(onOneLine(styles.front().value));
      read.isEntry = false;
    } else if (!styles.empty() && styles.front().isHeader) {
      for (std::size_t i = 0; i < styles.size(); ++i) {
        const std::string below = onOneLine(styles[i].value);
        if (!below.empty()) shown_.columns[i] += (shown_.columns[i].empty() ? "" : " ") + below;
      }
      read.isEntry = false;
    } else {
      ++entries_;
    }
    const std::string header = withoutColon(onOneLine(grid_.GetRowHeader(row)));
    const bool isNumber = header.find_first_not_of("0123456789") == header.npos;
    const std::string number =
        isNumber ? (header.empty() ? std::to_string(entries_) : header) : std::string();
    read.name = isNumber ? "Row " + number : header;
    if (!heading_.empty()) read.name = heading_ + ": " + read.name;
    for (int col = 1; col <= columns_ && read.isEntry; ++col)
      readCell(col, styles[static_cast<std::size_t>(col) - 1], read);
    shown_.rows.push_back(std::move(read));
  }

  void readCell(int col, const CellStyle& style, ShownTable::Row& row) {
    const bool isValue = !style.readOnly && !style.isHeader && !style.isHeading &&
                         style.kind != CellKind::button && style.kind != CellKind::label;
    const std::string& column = shown_.columns[static_cast<std::size_t>(col) - 1];
    std::string where = row.name;
    if (where.starts_with("Row ")) where[0] = 'r';
    std::string name = column.empty() ? row.name : column + ", " + where;
    if (!heading_.empty() && isValue) name = CellNames::of(grid_, row.number, col);
    row.cells.push_back({std::move(name), valueOf(style), isValue});
  }

  CV27SetupGridWnd& grid_;
  int columns_;
  ShownTable shown_;
  std::string heading_;
  int entries_ = 0;
};

}  // namespace

std::size_t PageContents::size() const {
  std::size_t size = fields.size() + 1;
  for (const ShownTable& table : tables) size += table.rows.size() * table.columns.size();
  for (const PageContents& detail : details) size += detail.size();
  return size;
}

PageContents contentsOf(Form& form) {
  PageContents contents;
  std::map<std::string, int> numbers;
  const auto tables =
      std::ranges::count_if(form.controls(), [](const Control& it) { return it.grid != nullptr; });
  for (const Control& control : form.controls()) {
    const int number = ++numbers[control.label];
    if (control.grid != nullptr) {
      contents.tables.push_back(TableReader(*control.grid).read());
      if (tables > 1) contents.tables.back().name = nameOf(control);
    } else if (control.isEdit() || control.isIndexed()) {
      contents.fields.push_back(
          {control.label, number, nameOf(control), valueOf(control), control.visible, !control.readOnly});
    }
  }
  return contents;
}

}  // namespace gridbay
