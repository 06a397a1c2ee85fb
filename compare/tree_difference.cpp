#include "compare/tree_difference.h"

#include <algorithm>

#include "setup/global_kvs.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// The path of a thing that one of the two sections has at least.
std::string pathOf(const std::string& prefix, const NodeGroup<2>& sections, const NodeGroup<2>& nodes) {
  const std::size_t holder = nodes[0] != nullptr ? 0 : 1;
  return prefix + stepOfNode(*sections[holder], *nodes[holder]);
}

void compare(const NodeGroup<2>& sections, const std::string& prefix,
             std::vector<KeywordDifference>& differences) {
  for (const NodeGroup<2>& nodes : groupsOf<2>(sections)) {
    const auto [own, other] = nodes;
    const bool isSection = (own != nullptr ? own : other)->isSection();
    if (own != nullptr && other != nullptr && isSection) {
      compare(nodes, pathOf(prefix, sections, nodes) + "/", differences);
    } else if (own == nullptr || other == nullptr || !sameKeyword(*own, *other)) {
      differences.push_back({pathOf(prefix, sections, nodes), isSection, shownNode(own), shownNode(other)});
    }
  }
}

using IsTaken = std::function<bool(const std::string& path)>;

void writeTaken(const NodeGroup<2>& sections, const std::string& prefix, const IsTaken& isTaken,
                KvsFile& file) {
  for (const NodeGroup<2>& nodes : groupsOf<2>(sections)) {
    const auto [own, other] = nodes;
    if (own != nullptr && other != nullptr && own->isSection()) {
      kvsAddSection(file, own->name());
      writeTaken(nodes, pathOf(prefix, sections, nodes) + "/", isTaken, file);
      kvsEndSection(file);
      continue;
    }
    const bool differs = own == nullptr || other == nullptr || !sameKeyword(*own, *other);
    const Node* wanted = differs && isTaken(pathOf(prefix, sections, nodes)) ? other : own;
    if (wanted != nullptr) writeNode(*wanted, file);
  }
}

const Node* targetOf(const KvsFile& file) {
  return kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1);
}

constexpr std::string_view kOptions = "OPTION_PARAMETERS";

bool isOptions(const Node& section) {
  return sameName(section.name(), kOptions);
}

bool hasOptions(const Node& section) {
  if (isOptions(section)) return true;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (node->isSection() && hasOptions(*node)) return true;
  }
  return false;
}

void writeWithOptions(const NodeGroup<2>& sections, KvsFile& file) {
  for (const NodeGroup<2>& nodes : groupsOf<2>(sections)) {
    const auto [mine, other] = nodes;
    const Node& held = mine != nullptr ? *mine : *other;
    const bool isSearched = held.isSection() && hasOptions(held);
    if (isSearched && !isOptions(held)) {
      kvsAddSection(file, held.name());
      writeWithOptions(nodes, file);
      kvsEndSection(file);
    } else if (isSearched && sections[1] != nullptr) {
      if (other != nullptr) writeNode(*other, file);
    } else if (mine != nullptr) {
      writeNode(*mine, file);
    }
  }
}

// The options that a save writes, in sections of the top: there a save looks for them by the name of the
// section that they stand in, wherever that is.
void writeOptions(const Node& section, KvsFile& file) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (!node->isSection() || isOptions(*node)) continue;
    if (const Node* options = node->section(kOptions)) {
      kvsAddSection(file, node->name());
      writeNode(*options, file);
      kvsEndSection(file);
    }
    writeOptions(*node, file);
  }
}

}  // namespace

std::vector<KeywordDifference> differencesOf(const Node& own, const Node& other) {
  std::vector<KeywordDifference> differences;
  compare({&own, &other}, {}, differences);
  return differences;
}

KvsHandle withTaken(const KvsFile& own, const KvsFile& other, const IsTaken& isTaken) {
  KvsHandle file = kvsCreate();
  kvsAddTarget(*file, CGlobalKvs::kTarget);
  writeTaken({targetOf(own), targetOf(other)}, {}, isTaken, *file);
  kvsEndSection(*file);
  return file;
}

bool sameOptions(const KvsFile& a, const KvsFile& b) {
  return std::ranges::none_of(differencesOf(*targetOf(a), *targetOf(b)),
                              [](const KeywordDifference& each) { return isOption(each.path + '/'); });
}

KvsHandle withOptions(const KvsFile& file, const KvsFile& other) {
  const KvsHandle options = kvsCreate();
  kvsAddTarget(*options, CGlobalKvs::kTarget);
  writeOptions(*targetOf(other), *options);
  kvsEndSection(*options);
  KvsHandle made = kvsCreate();
  kvsAddTarget(*made, CGlobalKvs::kTarget);
  writeWithOptions({targetOf(file), targetOf(*options)}, *made);
  kvsEndSection(*made);
  return made;
}

}  // namespace gridbay
