#include "core/parameter_tree.h"

#include <algorithm>
#include <bit>
#include <cstring>
#include <memory_resource>
#include <new>
#include <random>
#include <unordered_map>
#include <utility>
#include <vector>

namespace gridbay {
namespace {

// Below this many nodes a walk is as fast as an index.
constexpr std::uint32_t kIndexFrom = 16;

// Eight bytes with the letters A to Z made small.
std::uint64_t foldCase(std::uint64_t bytes) {
  constexpr std::uint64_t kHigh = 0x8080808080808080U;
  constexpr std::uint64_t kEach = 0x0101010101010101U;
  const std::uint64_t low = bytes & ~kHigh;
  const std::uint64_t fromA = low + kEach * (0x80 - 'A');
  const std::uint64_t pastZ = low + kEach * (0x7F - 'Z');
  const std::uint64_t upper = fromA & ~pastZ & ~bytes & kHigh;
  return bytes | (upper >> 2);
}

std::uint64_t loadBytes(const char* from, std::size_t count) {
  std::uint64_t bytes = 0;
  std::memcpy(&bytes, from, count);
  return bytes;
}

std::uint64_t mix(std::uint64_t a, std::uint64_t b) {
  __extension__ using Wide = unsigned __int128;
  const Wide product = static_cast<Wide>(a) * b;
  return static_cast<std::uint64_t>(product) ^ static_cast<std::uint64_t>(product >> 64);
}

// A hash of a name with its case folded. The seed is drawn anew in each process, so that no file can be made
// whose names all meet in one place.
std::uint64_t hashName(std::string_view name, std::uint64_t occurrence) {
  static const std::uint64_t seed =
      (std::uint64_t{std::random_device{}()} << 32) | std::random_device{}() | 1U;
  constexpr std::uint64_t kFactor = 0x9E3779B97F4A7C15U;
  std::uint64_t state = mix(seed ^ name.size(), kFactor ^ occurrence);
  const char* at = name.data();
  std::size_t left = name.size();
  for (; left > 8; left -= 8, at += 8) state = mix(state ^ foldCase(loadBytes(at, 8)), kFactor ^ seed);
  return mix(state ^ foldCase(loadBytes(at, left)), kFactor + seed);
}

}  // namespace

bool sameName(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  std::size_t i = 0;
  for (; i + 8 <= a.size(); i += 8) {
    if (foldCase(loadBytes(a.data() + i, 8)) != foldCase(loadBytes(b.data() + i, 8))) return false;
  }
  const std::size_t rest = a.size() - i;
  return foldCase(loadBytes(a.data() + i, rest)) == foldCase(loadBytes(b.data() + i, rest));
}

// Open addressing over (kind, name, occurrence). How often a repeated name has come is kept apart: few names
// repeat.
class SectionIndex {
 public:
  SectionIndex(const Node& section, std::pmr::memory_resource& arena)
      : slots_(std::bit_ceil((std::size_t{section.sectionCount()} + section.keywordCount()) * 2), &arena),
        repetitions_(&arena) {
    for (const Node* node = section.first(); node != nullptr; node = node->next()) insert(*node);
  }

  const Node* find(std::string_view name, std::uint32_t occurrence, bool wantSection) const {
    return slots_[slotOf(hashName(name, occurrence), name, occurrence, wantSection)].node;
  }

 private:
  struct Slot {
    const Node* node = nullptr;
    std::uint32_t hash = 0;
    std::uint32_t occurrence = 0;
  };

  std::size_t slotOf(std::uint64_t hash, std::string_view name, std::uint32_t occurrence,
                     bool wantSection) const {
    const std::size_t mask = slots_.size() - 1;
    for (std::size_t at = hash & mask;; at = (at + 1) & mask) {
      const Slot& slot = slots_[at];
      if (slot.node == nullptr) return at;
      if (slot.hash == static_cast<std::uint32_t>(hash >> 32) && slot.occurrence == occurrence &&
          slot.node->isSection() == wantSection && sameName(slot.node->name(), name)) {
        return at;
      }
    }
  }

  // The slot that was free for the node, or that of the node of the same name and occurrence.
  std::size_t place(const Node& node, std::uint32_t occurrence, bool& isNew) {
    const std::uint64_t hash = hashName(node.name(), occurrence);
    const std::size_t at = slotOf(hash, node.name(), occurrence, node.isSection());
    isNew = slots_[at].node == nullptr;
    if (isNew) slots_[at] = {&node, static_cast<std::uint32_t>(hash >> 32), occurrence};
    return at;
  }

  void insert(const Node& node) {
    bool isNew = false;
    const std::size_t first = place(node, 1, isNew);
    if (!isNew) place(node, 2 + repetitions_[first]++, isNew);
  }

  std::pmr::vector<Slot> slots_;
  std::pmr::unordered_map<std::size_t, std::uint32_t>
      repetitions_;  // beyond the first, by the first one's slot
};

const Node* Node::find(std::string_view name, std::uint32_t occurrence, bool wantSection) const {
  if (occurrence == 0) return nullptr;
  if (body_->index == nullptr && body_->sections + body_->keywords < kIndexFrom) {
    for (const Node* node = body_->first; node != nullptr; node = node->next_) {
      if (node->isSection() == wantSection && sameName(node->name(), name) && --occurrence == 0) return node;
    }
    return nullptr;
  }
  if (body_->index == nullptr) {
    std::pmr::memory_resource& arena = body_->tree->arena();
    void* place = arena.allocate(sizeof(SectionIndex), alignof(SectionIndex));
    body_->index = new (place) SectionIndex(*this, arena);
  }
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

std::string_view ParameterTree::keep(std::string_view text) {
  if (text.empty()) return {};
  auto* copy = static_cast<char*>(arena_.allocate(text.size(), 1));
  std::memcpy(copy, text.data(), text.size());
  return {copy, text.size()};
}

std::span<const Value> ParameterTree::keep(std::span<const Value> values) {
  if (values.empty()) return {};
  auto* copy = static_cast<Value*>(arena_.allocate(values.size_bytes(), alignof(Value)));
  std::uninitialized_copy(values.begin(), values.end(), copy);
  return {copy, values.size()};
}

template <class T, class... Args>
T* ParameterTree::make(Args&&... args) {
  return std::construct_at(static_cast<T*>(arena_.allocate(sizeof(T), alignof(T))),
                           std::forward<Args>(args)...);
}

Node* ParameterTree::makeSection(std::string_view name) {
  auto* body = make<SectionBody>();
  body->tree = this;
  return make<Node>(name, body);
}

Node* ParameterTree::makeKeyword(std::string_view name, std::span<const Value> values) {
  return make<Node>(name, values);
}

void ParameterTree::append(Node& section, Node* last, Node& node) {
  (last == nullptr ? section.body_->first : last->next_) = &node;
  ++(node.isSection() ? section.body_->sections : section.body_->keywords);
  section.body_->index = nullptr;
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
