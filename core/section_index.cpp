#include "core/section_index.h"

#include <algorithm>
#include <bit>
#include <random>
#include <utility>

#include "core/name_bytes.h"
#include "core/parameter_tree.h"

namespace gridbay {
namespace {

// A file has few kinds of numbered things; shorter runs than this are not worth a list of their own.
constexpr std::size_t kMostRuns = 4;
constexpr std::size_t kShortestRun = 64;
constexpr std::size_t kMostDigits = 8;

std::uint64_t mix(std::uint64_t a, std::uint64_t b) {
  __extension__ using Wide = unsigned __int128;
  const Wide product = static_cast<Wide>(a) * b;
  return static_cast<std::uint64_t>(product) ^ static_cast<std::uint64_t>(product >> 64);
}

// A hash of a name with its case folded. The seed is drawn anew in each process, so that no file can be made
// whose names all meet in one place.
std::uint64_t hashName(std::string_view name) {
  static const std::uint64_t seed =
      (std::uint64_t{std::random_device{}()} << 32) | std::random_device{}() | 1U;
  constexpr std::uint64_t kFactor = 0x9E3779B97F4A7C15U;
  std::uint64_t state = mix(seed ^ name.size(), kFactor);
  const char* at = name.data();
  std::size_t left = name.size();
  for (; left > 8; left -= 8, at += 8) state = mix(state ^ names::foldCase(names::load8(at)), kFactor ^ seed);
  return mix(state ^ names::foldCase(names::loadUpTo8(at, left)), kFactor + seed);
}

std::string_view keyOf(const Node& node) {
  return names::trimmed(node.name());
}

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}

// Eight decimal digits, the first one in the lowest byte (after D. Lemire, "Quickly parsing eight digits").
std::uint32_t numberOfDigits(std::uint64_t digits) {
  digits = (digits & 0x0F0F0F0F0F0F0F0FU) * 2561 >> 8;
  digits = (digits & 0x00FF00FF00FF00FFU) * 6553601 >> 16;
  return static_cast<std::uint32_t>((digits & 0x0000FFFF0000FFFFU) * 42949672960001U >> 32);
}

}  // namespace

bool SectionIndex::Run::holds(const NumberedName& name, bool wantSection) const {
  return name.number - first < nodes.size() && sections == wantSection && names::same(prefix, name.prefix);
}

bool SectionIndex::split(std::string_view name, NumberedName& numbered) {
  if (name.size() < 8) {
    std::size_t digits = 0;
    while (digits < name.size() && isDigit(name[name.size() - 1 - digits])) ++digits;
    if (digits == 0) return false;
    const std::string_view number = name.substr(name.size() - digits);
    if (digits > 1 && number.front() == '0') return false;
    numbered = {name.substr(0, name.size() - digits), 0};
    for (const char digit : number)
      numbered.number = numbered.number * 10 + static_cast<std::uint32_t>(digit - '0');
    return true;
  }
  // The last eight bytes, of which those that are no digits, and what is before them, become zeros.
  const std::uint64_t bytes = names::load8(name.data() + name.size() - 8);
  constexpr std::uint64_t kZeros = 0x3030303030303030U;
  constexpr std::uint64_t kHighHalves = 0xF0F0F0F0F0F0F0F0U;
  const std::uint64_t odd =
      ((bytes & kHighHalves) ^ kZeros) | (((bytes + 0x0606060606060606U) & kHighHalves) ^ kZeros);
  const auto other = static_cast<std::size_t>(std::countl_zero(odd)) / 8;  // digits at the end
  if (other == 0) return false;
  const std::size_t digits = std::min(other, kMostDigits);
  // A ninth digit, or a zero in front, makes it another kind of name.
  if (digits == kMostDigits && name.size() > kMostDigits && isDigit(name[name.size() - kMostDigits - 1]))
    return false;
  if (digits > 1 && name[name.size() - digits] == '0') return false;
  const std::uint64_t masked = digits == 8 ? bytes : bytes & (~std::uint64_t{0} << (8 * (8 - digits)));
  numbered = {name.substr(0, name.size() - digits), numberOfDigits(masked)};
  return true;
}

SectionIndex::SectionIndex(const Node& section) : section_(section) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) add(*node);
}

void SectionIndex::add(const Node& node) {
  settled_ = false;
  NumberedName name;
  if (!runsAllowed_ || !split(keyOf(node), name)) {
    if (runsAllowed_) endRun();
    loose_.push_back(&node);
    return;
  }
  if (!runs_.empty()) {
    Run& run = runs_.back();
    if (name.number == run.first + run.nodes.size() && run.sections == node.isSection() &&
        names::same(run.prefix, name.prefix)) {
      run.nodes.push_back(&node);
      return;
    }
    endRun();
  }
  if (runs_.size() == kMostRuns) {
    loose_.push_back(&node);
  } else {
    runs_.push_back({node.isSection(), name.prefix, name.number, {&node}});
  }
}

