#include "mud_transport_expanded/result.h"

#include <algorithm>
#include <array>
#include <unordered_map>

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {
namespace {

using Group = ExpOutputItem::Group;
using Needs = ExpOutputItem::Needs;
using Output = CNmtExpResultObjectKvs;

constexpr std::array<std::string_view, 3> kGroupSections{"MAIN_OUTPUT_ITEMS", "DERIVED_OUTPUT_ITEMS",
                                                         "PROCESS_OUTPUT_ITEMS"};
constexpr std::array kGroups{Group::main, Group::derived, Group::process};
constexpr std::string_view kCount = "NoOfComponents";

std::string_view sectionOf(Group group) {
  return kGroupSections[static_cast<std::size_t>(group)];
}

// What the model of an output has, which decides on some of its items.
class Present {
 public:
  explicit Present(const Output& output) {
    auto& object = const_cast<Output&>(output);
    auto* module = object.parts<MudTransportExpandedParts>();
    salinity_ = carriesSalinity(object);
    waves_ = module != nullptr && module->nmtExpForcings->includeWaves != 0;
  }
  bool has(const ExpOutputItem& item) const {
    return item.needs == Needs::nothing || (item.needs == Needs::salinity ? salinity_ : waves_);
  }

 private:
  bool salinity_ = false;
  bool waves_ = false;
};

// An item that the model does not have is 0.
void putItem(KvsFile& file, const ExpOutputItem& item, bool isChosen, const Present& present) {
  if (present.has(item)) {
    kvsPutParam(file, item.keyword, isChosen);
  } else {
    kvsPutParam(file, item.keyword, 0);
  }
}

void getItem(KvsSection from, const ExpOutputItem& item, std::uint8_t& flag) {
  bool isChosen = flag != 0;
  kvsGetParam(from, item.keyword, &isChosen, 1, 1);
  flag = isChosen ? 1 : 0;
}

void saveGroup(const Output& output, KvsFile& file, Group group) {
  const Present present(output);
  const std::vector<ExpOutputItem> items = expOutputItems(output.layers, output.fractions);
  kvsAddSection(file, sectionOf(group));
  for (std::size_t i = 0; i < std::min(items.size(), output.items.size()); ++i) {
    if (items[i].group == group) putItem(file, items[i], output.items[i] != 0, present);
  }
  kvsEndSection(file);
}

}  // namespace

std::vector<ExpOutputItem> expOutputItems(int layers, int fractions) {
  std::vector<ExpOutputItem> items;
  Group group = Group::main;
  const auto one = [&](std::string_view keyword, Needs needs = Needs::nothing) {
    items.push_back({std::string(keyword), group, needs});
  };
  const auto each = [&](const Text& keyword, int count) {
    for (int number = 1; number <= count; ++number) one(formatted(keyword, number));
  };
  one("Salinity", Needs::salinity);
  each({"SSC_Fraction_%d"}, fractions);
  for (int layer = 1; layer <= layers; ++layer) {
    for (int fraction = 1; fraction <= fractions; ++fraction)
      one(formatted({"Bed_Mass_Layer_%d_Fraction_%d"}, layer, fraction));
  }
  group = Group::derived;
  each({"Bed_Thickness_Layer_%d"}, layers);
  each({"Net_Deposition_Fraction_%d"}, fractions);
  each({"Net_Deposition_Accumulated_Fraction_%d"}, fractions);
  one("Net_Deposition_Accumulated_Total");
  one("Total_Bed_Thickness_Change");
  one("Total_Bed_Mass_Change");
  one("Total_Ssc");
  group = Group::process;
  one("Bed_Shear_Stress");
  each({"Fall_Velocity_Fraction_%d"}, fractions);
  each({"Deposition_Fraction_%d"}, fractions);
  each({"Erosion_Fraction_%d"}, fractions);
  one("U_Velocity");
  one("V_Velocity");
  one("Wave_Height", Needs::waves);
  one("Wave_Period", Needs::waves);
  one("Wave_Direction", Needs::waves);
  return items;
}

void CNmtExpResultObjectKvs::SetItemCounts(int newLayers, int newFractions) {
  newLayers = std::max(newLayers, 0);
  newFractions = std::max(newFractions, 0);
  if (!items.empty() && layers == newLayers && fractions == newFractions) return;
  std::unordered_map<std::string, std::uint8_t> held;
  const std::vector<ExpOutputItem> before = expOutputItems(layers, fractions);
  for (std::size_t i = 0; i < std::min(before.size(), items.size()); ++i) held[before[i].keyword] = items[i];
  const std::vector<ExpOutputItem> after = expOutputItems(newLayers, newFractions);
  items.assign(after.size(), 0);
  for (std::size_t i = 0; i < after.size(); ++i) {
    if (const auto found = held.find(after[i].keyword); found != held.end()) items[i] = found->second;
  }
  layers = newLayers;
  fractions = newFractions;
}

void CNmtExpResultObjectKvs::Rebuild() {
  SetItemCounts(layerCount(*this), fractionCount(*this));
}

int CNmtExpResultObjectKvs::WrittenItems() const {
  const Present present(*this);
  const std::vector<ExpOutputItem> all = expOutputItems(layers, fractions);
  int count = 0;
  for (std::size_t i = 0; i < std::min(all.size(), items.size()); ++i)
    count += items[i] != 0 && present.has(all[i]) ? 1 : 0;
  return count;
}

unsigned CNmtExpResultObjectKvs::Validate(ValidationList& messages, int) {
  const unsigned faults = checkTransportOutput(messages, *this, PageId::mtExpResult, *this);
  if (WrittenItems() != 0) return faults;
  return faults + report(messages, PageId::mtExpResult, Severity::fault, texts::noOutputComponents);
}

void CNmtExpResultObjectKvs::ItemsRow::save(const Self& output, KvsFile& file, const std::string&) const {
  for (const Group group : kGroups) saveGroup(output, file, group);
  kvsPutParam(file, kCount, output.WrittenItems());
}

void CNmtExpResultObjectKvs::ItemsRow::load(Self& output, KvsSection from, const std::string&) const {
  const std::vector<ExpOutputItem> items = expOutputItems(output.layers, output.fractions);
  for (const Group group : kGroups) {
    const KvsSection section = kvsSectionByNameNum(from, sectionOf(group), 1);
    for (std::size_t i = 0; section != nullptr && i < std::min(items.size(), output.items.size()); ++i) {
      if (items[i].group == group) getItem(section, items[i], output.items[i]);
    }
  }
}

void CNmtExpResultObjectKvs::ItemsRow::copy(Self& output, const Self& other) const {
  output.items = other.items;
  output.layers = other.layers;
  output.fractions = other.fractions;
}

bool CNmtExpResultObjectKvs::ItemsRow::access(Self& output, std::string_view path, PathAccess& access) const {
  if (!access.onlySections && sameName(path, kCount)) {
    access.isWrittenOnly = true;
    if (access.what == PathAccess::What::write) kvsPutParam(*access.out, kCount, output.WrittenItems());
    return true;
  }
  const PathStep step = stepOf(path);
  const auto group =
      std::ranges::find_if(kGroups, [&](Group it) { return sameName(step.first, sectionOf(it)); });
  if (group == kGroups.end()) return false;
  if (step.isLast()) {
    access.isSection = true;
    if (access.what == PathAccess::What::write) saveGroup(output, *access.out, *group);
    return true;
  }
  if (access.onlySections) return false;
  const std::vector<ExpOutputItem> items = expOutputItems(output.layers, output.fractions);
  for (std::size_t i = 0; i < std::min(items.size(), output.items.size()); ++i) {
    if (items[i].group != *group || !sameName(step.rest, items[i].keyword)) continue;
    if (access.what == PathAccess::What::write)
      putItem(*access.out, items[i], output.items[i] != 0, Present(output));
    if (access.what == PathAccess::What::set) getItem(access.in, items[i], output.items[i]);
    return true;
  }
  return false;
}

void CNmtExpResultKvs::SetItemCounts(int layers, int fractions) {
  for (int number = 1; number <= outputs.GetCount(); ++number)
    outputs.at(number).SetItemCounts(layers, fractions);
}

bool CNmtExpResultKvs::hydrodynamicHotStart() {
  auto* flow = parts<HydrodynamicParts>();
  return flow != nullptr && flow->nhdResult->generateHotStart;
}

int CNmtExpResultKvs::itemsOfHotStart() {
  return ExpandedMudEntries::count(*this) + layerCount(*this) * fractionCount(*this);
}

}  // namespace gridbay
