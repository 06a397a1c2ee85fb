#include "compare/section_pairs.h"

#include <fmt/format.h>

#include <algorithm>
#include <unordered_map>

#include "core/nearest.h"
#include "core/number_text.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

bool isSameKind(const Node& a, const Node& b) {
  return a.isSection() == b.isSection() && (a.name() == b.name() || sameName(a.name(), b.name()));
}

// Name, kind and number of each thing of a section, as a text that is the same in all sections.
class KeyMaker {
 public:
  std::string keyOf(const Node& node) {
    std::string key = lowered(node.name());
    key.erase(key.find_last_not_of(' ') + 1);
    key += node.isSection() ? '/' : '=';
    const int number = ++numbers_[key];
    return number == 1 ? key : key + std::to_string(number);
  }

 private:
  std::unordered_map<std::string, int> numbers_;
};

const Node* firstOf(const Node* section) {
  return section == nullptr ? nullptr : section->first();
}

// Sections of one order, which most are; empty where they are not.
template <std::size_t n>
std::vector<NodeGroup<n>> inStep(const NodeGroup<n>& sections) {
  std::vector<NodeGroup<n>> groups;
  NodeGroup<n> at;
  std::ranges::transform(sections, at.begin(), firstOf);
  while (std::ranges::all_of(at, [](const Node* node) { return node != nullptr; })) {
    if (!std::ranges::all_of(at, [&](const Node* node) { return isSameKind(*node, *at[0]); })) return {};
    groups.push_back(at);
    for (const Node*& node : at) node = node->next();
  }
  if (std::ranges::any_of(at, [](const Node* node) { return node != nullptr; })) return {};
  return groups;
}

bool isNumber(ValueKind kind) {
  return kind == ValueKind::integer || kind == ValueKind::real;
}

bool equalValues(const Value& a, const Value& b) {
  if (a.text() == b.text()) return a.kind() == b.kind() || (isNumber(a.kind()) && isNumber(b.kind()));
  if (!isNumber(a.kind()) || !isNumber(b.kind())) return false;
  const std::optional<double> number = doubleOfText(a.text());
  return number.has_value() && number == doubleOfText(b.text());
}

}  // namespace

template <std::size_t n>
std::vector<NodeGroup<n>> groupsOf(const NodeGroup<n>& sections) {
  std::vector<NodeGroup<n>> groups = inStep(sections);
  if (!groups.empty()) return groups;
  std::unordered_map<std::string, std::size_t> places;
  for (std::size_t i = 0; i < n; ++i) {
    KeyMaker keys;
    for (const Node* node = firstOf(sections[i]); node != nullptr; node = node->next()) {
      const auto [place, isNew] = places.try_emplace(keys.keyOf(*node), groups.size());
      if (isNew) groups.push_back({});
      groups[place->second][i] = node;
    }
  }
  return groups;
}

template std::vector<NodeGroup<2>> groupsOf(const NodeGroup<2>&);
template std::vector<NodeGroup<3>> groupsOf(const NodeGroup<3>&);

std::string stepOfNode(const Node& section, const Node& node) {
  const auto found = [&](std::uint32_t number) {
    return node.isSection() ? section.section(node.name(), number) : section.keyword(node.name(), number);
  };
  std::uint32_t number = 1;
  while (found(number) != &node && found(number) != nullptr) ++number;
  return number == 1 ? std::string(node.name()) : fmt::format("{}[{}]", node.name(), number);
}

bool sameKeyword(const Node& a, const Node& b) {
  return std::ranges::equal(a.values(), b.values(), equalValues);
}

bool sameNode(const Node* a, const Node* b) {
  if (a == nullptr || b == nullptr) return a == b;
  if (a->isSection() != b->isSection()) return false;
  if (!a->isSection()) return sameKeyword(*a, *b);
  return std::ranges::all_of(groupsOf<2>({a, b}),
                             [](const NodeGroup<2>& group) { return sameNode(group[0], group[1]); });
}

std::optional<std::string> shownNode(const Node* node) {
  if (node == nullptr) return std::nullopt;
  return node->isSection() ? std::string() : shownValues(*node);
}

void writeNode(const Node& node, KvsFile& file) {
  if (!node.isSection()) {
    kvsAddKeyword(file, node.name());
    for (const Value& value : node.values()) file.add(value.kind(), value.text());
    return;
  }
  kvsAddSection(file, node.name());
  for (const Node* each = node.first(); each != nullptr; each = each->next()) writeNode(*each, file);
  kvsEndSection(file);
}

}  // namespace gridbay
