#include "core/parameter_tree.h"

#include <algorithm>
#include <cstring>
#include <utility>
#include <vector>

#include "core/name_bytes.h"

namespace gridbay {
bool sameName(std::string_view a, std::string_view b) {
  return names::same(names::trimmed(a), names::trimmed(b));
}

const Node* Node::find(std::string_view name, std::uint32_t occurrence, bool wantSection) const {
  if (occurrence == 0) return nullptr;
  name = names::trimmed(name);
  // Below this many nodes a walk is as fast as an index.
  constexpr std::uint32_t kIndexFrom = 16;
  if (body_->index == nullptr && body_->sections + body_->keywords < kIndexFrom) {
    for (const Node* node = body_->first; node != nullptr; node = node->next_) {
      const bool isLongEnough = node->nameLength_ >= name.size();
      if (isLongEnough && node->isSection() == wantSection && names::sameTrimmed(node->name(), name) &&
          --occurrence == 0)
        return node;
    }
    return nullptr;
  }
  if (body_->index == nullptr) body_->index = body_->tree->makeIndex(*this);
  return body_->index->find(name, occurrence, wantSection);
}

const Node* Node::section(std::string_view name, std::uint32_t occurrence) const {
  return find(name, occurrence, true);
}

const Node* Node::keyword(std::string_view name, std::uint32_t occurrence) const {
  return find(name, occurrence, false);
}

ParameterTree::ParameterTree(FileText text)
    : text_(std::move(text)),
      arena_(std::clamp<std::size_t>(text_.view().size(), 1U << 10, 1U << 20)),
      root_(makeSection({})) {}

ParameterTree::~ParameterTree() = default;

SectionIndex* ParameterTree::makeIndex(const Node& section) {
  indexes_.push_back(std::make_unique<SectionIndex>(section));
  return indexes_.back().get();
}

std::string_view ParameterTree::keep(std::string_view text) {
  if (text.empty()) return {};
  char* copy = arena_.bytes(text.size());
  std::memcpy(copy, text.data(), text.size());
  return {copy, text.size()};
}

void ValueList::pushFurther(Value value) {
  if (count_ % kPiece == 0) further_.push_back(allocateBytes(kLargeMemory));
  std::construct_at(reinterpret_cast<Value*>(further_.back().get()) + count_ % kPiece, value);
  ++count_;
}

Node* ParameterTree::makeKeyword(std::string_view name, ValueList& values) {
  const std::size_t count = values.first_.size() + values.count_;
  Value* kept = count == 0 ? nullptr : arena_.room<Value>(count);
  Value* at = std::uninitialized_copy(values.first_.begin(), values.first_.end(), kept);
  for (LargeBytes& piece : values.further_) {
    const std::size_t size = std::min(ValueList::kPiece, count - static_cast<std::size_t>(at - kept));
    at = std::uninitialized_copy_n(reinterpret_cast<const Value*>(piece.get()), size, at);
    piece.reset();
  }
  values.clear();
  return arena_.make<Node>(name, std::span<const Value>(kept, count));
}

bool sameTree(const Node& a, const Node& b) {
  std::vector<std::pair<const Node*, const Node*>> open{{a.first(), b.first()}};
  while (!open.empty()) {
    const auto [x, y] = open.back();
    open.pop_back();
    if (x == nullptr && y == nullptr) continue;
    if (x == nullptr || y == nullptr || x->name() != y->name() || x->isSection() != y->isSection())
      return false;
    open.emplace_back(x->next(), y->next());
    if (x->isSection()) {
      open.emplace_back(x->first(), y->first());
    } else if (!std::ranges::equal(x->values(), y->values(), [](const Value& v, const Value& w) {
                 return v.kind() == w.kind() && v.text() == w.text();
               })) {
      return false;
    }
  }
  return true;
}

}  // namespace gridbay
