#include "python/model_snapshot.h"

#include <fmt/format.h>

#include <unordered_map>

#include "core/nearest.h"
#include "core/number_text.h"
#include "setup/setup_path.h"

namespace gridbay::python {
namespace {

void list(const Node& section, const std::string& prefix, Snapshot& snapshot) {
  std::unordered_map<std::string, int> seen;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    std::string name(node->name());
    if (!node->isSection()) {
      Keyword keyword{prefix + name, {}};
      for (const Value& value : node->values()) keyword.values.emplace_back(value.kind(), value.text());
      snapshot.keywords.push_back(std::move(keyword));
      continue;
    }
    if (const int occurrence = ++seen[lowered(name)]; occurrence > 1) name += fmt::format("[{}]", occurrence);
    snapshot.sections.push_back(prefix + name);
    list(*node, prefix + name + "/", snapshot);
  }
}

}  // namespace

Snapshot snapshotOf(CGlobalKvs& model) {
  const KvsHandle file = kvsCreate();
  model.Save(*file, {});
  Snapshot snapshot;
  const KvsSection target = kvsTargetByNameNum(*file, CGlobalKvs::kTarget, 1);
  if (target != nullptr) list(*target, {}, snapshot);
  return snapshot;
}

std::optional<ItemStep> itemOf(std::string_view step) {
  if (step.ends_with(']')) {
    const NamedOccurrence occurrence = occurrenceOf(step);
    return ItemStep{fmt::format("{}[{{}}]", occurrence.name), occurrence.number};
  }
  const std::size_t last = step.find_last_not_of("0123456789");
  if (last == step.npos || last + 1 == step.size() || step[last] != '_') return std::nullopt;
  const std::optional<std::int32_t> number = int32OfText(step.substr(last + 1));
  if (!number) return std::nullopt;
  return ItemStep{std::string(step.substr(0, last + 1)) + "{}", *number};
}

bool isOfFirstItems(std::string_view path) {
  for (PathStep step = stepOf(path);; step = stepOf(step.rest)) {
    if (const auto item = itemOf(step.first); item && item->number > 1 && !step.isLast()) return false;
    if (step.isLast()) return true;
  }
}

std::string inFirstItems(std::string_view path) {
  std::string first;
  for (PathStep step = stepOf(path);; step = stepOf(step.rest)) {
    if (step.isLast()) return first + std::string(step.first);
    const auto item = itemOf(step.first);
    const bool isRepeated = item && step.first.ends_with(']');
    first += !item || item->number == 1 ? std::string(step.first)
             : isRepeated               ? occurrenceOf(step.first).name
                                        : fmt::format(fmt::runtime(item->list), 1);
    first += '/';
  }
}

std::string parentOf(const std::string& path) {
  const std::size_t slash = path.rfind('/');
  return slash == path.npos ? std::string() : path.substr(0, slash);
}
std::string nameOf(const std::string& path) {
  return path.substr(path.rfind('/') + 1);
}

bool looksLikeACount(const Keyword& keyword) {
  const std::string name = lowered(nameOf(keyword.path));
  return keyword.values.size() == 1 && keyword.values.front().first == ValueKind::integer &&
         (name.find("number") != name.npos || name.starts_with("no") || name.find("_no") != name.npos);
}

}  // namespace gridbay::python
