#include "compare/page_difference.h"

#include <fmt/format.h>

#include <algorithm>
#include <tuple>

namespace gridbay {
namespace {

constexpr std::size_t kMostRows = 50;    // of one setup alone, that are told one by one
constexpr std::size_t kMostColumns = 4;  // that tell what a row is

const ShownCell* cellAt(const ShownTable& table, int row, int column) {
  if (row < 1 || row > static_cast<int>(table.rows.size())) return nullptr;
  const ShownTable::Row& found = table.rows[static_cast<std::size_t>(row) - 1];
  if (column < 1 || column > static_cast<int>(found.cells.size())) return nullptr;
  return &found.cells[static_cast<std::size_t>(column) - 1];
}

std::string shownText(const ShownTable::Row& row) {
  std::string text;
  std::size_t columns = 0;
  for (const ShownCell& cell : row.cells) {
    if (!cell.isValue || cell.value.empty()) continue;
    if (++columns > kMostColumns) return text + ", ...";
    text += (text.empty() ? "" : ", ") + cell.value;
  }
  return text;
}

// The differences of one page.
class PageComparer {
 public:
  PageComparer(Difference page, std::vector<Difference>& differences)
      : page_(std::move(page)), differences_(differences) {}

  void compare(const PageContents& own, const PageContents& other) {
    const std::size_t fields = std::min(own.fields.size(), other.fields.size());
    for (std::size_t i = 0; i < fields; ++i) compareFields(own.fields[i], other.fields[i]);
    const std::size_t tables = std::min(own.tables.size(), other.tables.size());
    for (std::size_t i = 0; i < tables; ++i)
      compareTables(own.tables[i], other.tables[i], static_cast<int>(i) + 1);
    const std::size_t details = std::min(own.details.size(), other.details.size());
    for (std::size_t i = 0; i < details; ++i) {
      page_.currentRow = static_cast<int>(i) + 1;
      compare(own.details[i], other.details[i]);
    }
    page_.currentRow = 0;
  }

 private:
  Difference& add(std::string thing, std::optional<std::string> own, std::optional<std::string> other) {
    Difference difference = page_;
    if (page_.currentRow > 0) thing += " of row " + std::to_string(page_.currentRow);
    difference.thing = std::move(thing);
    difference.own = std::move(own);
    difference.other = std::move(other);
    differences_.push_back(std::move(difference));
    return differences_.back();
  }

  // What neither shows, or nobody can set, is left out.
  void compareFields(const ShownField& own, const ShownField& other) {
    const bool isLeftOut = (!own.isShown && !other.isShown) || (!own.isValue && !other.isValue);
    if (isLeftOut || own.value == other.value) return;
    Difference& difference = add(own.name.empty() ? "Value" : own.name, own.value, other.value);
    difference.label = own.label;
    difference.labelNumber = own.number;
  }

  void compareTables(const ShownTable& own, const ShownTable& other, int table) {
    const std::string of = own.name.empty() ? "" : own.name + ": ";
    const std::size_t rows = std::min(own.rows.size(), other.rows.size());
    for (std::size_t row = 0; row < rows; ++row) {
      const auto& [ownCells, otherCells] = std::tie(own.rows[row].cells, other.rows[row].cells);
      for (std::size_t i = 0; i < std::min(ownCells.size(), otherCells.size()); ++i) {
        const bool isLeftOut = !ownCells[i].isValue && !otherCells[i].isValue;
        if (isLeftOut || ownCells[i].value == otherCells[i].value) continue;
        at(add(of + ownCells[i].name, ownCells[i].value, otherCells[i].value), table, own.rows[row].number,
           static_cast<int>(i) + 1);
      }
    }
    addRows(own, rows, of, table, &Difference::own);
    addRows(other, rows, of, table, &Difference::other);
  }

  // Rows that only one has, from a place on; very many are told as one.
  void addRows(const ShownTable& shown, std::size_t first, const std::string& of, int table,
               std::optional<std::string> Difference::*side) {
    if (shown.rows.size() > first + kMostRows) {
      std::string name = shown.rows[first].name;
      if (name.starts_with("Row ")) name.insert(3, "s");
      const std::string& last = shown.rows.back().name;
      name += " to " + last.substr(last.rfind(' ') + 1);
      Difference& difference = add(of + name, std::nullopt, std::nullopt);
      difference.*side = fmt::format("{} rows", shown.rows.size() - first);
      return at(difference, table, shown.rows[first].number, 0);
    }
    for (std::size_t row = first; row < shown.rows.size(); ++row) {
      if (!shown.rows[row].isEntry) continue;
      Difference& difference = add(of + shown.rows[row].name, std::nullopt, std::nullopt);
      difference.*side = shownText(shown.rows[row]);
      at(difference, table, shown.rows[row].number, 0);
    }
  }

  static void at(Difference& difference, int table, int row, int column) {
    difference.table = table;
    difference.row = row;
    difference.column = column;
  }

  Difference page_;
  std::vector<Difference>& differences_;
};

}  // namespace

std::vector<Difference> pageDifferences(ComparedModel& own, ComparedModel& other) {
  std::vector<Difference> differences;
  for (const ComparedPage& page : own.pages()) {
    const bool isOwn = own.isVisible(page.id) && own.page(page.id) != nullptr;
    const bool isOther = other.isVisible(page.id) && other.page(page.id) != nullptr;
    if (!isOwn && !isOther) continue;
    Difference difference{.page = page.id, .pageName = page.caption};
    if (isOwn && isOther) {
      PageComparer(std::move(difference), differences)
          .compare(own.contents(page.id), other.contents(page.id));
      continue;
    }
    (isOwn ? difference.own : difference.other) = "";
    differences.push_back(std::move(difference));
  }
  return differences;
}

std::optional<std::string> valueAt(const Difference& difference, const PageContents& whole) {
  const auto detail = static_cast<std::size_t>(std::max(difference.currentRow, 1)) - 1;
  if (difference.currentRow > 0 && detail >= whole.details.size()) return std::nullopt;
  const PageContents& contents = difference.currentRow > 0 ? whole.details[detail] : whole;
  if (difference.table == 0) {
    const auto field = std::ranges::find_if(contents.fields, [&](const ShownField& each) {
      return each.label == difference.label && each.number == difference.labelNumber;
    });
    return field == contents.fields.end() ? std::nullopt : std::optional(field->value);
  }
  if (difference.table > static_cast<int>(contents.tables.size())) return std::nullopt;
  const ShownTable& table = contents.tables[static_cast<std::size_t>(difference.table) - 1];
  if (difference.column == 0)
    return difference.row <= static_cast<int>(table.rows.size()) ? std::optional<std::string>("")
                                                                 : std::nullopt;
  const ShownCell* cell = cellAt(table, difference.row, difference.column);
  return cell == nullptr ? std::nullopt : std::optional(cell->value);
}

bool isThing(const Difference& difference) {
  return difference.thing.empty() || (difference.table > 0 && difference.column == 0);
}

}  // namespace gridbay
