#include "setup/setup_path.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

#include "core/kdl_writer.h"
#include "core/nearest.h"
#include "core/number_text.h"
#include "core/object_state.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

void listPaths(const Node& section, const std::string& prefix, std::vector<std::string>& paths) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    paths.push_back(prefix + std::string(node->name()));
    if (node->isSection()) listPaths(*node, paths.back() + "/", paths);
  }
}

void copySection(const Node& from, KvsFile& to, const Node* replaced, const std::vector<Value>& values) {
  for (const Node* node = from.first(); node != nullptr; node = node->next()) {
    if (node->isSection()) {
      kvsAddSection(to, node->name());
      copySection(*node, to, replaced, values);
      kvsEndSection(to);
      continue;
    }
    kvsAddKeyword(to, node->name());
    for (const Value& value : node == replaced ? std::span<const Value>(values) : node->values()) {
      to.add(value.kind(), value.text());
    }
  }
}

std::string_view kindName(ValueKind kind) {
  switch (kind) {
    case ValueKind::boolean:
      return "true or false";
    case ValueKind::integer:
      return "a whole number";
    case ValueKind::real:
      return "a number";
    case ValueKind::string:
      return "a text";
    default:
      return "a file name";
  }
}

// A text as a value of a kind; nothing when it is none.
std::optional<std::string> valueOf(ValueKind kind, std::string_view text) {
  switch (kind) {
    case ValueKind::boolean: {
      const std::string word = lowered(text.starts_with('#') ? text.substr(1) : text);
      if (word == "true" || word == "yes" || word == "1") return "true";
      if (word == "false" || word == "no" || word == "0") return "false";
      return std::nullopt;
    }
    case ValueKind::integer: {
      const std::optional<double> number = doubleOfText(text);
      const std::optional<std::int32_t> whole = int32OfText(text);
      return whole && number == *whole ? std::optional(numberText(std::int64_t{*whole})) : std::nullopt;
    }
    case ValueKind::real: {
      const std::optional<double> number = doubleOfText(text);
      return number ? std::optional(numberText(*number)) : std::nullopt;
    }
    default:
      return std::string(text);
  }
}

std::vector<std::string_view> piecesOf(std::string_view text) {
  constexpr std::string_view kSeparators = " ,";
  std::vector<std::string_view> pieces;
  while (true) {
    const std::size_t start = text.find_first_not_of(kSeparators);
    if (start == text.npos) return pieces;
    const std::size_t end = std::min(text.find_first_of(kSeparators, start), text.size());
    pieces.push_back(text.substr(start, end - start));
    text.remove_prefix(end);
  }
}

}  // namespace

std::string_view withoutTarget(std::string_view path) {
  constexpr std::string_view kTarget = CGlobalKvs::kTarget;
  if (path.size() > kTarget.size() && path[kTarget.size()] == '/' &&
      sameName(path.substr(0, kTarget.size()), kTarget)) {
    path.remove_prefix(kTarget.size() + 1);
  }
  return path;
}

bool isOption(std::string_view path) {
  constexpr std::string_view kOptions = "OPTION_PARAMETERS";
  for (std::size_t start = 0; start < path.size();) {
    const std::size_t end = std::min(path.find('/', start), path.size());
    if (end < path.size() && sameName(path.substr(start, end - start), kOptions)) return true;
    start = end + 1;
  }
  return false;
}

const Node* nodeAt(const KvsFile& file, std::string_view path) {
  const Node* at = kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1);
  std::string_view rest = withoutTarget(path);
  while (at != nullptr && !rest.empty()) {
    const std::string_view part = rest.substr(0, rest.find('/'));
    const bool isLast = part.size() == rest.size();
    const auto [name, number] = occurrenceOf(part);
    const auto occurrence = static_cast<std::uint32_t>(std::max(number, 0));
    const Node* keyword = isLast ? at->keyword(name, occurrence) : nullptr;
    at = keyword != nullptr ? keyword : at->section(name, occurrence);
    rest.remove_prefix(std::min(part.size() + 1, rest.size()));
  }
  return at;
}

Result<const Node*> findPath(const KvsFile& file, std::string_view path) {
  if (const Node* at = nodeAt(file, path)) return at;
  const std::string nearest = nearestPath(file, path);
  return Failure{fmt::format("There is no \"{}\" in this setup{}", path,
                             nearest.empty() ? "" : fmt::format("; did you mean \"{}\"?", nearest))};
}

std::string nearestPath(const KvsFile& file, std::string_view path) {
  const Node* target = kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1);
  if (target == nullptr) return {};
  std::vector<std::string> paths;
  listPaths(*target, {}, paths);
  const std::string wanted = lowered(withoutTarget(path));
  const std::string wantedName = wanted.substr(wanted.rfind('/') + 1);
  std::string nearest;
  std::size_t least = std::numeric_limits<std::size_t>::max();
  for (const std::string& candidate : paths) {
    const std::string small = lowered(candidate);
    // A right name in a wrong place is as near as a slip or two.
    const std::string name = small.substr(small.rfind('/') + 1);
    const std::size_t slips = std::min(slipsBetween(small, wanted), slipsBetween(name, wantedName) + 2);
    if (slips < least) {
      least = slips;
      nearest = candidate;
    }
  }
  return least <= std::max<std::size_t>(wantedName.size() / 2, 3) ? nearest : std::string();
}

Result<std::vector<Value>> valuesOfText(const Node& keyword, std::string_view text, bool takesAnyNumber,
                                        ParameterTree& keeper) {
  const std::span<const Value> now = keyword.values();
  std::vector<std::string_view> pieces = piecesOf(text);
  const auto isText = [](const Value& value) {
    return value.kind() == ValueKind::string || value.kind() == ValueKind::fileName ||
           value.kind() == ValueKind::resultFileName;
  };
  if (now.size() == 1 && isText(now.front())) pieces = {text};
  if (pieces.size() != now.size() && !takesAnyNumber) {
    return Failure{fmt::format("{} takes {} value{}, not {}", keyword.name(), now.size(),
                               now.size() == 1 ? "" : "s", pieces.size())};
  }
  std::vector<Value> values;
  for (std::size_t i = 0; i < pieces.size(); ++i) {
    // A list has values of one kind; an empty one does not say which.
    const ValueKind whole =
        pieces[i].find_first_of(".eE") == pieces[i].npos ? ValueKind::integer : ValueKind::real;
    const ValueKind kind = now.empty() ? whole : now[std::min(i, now.size() - 1)].kind();
    const std::optional<std::string> value = valueOf(kind, pieces[i]);
    if (!value)
      return Failure{fmt::format("{} takes {}, not \"{}\"", keyword.name(), kindName(kind), pieces[i])};
    values.push_back(keeper.makeValue(kind, keeper.keep(*value)));
  }
  return values;
}

KvsHandle withValues(const KvsFile& file, const Node* keyword, const std::vector<Value>& values) {
  KvsHandle changed = kvsCreate();
  copySection(file.tree().root(), *changed, keyword, values);
  return changed;
}

std::string shownValues(const Node& keyword) {
  const std::span<const Value> values = keyword.values();
  if (values.size() == 1 && values.front().kind() != ValueKind::boolean)
    return std::string(values.front().text());
  std::string text;
  for (const Value& value : values) text += (text.empty() ? "" : " ") + valueText(value);
  return text;
}

}  // namespace gridbay
