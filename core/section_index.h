#pragma once

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace gridbay {

class Node;

// Finds what a section holds by name and occurrence. Most of a large file is numbered, as POINT_1, POINT_2
// and on: such a run is found by its number. All else is put together by name and found by a hash of it,
// made when it is first asked for. Not to be asked from two threads at once.
class SectionIndex {
 public:
  // With all that the section holds now.
  explicit SectionIndex(const Node& section);

  // The section has got another node, its last.
  void add(const Node& node);
  // The occurrence-th (from 1) section or keyword of a name, its case and blanks at its end ignored; null
  // when there is none.
  const Node* find(std::string_view name, std::uint32_t occurrence, bool wantSection);

 private:
  // A name that ends in a number without needless zeros, so that each number has one name.
  struct NumberedName {
    std::string_view prefix;
    std::uint32_t number = 0;
  };
  // Siblings of one kind that are numbered on without a gap.
  struct Run {
    bool sections = false;
    std::string_view prefix;
    std::uint32_t first = 0;
    std::vector<const Node*> nodes = {};

    bool holds(const NumberedName& name, bool wantSection) const;
  };
  struct Slot {
    std::uint32_t place = 0;  // of a name's first node among the loose ones, from 1; 0 where the slot is free
    std::uint32_t hash = 0;
  };

  static bool split(std::string_view name, NumberedName& numbered);
  void endRun();
  void settle();
  bool runsMeet() const;
  std::size_t slotOf(std::uint64_t hash, std::string_view name, bool wantSection) const;
  std::uint32_t firstOfItsName(std::uint32_t place);
  void bringTogether(std::span<const std::uint32_t> firsts);

  const Node& section_;
  std::vector<Run> runs_;           // the last one may still grow, and be too short to count
  std::vector<const Node*> loose_;  // those of one name in the order of the file; together once settled
  bool runsAllowed_ = true;
  bool settled_ = false;
  std::vector<Slot> slots_;
};

}  // namespace gridbay
