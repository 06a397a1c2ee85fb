#include "compare/tree_merge.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <unordered_map>

#include "compare/section_pairs.h"
#include "core/nearest.h"
#include "core/number_text.h"
#include "setup/global_kvs.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

enum Side : std::size_t { kBase, kOwn, kOther };

// Lists of which nothing else of a setup speaks by number, by the names of their entries. A name that ends in
// "_" has the number behind it.
constexpr std::array<std::string_view, 4> kPlainLists{"weir_data", "Culvert_data", "DIKE_", "OUTPUT_AREA_"};

bool isEntry(const Node& node, std::string_view list) {
  if (!node.isSection()) return false;
  if (!list.ends_with('_')) return sameName(node.name(), list);
  const std::string_view name = node.name();
  return name.size() > list.size() && sameName(name.substr(0, list.size()), list) &&
         name.find_first_not_of("0123456789", list.size()) == name.npos;
}

// Whether a section is an entry of some list.
bool isAnyEntry(const Node& node) {
  const std::size_t last = node.name().find_last_not_of("0123456789");
  const bool isNumbered =
      last != node.name().npos && last + 1 < node.name().size() && node.name()[last] == '_';
  return isNumbered ||
         std::ranges::any_of(kPlainLists, [&](std::string_view list) { return isEntry(node, list); });
}

std::vector<const Node*> entriesOf(const Node* section, std::string_view list) {
  std::vector<const Node*> entries;
  if (section == nullptr) return entries;
  for (const Node* node = section->first(); node != nullptr; node = node->next()) {
    if (isEntry(*node, list)) entries.push_back(node);
  }
  return entries;
}

// The keyword of a section that says how many entries its list has.
const Node* countKeyword(const Node* section, std::size_t count) {
  if (section == nullptr) return nullptr;
  for (const Node* node = section->first(); node != nullptr; node = node->next()) {
    if (node->isSection() || node->values().size() != 1) continue;
    const std::string name = lowered(node->name());
    const bool isCount = name.starts_with("number_of_") || name.starts_with("no_of_");
    if (isCount && int32OfText(node->values()[0].text()) == static_cast<std::int32_t>(count)) return node;
  }
  return nullptr;
}

class Merger {
 public:
  Merger(KvsFile& file, const MergeChoice& choose, MergedTree& merged)
      : file_(file), choose_(choose), merged_(merged) {}

  void mergeSections(const NodeGroup<3>& sections, const std::string& prefix) {
    const std::optional<NewEntries> added = newEntries(sections);
    for (const NodeGroup<3>& nodes : groupsOf<3>(sections)) {
      if (added && isOf(*added, nodes)) continue;
      if (added && std::ranges::find(nodes, added->count) != nodes.end()) {
        kvsPutParam(file_, added->count->name(), static_cast<std::int32_t>(added->total));
        continue;
      }
      merge(sections, nodes, prefix);
    }
    if (added) writeEntries(*added);
  }

 private:
  // Entries that both have added to a list: its count, and those that stand behind the ones of the base.
  struct NewEntries {
    std::string_view list;
    const Node* count;  // of the first
    std::size_t total;
    std::vector<const Node*> nodes;
    std::size_t before;                   // entries of the base
    std::vector<const Node*> passedOver;  // by the merge of what stands in order
    std::size_t fromOther = 0;
  };

  static std::optional<NewEntries> newEntries(const NodeGroup<3>& sections) {
    for (const std::string_view list : kPlainLists) {
      const std::vector<const Node*> base = entriesOf(sections[kBase], list);
      const std::vector<const Node*> own = entriesOf(sections[kOwn], list);
      const std::vector<const Node*> other = entriesOf(sections[kOther], list);
      if (own.size() <= base.size() || other.size() <= base.size()) continue;
      const Node* count = countKeyword(sections[kOwn], own.size());
      if (count == nullptr || countKeyword(sections[kOther], other.size()) == nullptr) continue;
      const auto behind = [&](const std::vector<const Node*>& all) {
        return std::vector<const Node*>(all.begin() + static_cast<std::ptrdiff_t>(base.size()), all.end());
      };
      NewEntries added{list, count, 0, behind(own), base.size(), behind(own)};
      for (const Node* entry : behind(other)) {
        added.passedOver.push_back(entry);
        const auto same = [&](const Node* each) { return sameNode(each, entry); };
        if (std::ranges::any_of(added.nodes, same)) continue;
        added.nodes.push_back(entry);
        ++added.fromOther;
      }
      added.total = base.size() + added.nodes.size();
      return added;
    }
    return std::nullopt;
  }

  static bool isOf(const NewEntries& added, const NodeGroup<3>& nodes) {
    return std::ranges::any_of(
        added.passedOver, [&](const Node* entry) { return nodes[kOwn] == entry || nodes[kOther] == entry; });
  }

  void writeEntries(const NewEntries& added) {
    std::size_t number = added.before;
    for (const Node* entry : added.nodes) {
      ++number;
      kvsAddSection(file_, added.list.ends_with('_') ? fmt::format("{}{}", added.list, number)
                                                     : std::string(added.list));
      for (const Node* node = entry->first(); node != nullptr; node = node->next()) writeNode(*node, file_);
      kvsEndSection(file_);
    }
    merged_.takenFromOther += added.fromOther;
  }

  void merge(const NodeGroup<3>& sections, const NodeGroup<3>& nodes, const std::string& prefix) {
    const auto [base, own, other] = nodes;
    const std::size_t holder = own != nullptr ? kOwn : other != nullptr ? kOther : kBase;
    const auto path = [&] { return prefix + stepOfNode(*sections[holder], *nodes[holder]); };
    const bool isSection = nodes[holder]->isSection();
    // Entries that both have added are one thing as a whole, where they are not the same.
    if (isSection && own != nullptr && other != nullptr && (base != nullptr || !isAnyEntry(*own))) {
      kvsAddSection(file_, own->name());
      mergeSections(nodes, path() + "/");
      kvsEndSection(file_);
      return;
    }
    const Node* wanted = own;
    if (sameNode(own, other) || sameNode(base, other)) {
      wanted = own;
    } else if (sameNode(base, own)) {
      wanted = other;
      ++merged_.takenFromOther;
    } else {
      merged_.conflicts.push_back({path(), isSection, shownNode(base), shownNode(own), shownNode(other)});
      if (choose_(merged_.conflicts.back()) == MergeSide::other) wanted = other;
    }
    if (wanted != nullptr) writeNode(*wanted, file_);
  }

  KvsFile& file_;
  const MergeChoice& choose_;
  MergedTree& merged_;
};

}  // namespace

MergedTree mergeTrees(const KvsFile& base, const KvsFile& own, const KvsFile& other,
                      const MergeChoice& choose) {
  MergedTree merged{kvsCreate(), {}, 0};
  const auto target = [](const KvsFile& file) { return kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1); };
  kvsAddTarget(*merged.file, CGlobalKvs::kTarget);
  Merger(*merged.file, choose, merged).mergeSections({target(base), target(own), target(other)}, {});
  kvsEndSection(*merged.file);
  return merged;
}

}  // namespace gridbay
