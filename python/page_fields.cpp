#include "python/page_fields.h"

#include <fmt/format.h>

#include <algorithm>

#include "core/number_text.h"
#include "pages/grid_wnd.h"

namespace gridbay::python {
namespace {

constexpr int kMostRows = 20;
constexpr std::size_t kMostChoices = 16;

bool isNumber(std::string_view text) {
  return int32OfText(text).has_value();
}

// The tool tip of a number is "Water level [m]".
const QunItem* quantityOf(std::string_view toolTip) {
  const std::size_t bracket = toolTip.rfind(" [");
  if (bracket == toolTip.npos || !toolTip.ends_with(']')) return nullptr;
  const auto items = qunItems();
  const auto found = std::ranges::find(items, toolTip.substr(0, bracket), &QunItem::name);
  return found == items.end() ? nullptr : &*found;
}

// The text of the label in front of a cell, as "Formulation:"; empty where there is none.
std::string textBefore(CV27SetupGridWnd& grid, int row, int col) {
  CellStyle style;
  if (col < 2 || grid.GetStyleRowCol(row, col - 1, style) != 1 || style.kind != CellKind::label) return {};
  return style.value.substr(0, style.value.find_last_not_of(": ") + 1);
}

std::string headerOf(CV27SetupGridWnd& grid, int col) {
  while (col > 1 && grid.GetHeaderSpan(col) == 0) --col;
  return grid.GetColHeader(col);
}

// What names a cell: the header of its column with the one below it, or that of its row where the columns are
// items; in a grid with neither the label before it.
std::string labelOf(CV27SetupGridWnd& grid, const std::string& gridLabel, int row, int col) {
  std::string label = grid.ShowsHeaders() ? headerOf(grid, col) : std::string();
  const std::string rowHeader = grid.GetRowHeader(row);
  if (isNumber(label) && !rowHeader.empty()) label = rowHeader;
  // "Boundary 1" in a row for each component.
  const bool isColumnOfItem = isNumber(label.substr(label.rfind(' ') + 1)) && label.find(' ') != label.npos;
  if (isColumnOfItem && label != rowHeader && !rowHeader.empty() && !isNumber(rowHeader)) label = gridLabel;
  if (label.empty()) label = textBefore(grid, row, col);
  CellStyle below;
  if (grid.GetStyleRowCol(1, col, below) == 1 && below.isHeader && !below.value.empty())
    label += (label.empty() ? "" : ", ") + below.value;
  if (label.empty()) label = rowHeader;
  const bool isNameOfEntry = label.find('\n') != label.npos || isNumber(label);
  return label.empty() || isNameOfEntry ? gridLabel : label;
}

void addCells(CV27SetupGridWnd& grid, const Field& control, std::vector<Field>& fields) {
  const int rows = std::min(grid.GetRowCount(), kMostRows);
  const int cols = grid.GetColCount();
  std::string band;
  for (int row = 1; row <= rows; ++row) {
    if (CellStyle first; grid.GetStyleRowCol(row, 1, first) == 1 && first.isHeading) band = first.value;
    const std::string header = grid.GetRowHeader(row);
    const std::string rowName = band + "/" + (header.empty() ? std::to_string(row) : header);
    for (int col = 1; col <= cols; ++col) {
      CellStyle style;
      if (grid.GetStyleRowCol(row, col, style) != 1) continue;
      const bool isButton = style.kind == CellKind::button;
      if (isButton ? !style.enabled || style.value.empty() : !style.editable()) continue;
      fields.push_back({.control = control.control,
                        .row = row,
                        .col = col,
                        .rowName = rowName,
                        .kind = isButton                           ? Field::Kind::button
                                : style.kind == CellKind::checkBox ? Field::Kind::check
                                : style.kind == CellKind::dropDown ? Field::Kind::choice
                                                                   : Field::Kind::typed,
                        .label = labelOf(grid, control.label, row, col),
                        .value = style.value,
                        .choices = style.choices,
                        .quantity = quantityOf(style.toolTip)});
    }
  }
}

Field fieldOf(const Control& control, std::size_t place) {
  Field field{.control = place, .label = control.name(), .value = control.text, .choices = control.choices};
  if (control.kind == ControlKind::button) {
    field.kind = Field::Kind::button;
  } else if (control.isIndexed()) {
    const bool isCheck = control.kind == ControlKind::check;
    const auto now = static_cast<std::size_t>(control.index);
    field.kind = isCheck ? Field::Kind::check : Field::Kind::choice;
    field.value = isCheck                        ? numberText(std::int64_t{control.index})
                  : now < control.choices.size() ? control.choices[now]
                                                 : "";
  } else {
    field.quantity = qunFindItem(control.itemCode);
    field.isCount = control.onSpin != nullptr;
  }
  return field;
}

bool isPartOfNumber(char c) {
  return (c >= '0' && c <= '9') || c == '.';
}

}  // namespace

std::string Field::key() const {
  return fmt::format("{}/{}/{}/{}", control, rowName, col, row == 0 ? std::string() : label);
}

std::vector<Field> fieldsOf(Form& form) {
  std::vector<Field> fields;
  for (std::size_t place = 0; place < form.controls().size(); ++place) {
    const Control& control = form.controls()[place];
    const bool isOfFile =
        place > 0 && form.controls()[place - 1].isFile && !form.controls()[place - 1].absent;
    if (control.grid != nullptr) {
      addCells(*control.grid, {.control = place, .label = control.name()}, fields);
    } else if (control.kind == ControlKind::button
                   ? control.usable() || isOfFile
                   : (control.isEdit() || control.isIndexed()) && !control.absent && !control.readOnly) {
      fields.push_back(fieldOf(control, place));
    }
  }
  for (Field& field : fields) field.choices.resize(std::min(field.choices.size(), kMostChoices));
  return fields;
}

void useField(Form& form, const Field& field, const std::string& text) {
  Control& control = form.controls()[field.control];
  if (control.grid != nullptr && field.kind == Field::Kind::button) {
    control.grid->OnClickedButtonRowCol(field.row, field.col);
  } else if (control.grid != nullptr) {
    control.grid->StoreStyleRowCol(field.row, field.col, text);
  } else {
    if (field.kind == Field::Kind::choice) {
      control.index = static_cast<int>(std::ranges::find(control.choices, text) - control.choices.begin());
    } else if (field.kind == Field::Kind::check) {
      control.index = text == "1" ? 1 : 0;
    } else {
      control.text = text;
    }
    form.act(control);
  }
}

OtherTexts otherTexts(const std::string& text) {
  if (const auto number = int32OfText(text))
    return {.texts = {numberText(std::int64_t{*number} + 1), numberText(std::int64_t{*number} - 1)}};
  if (const auto number = doubleOfText(text))
    return {.texts = {numberText(*number + 1), numberText(*number - 1), numberText(*number / 2)}};
  OtherTexts other;
  for (std::size_t at = 0; at < text.size();) {
    const auto first =
        std::find_if(text.begin() + static_cast<std::ptrdiff_t>(at), text.end(), isPartOfNumber);
    const auto last = std::find_if_not(first, text.end(), isPartOfNumber);
    if (const auto number = doubleOfText(std::string(first, last)))
      other.texts.push_back(std::string(text.begin(), first) + fmt::format("{:02}", *number + 1) +
                            std::string(last, text.end()));
    at = static_cast<std::size_t>(last - text.begin());
  }
  other.forEachNumber = other.texts.size() > 1 && text.find_first_not_of("0123456789.,:()- ") == text.npos;
  if (!other.forEachNumber) other.texts = {text + "1"};
  return other;
}

bool DialogHost::editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) {
  const Use use = std::exchange(use_, {});
  return use && use(title, form) && fault().empty();
}

bool DialogHost::choose(CVdFileSelectorDlg& selector) {
  if (!choosesFiles_) return false;
  std::vector<std::uint32_t> items = selector.GetSelectedItems();
  items.resize(std::max({items.size(), selector.requests().size(), std::size_t{1}}));
  for (std::uint32_t& item : items) ++item;
  selector.SetSelectedItems(std::move(items));
  selector.SetFileName(kFile);
  return true;
}

}  // namespace gridbay::python
