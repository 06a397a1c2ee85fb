#include "batch/ensemble_table.h"

#include <fmt/format.h>

#include <map>
#include <optional>

#include "batch/csv_table.h"
#include "core/nearest.h"
#include "platform/files/paths.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// What a save adds to a name until the file is whole, and the extension.
constexpr std::size_t kLongestAddition = 24;
constexpr std::size_t kLongestName = 255 - kLongestAddition;

bool isNames(const std::string& heading) {
  const std::string word = lowered(heading);
  return word.empty() || word == "name" || word == "member";
}

// Why a text cannot be the name of a member; nothing when it can.
std::optional<std::string> faultOfName(const std::string& name) {
  if (name.empty()) return "a member needs a name";
  if (name.size() > kLongestName)
    return fmt::format("a name has {} bytes at most, not {}", kLongestName, name.size());
  if (name.find('/') != name.npos || name.starts_with('.') || name.starts_with('-') ||
      !isUsablePathName(name))
    return fmt::format("\"{}\" cannot be the name of a member: it becomes that of a file", name);
  return std::nullopt;
}

Outcome takePaths(EnsembleTable& table, const CsvRow& header) {
  const std::size_t names = table.firstPathColumn - 1;
  std::map<std::string, std::size_t> columns;
  for (std::size_t i = names; i < header.cells.size(); ++i) {
    const std::string& path = header.cells[i];
    const auto fail = [&](const std::string& why) {
      return Failure{fmt::format("{}, line {}, column {}: {}", table.path, header.line, i + 1, why)};
    };
    if (path.empty()) return fail("a column needs a path");
    const auto [before, isNew] = columns.emplace(lowered(withoutTarget(path)), i + 1);
    if (!isNew) return fail(fmt::format("\"{}\" has column {} already", path, before->second));
    table.paths.push_back(path);
  }
  return {};
}

Outcome takeMembers(EnsembleTable& table, std::vector<CsvRow> rows, std::size_t cells,
                    std::string_view stem) {
  const bool hasNames = table.firstPathColumn > 1;
  const std::size_t digits = std::to_string(rows.size()).size();
  std::map<std::string, std::size_t> lines;
  for (CsvRow& row : rows) {
    EnsembleTable::Member member;
    member.line = row.line;
    member.name =
        hasNames ? row.cells.front() : fmt::format("{}_{:0{}}", stem, table.members.size() + 1, digits);
    if (row.cells.size() != cells) {
      const std::size_t column = std::min(row.cells.size(), cells) + 1;
      return Failure{fmt::format("{}, column {}: the row has {} cell{} where the first one has {}",
                                 table.placeOf(member), column, row.cells.size(),
                                 row.cells.size() == 1 ? "" : "s", cells)};
    }
    const auto fail = [&](const std::string& why) {
      return Failure{fmt::format("{}, line {}, column 1: {}", table.path, row.line, why)};
    };
    if (const auto fault = faultOfName(member.name)) return fail(*fault);
    const auto [before, isNew] = lines.emplace(member.name, row.line);
    if (!isNew) return fail(fmt::format("line {} has a member \"{}\" already", before->second, member.name));
    member.values.assign(std::make_move_iterator(row.cells.begin() + (hasNames ? 1 : 0)),
                         std::make_move_iterator(row.cells.end()));
    table.members.push_back(std::move(member));
  }
  return {};
}

}  // namespace

std::string EnsembleTable::placeOf(const Member& member) const {
  return fmt::format("{}, line {} ({})", path, member.line, member.name);
}

std::string EnsembleTable::placeOf(const Member& member, std::size_t column) const {
  return fmt::format("{}, column {} ({})", placeOf(member), firstPathColumn + column, paths[column]);
}

Result<EnsembleTable> readEnsembleTable(const std::string& path, std::string_view stem) {
  Result<std::vector<CsvRow>> rows = readCsv(path);
  if (!rows) return Failure{rows.error()};
  if (rows->size() < 2)
    return Failure{
        fmt::format("\"{}\" has no members: a row of paths is expected, and a row for each member", path)};
  EnsembleTable table;
  table.path = path;
  const CsvRow header = std::move(rows->front());
  rows->erase(rows->begin());
  table.firstPathColumn = isNames(header.cells.front()) ? 2 : 1;
  if (const Outcome taken = takePaths(table, header); !taken) return Failure{taken.error()};
  if (const Outcome taken = takeMembers(table, std::move(*rows), header.cells.size(), stem); !taken)
    return Failure{taken.error()};
  return table;
}

}  // namespace gridbay
