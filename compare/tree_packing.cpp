#include "compare/tree_packing.h"

#include <cstdint>
#include <vector>

namespace gridbay {
namespace {

// A tree in the order of its file, with all names and values in one text.
struct FlatTree {
  struct Item {
    std::uint32_t length = 0;  // of its name
    std::uint32_t count = 0;   // of what a section holds, or of a keyword's values
    std::uint32_t isSection = 0;
  };
  struct Text {
    std::uint32_t length = 0;
    ValueKind kind = ValueKind::string;
  };
  std::vector<Item> items;
  std::vector<Text> values;
  std::string texts;
};

void flatten(const Node& section, FlatTree& flat) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    flat.texts += node->name();
    const auto length = static_cast<std::uint32_t>(node->name().size());
    if (node->isSection()) {
      flat.items.push_back({length, node->sectionCount() + node->keywordCount(), 1});
      flatten(*node, flat);
      continue;
    }
    flat.items.push_back({length, static_cast<std::uint32_t>(node->values().size()), 0});
    for (const Value& value : node->values()) {
      flat.values.push_back({static_cast<std::uint32_t>(value.text().size()), value.kind()});
      flat.texts += value.text();
    }
  }
}

// Makes the nodes again, as far as they are there.
class TreeMaker {
 public:
  TreeMaker(const FlatTree& flat, ParameterTree& tree)
      : flat_(flat), tree_(tree), rest_(tree.keep(flat.texts)) {}

  void fill(Node& section, std::uint32_t count) {
    Node* last = nullptr;
    for (; count > 0 && item_ < flat_.items.size(); --count) {
      const FlatTree::Item& item = flat_.items[item_++];
      const std::string_view name = take(item.length);
      Node* node = item.isSection != 0 ? tree_.makeSection(name) : makeKeyword(name, item.count);
      ParameterTree::append(section, last, *node);
      if (item.isSection != 0) fill(*node, item.count);
      last = node;
    }
  }

 private:
  std::string_view take(std::uint32_t length) {
    const std::string_view text = rest_.substr(0, length);
    rest_.remove_prefix(text.size());
    return text;
  }
  Node* makeKeyword(std::string_view name, std::uint32_t count) {
    for (; count > 0 && value_ < flat_.values.size(); --count) {
      const FlatTree::Text& value = flat_.values[value_++];
      values_.push(tree_.makeValue(value.kind, take(value.length)));
    }
    return tree_.makeKeyword(name, values_);
  }

  const FlatTree& flat_;
  ParameterTree& tree_;
  std::string_view rest_;
  ValueList values_;
  std::size_t item_ = 0;
  std::size_t value_ = 0;
};

}  // namespace

void passTree(Packing& pack, const KvsFile& file) {
  FlatTree flat;
  flatten(file.tree().root(), flat);
  bool isThere = true;
  pack(isThere, flat.items, flat.values, flat.texts);
}

void pass(Packing& pack, KvsHandle& file) {
  if (file != nullptr) return passTree(pack, *file);
  bool isThere = false;
  pack(isThere);
  if (!isThere) return;
  FlatTree flat;
  pack(flat.items, flat.values, flat.texts);
  auto tree = std::make_unique<ParameterTree>();
  TreeMaker(flat, *tree).fill(tree->root(), UINT32_MAX);
  file = std::make_unique<KvsFile>(std::move(tree));
}

}  // namespace gridbay
