#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "families/entry_flags.h"
#include "families/transport_results.h"

namespace gridbay {

// An item that an output of this module can have.
struct ExpOutputItem {
  enum class Group { main, derived, process };
  enum class Needs { nothing, salinity, waves };

  std::string keyword;
  Group group;
  Needs needs = Needs::nothing;
};

// All of them, in the order of the file.
std::vector<ExpOutputItem> expOutputItems(int layers, int fractions);

// An output, with a choice among these items.
class CNmtExpResultObjectKvs final : public TableKvs<CNmtExpResultObjectKvs>, public TransportOutput {
  using Self = CNmtExpResultObjectKvs;

 public:
  using TableKvs::TableKvs;

  EntryFlags items;  // one for each item of so many layers and fractions
  std::int32_t layers = 0;
  std::int32_t fractions = 0;

  // Each item that there is before and after keeps its flag; new ones are not chosen.
  void SetItemCounts(int newLayers, int newFractions);
  void Rebuild();
  // How many are written: those that are chosen and that the model has.
  int WrittenItems() const;

  unsigned Validate(ValidationList& messages, int) override;

  // A section for each group of items, and how many are written.
  struct ItemsRow {
    void save(const Self& output, KvsFile& file, const std::string&) const;
    void load(Self& output, KvsSection from, const std::string&) const;
    void copy(Self& output, const Self& other) const;
    static constexpr auto members() { return std::tuple(&Self::items, &Self::layers, &Self::fractions); }
    bool access(Self& output, std::string_view path, PathAccess& access) const;
  };
  static constexpr auto table() { return keywords(transportOutputRows(), ItemsRow{}); }
};

using CNmtExpResultHotStartObjectKvs = ResultHotStartKvs<PageId::mtExpResult>;

// What the module writes.
class CNmtExpResultKvs final
    : public TransportResultsKvs<CNmtExpResultKvs, CNmtExpResultObjectKvs, PageId::mtExpResult> {
 public:
  using TransportResultsKvs::TransportResultsKvs;

  static constexpr auto table() {
    return section("OUTPUT_SPECIFICATION", outputCountRow(), outputRows(), hotStartRows());
  }

  // The layers and fractions whose items an output can have.
  void SetItemCounts(int layers, int fractions);

  bool hydrodynamicHotStart();
  int valuesAtPoint(const CNmtExpResultObjectKvs& output) { return output.WrittenItems(); }
  // What is carried, and the mass of each fraction in each layer.
  int itemsOfHotStart();
};

}  // namespace gridbay
