#include "compare/keyword_pages.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <set>
#include <unordered_map>

#include "setup/member_keyword.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

constexpr std::size_t kMostKeywords = 500;
constexpr std::size_t kMostRead = 1'000'000;  // fields and cells
constexpr std::size_t kMostRows = 50;         // of one setup alone, that are told one by one
constexpr std::size_t kMostColumns = 4;       // that tell what a row is

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

// What a page that shows `contents` has where a difference is; nothing where it has no such thing.
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

// Whether it is a row or a page, and not a value.
bool isThing(const Difference& difference) {
  return difference.thing.empty() || (difference.table > 0 && difference.column == 0);
}

class KeywordJoiner {
 public:
  KeywordJoiner(const std::vector<KeywordDifference>& keywords, const KvsFile& own, const KvsFile& other,
                const std::string& path, const UnitChoices& units, std::vector<Difference>& differences)
      : keywords_(keywords), own_(own), other_(other), path_(path), units_(units), probe_(own, path, units) {
    for (Difference& difference : differences) byPage_[difference.page].push_back(&difference);
  }

  std::vector<std::string> join() {
    probeAll(own_, other_, [this](const std::string& path) { joinMade(path); });
    // What one keyword alone does not make follows from several, as a value with the choice that shows it:
    // those that unmake it where it stands.
    for (auto page = byPage_.begin(); page != byPage_.end();) {
      std::erase_if(page->second,
                    [](const Difference* each) { return !each->keywords.empty() || isThing(*each); });
      page = page->second.empty() ? byPage_.erase(page) : std::next(page);
    }
    if (!byPage_.empty()) probeAll(other_, own_, [this](const std::string& path) { joinUnmade(path); });
    std::vector<std::string> left;
    for (const KeywordDifference& keyword : keywords_) {
      if (!joined_.contains(keyword.path)) left.push_back(keyword.path);
    }
    return left;
  }

 private:
  // Brings the probe from one file's model to the same with one keyword of the other, for each keyword.
  template <class Look>
  void probeAll(const KvsFile& from, const KvsFile& to, Look look) {
    ComparedModel start(from, path_, units_);
    std::size_t tried = 0;
    read_ = 0;
    for (const KeywordDifference& keyword : keywords_) {
      const bool isChange = !keyword.isSection && keyword.own && keyword.other;
      if (!isChange || isOption(keyword.path) || read_ > kMostRead || ++tried > kMostKeywords) continue;
      probe_.assign(start.root());
      const Node* wanted = nodeAt(to, keyword.path);
      Result<MemberKeyword> held = findKeyword(probe_.root(), keyword.path, path_);
      if (wanted == nullptr || !held) continue;
      const std::span<const Value> values = wanted->values();
      if (!held->set({values.begin(), values.end()})) continue;
      probe_.showTree();
      look(keyword.path);
    }
  }

  PageContents read(std::int32_t page) {
    if (!probe_.isVisible(page)) return {};
    PageContents contents = probe_.contents(page);
    read_ += contents.size();
    return contents;
  }

  void joinMade(const std::string& path) {
    std::optional<std::vector<std::string>> followers;
    // The page that the last one was found on is the likeliest; where there is much to read it is the only
    // one.
    std::vector<std::int32_t> order{lastPage_};
    for (const auto& [page, unused] : byPage_) {
      if (page != lastPage_) order.push_back(page);
    }
    const bool isMuch = byPage_.size() * keywords_.size() > kMuch;
    bool isFound = false;
    for (const std::int32_t page : order) {
      if (!byPage_.contains(page) || (isFound && isMuch)) continue;
      const PageContents contents = read(page);
      for (Difference* difference : byPage_[page]) {
        const bool isPage = difference->thing.empty();
        const bool isSeen = probe_.isVisible(page);
        const std::optional<std::string> value = valueAt(*difference, contents);
        const bool isMade = isPage ? isSeen == difference->other.has_value()
                            : isThing(*difference)
                                ? isSeen && value.has_value() == difference->other.has_value()
                                : isSeen && value == difference->other;
        if (!isMade) continue;
        difference->keywords.push_back(path);
        if (isThing(*difference)) {
          if (!followers) followers = followersOfProbe();
          difference->keywords.insert(difference->keywords.end(), followers->begin(), followers->end());
        }
        isFound = true;
        lastPage_ = page;
      }
    }
    if (isFound) joined_.insert(path);
    if (followers) joined_.insert(followers->begin(), followers->end());
  }

  void joinUnmade(const std::string& path) {
    for (const auto& [page, differences] : byPage_) {
      const PageContents contents = read(page);
      for (Difference* difference : differences) {
        const std::optional<std::string> value = valueAt(*difference, contents);
        if (!value || value == difference->other) continue;
        difference->keywords.push_back(path);
        joined_.insert(path);
      }
    }
  }

  // The sections that come or go with the keyword that the probe has been given.
  std::vector<std::string> followersOfProbe() {
    std::vector<std::string> followers;
    const KvsHandle file = probe_.file();
    for (const KeywordDifference& each : keywords_) {
      if (each.own && each.other) continue;
      if ((nodeAt(*file, each.path) != nullptr) == each.other.has_value()) followers.push_back(each.path);
    }
    return followers;
  }

  static constexpr std::size_t kMuch = 4000;  // pages to read

  const std::vector<KeywordDifference>& keywords_;
  const KvsFile& own_;
  const KvsFile& other_;
  const std::string& path_;
  const UnitChoices& units_;
  ComparedModel probe_;
  std::map<std::int32_t, std::vector<Difference*>> byPage_;
  std::set<std::string> joined_;
  std::int32_t lastPage_ = 0;
  std::size_t read_ = 0;
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

std::vector<std::string> joinKeywords(const std::vector<KeywordDifference>& keywords, const KvsFile& own,
                                      const KvsFile& other, const std::string& path, const UnitChoices& units,
                                      std::vector<Difference>& differences) {
  return KeywordJoiner(keywords, own, other, path, units, differences).join();
}

}  // namespace gridbay