// A run that stayed short is none.
void SectionIndex::endRun() {
  if (runs_.empty() || runs_.back().nodes.size() >= kShortestRun) return;
  loose_.insert(loose_.end(), runs_.back().nodes.begin(), runs_.back().nodes.end());
  runs_.pop_back();
}

// Whether a name stands both in a run and elsewhere, so that its occurrences have to be counted.
bool SectionIndex::runsMeet() const {
  for (std::size_t a = 0; a < runs_.size(); ++a) {
    for (std::size_t b = 0; b < runs_.size(); ++b) {
      if (a != b && runs_[a].holds({runs_[b].prefix, runs_[b].first}, runs_[b].sections)) return true;
    }
  }
  for (const Node* node : loose_) {
    NumberedName name;
    if (runs_.empty() || !split(keyOf(*node), name)) continue;
    for (const Run& run : runs_) {
      if (run.holds(name, node->isSection())) return true;
    }
  }
  return false;
}

void SectionIndex::settle() {
  settled_ = true;
  endRun();
  if (runsAllowed_ && runsMeet()) {
    runsAllowed_ = false;
    runs_.clear();
    loose_.clear();
    for (const Node* node = section_.first(); node != nullptr; node = node->next()) loose_.push_back(node);
  }
  slots_.assign(std::bit_ceil(loose_.size() * 4 / 3 + 1), {});
  std::vector<std::uint32_t> firsts(loose_.size());
  bool repeats = false;
  for (std::uint32_t place = 0; place < firsts.size(); ++place) {
    firsts[place] = firstOfItsName(place);
    repeats = repeats || firsts[place] != place;
  }
  if (repeats) bringTogether(firsts);
}

// The place of the first loose node that has the name of this one; it takes a slot where it is itself the
// first.
std::uint32_t SectionIndex::firstOfItsName(std::uint32_t place) {
  const Node& node = *loose_[place];
  const std::uint64_t hash = hashName(keyOf(node));
  Slot& slot = slots_[slotOf(hash, keyOf(node), node.isSection())];
  if (slot.place == 0) slot = {place + 1, static_cast<std::uint32_t>(hash >> 32)};
  return slot.place - 1;
}

// `firsts`: of each loose node the place of the first one that has its name.
void SectionIndex::bringTogether(std::span<const std::uint32_t> firsts) {
  std::vector<std::uint32_t> starts(firsts.size(), 0);  // by the first node's place
  for (const std::uint32_t first : firsts) ++starts[first];
  std::uint32_t start = 0;
  for (std::uint32_t& count : starts) start += std::exchange(count, start);
  for (Slot& slot : slots_) {
    if (slot.place > 0) slot.place = starts[slot.place - 1] + 1;
  }
  std::vector<const Node*> together(loose_.size());
  for (std::size_t place = 0; place < firsts.size(); ++place)
    together[starts[firsts[place]]++] = loose_[place];
  loose_ = std::move(together);
}

const Node* SectionIndex::find(std::string_view name, std::uint32_t occurrence, bool wantSection) {
  name = names::trimmed(name);
  if (!settled_) settle();
  NumberedName numbered;
  if (!runs_.empty() && split(name, numbered)) {
    for (const Run& run : runs_) {
      if (run.holds(numbered, wantSection))
        return occurrence == 1 ? run.nodes[numbered.number - run.first] : nullptr;
    }
  }
  const std::uint32_t first = slots_[slotOf(hashName(name), name, wantSection)].place;
  if (first == 0 || occurrence == 0 || occurrence > loose_.size() - (first - 1)) return nullptr;
  const Node* node = loose_[first - 1 + occurrence - 1];
  return node->isSection() == wantSection && names::sameTrimmed(node->name(), name) ? node : nullptr;
}

std::size_t SectionIndex::slotOf(std::uint64_t hash, std::string_view name, bool wantSection) const {
  const std::size_t mask = slots_.size() - 1;
  for (std::size_t at = hash & mask;; at = (at + 1) & mask) {
    const Slot& slot = slots_[at];
    if (slot.place == 0) return at;
    if (slot.hash != static_cast<std::uint32_t>(hash >> 32)) continue;
    const Node& node = *loose_[slot.place - 1];
    if (node.isSection() == wantSection && names::sameTrimmed(node.name(), name)) return at;
  }
}

}  // namespace gridbay
