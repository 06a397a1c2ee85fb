#include "mud_transport/initial_concentration.h"

#include <algorithm>

#include "mud_transport/task_selection.h"
#include "mud_transport/texts.h"
#include "mud_transport/transported.h"

namespace gridbay {
namespace {

using Initial = CNmtInitialObjectKvs;
using Entry = CNmtInitialComponentKvs;
using Entries = CNmtInitialConcentrationKvs;

constexpr Text kArea{"AREA_%d"};
constexpr Text kComponent{"COMPONENT_%d"};
constexpr Text kLayer{"LAYER_%d"};
constexpr std::string_view kSalinity = "SALINITY_COMPONENT";
constexpr std::string_view kThickness = "BED_THICKNESS";

// What the areas of a layer have in common, and what each has of its own.
constexpr auto kShared =
    keywords(Initial::formatRow(), keyword("Constant_Value", &ValueOrFileKvs<Initial>::value));
constexpr auto kOwn = keywords(selection(&ValueOrFileKvs<Initial>::file, 1));

// How the entries stand on file.
struct Arrangement {
  bool hasSalinitySection;
  bool hasLayers;
  int concentrations;  // before the thicknesses

  explicit Arrangement(Entries& entries) {
    const CNmtTaskSelectionKvs* task = mudTaskOf(entries);
    hasLayers = task != nullptr && !task->multiFraction;
    hasSalinitySection = hasLayers && task->includeSalinity;
    concentrations = hasLayers ? std::min(task->TransportedCount(), entries.GetCount()) : entries.GetCount();
  }
  // The section of a concentration; and its number by that, or 0 for none.
  std::string sectionOf(int entry) const {
    if (!hasSalinitySection) return formatted(kComponent, entry);
    return entry == 1 ? std::string(kSalinity) : formatted(kComponent, entry - 1);
  }
  int entryOf(std::string_view sectionName) const {
    if (hasSalinitySection && sameName(sectionName, kSalinity)) return 1;
    const std::optional<int> number = numberIn(sectionName, kComponent);
    if (!number || *number < 1 || *number > concentrations) return 0;
    const int entry = *number + (hasSalinitySection ? 1 : 0);
    return entry <= concentrations ? entry : 0;
  }
};

void saveLayers(Entries& entries, const Arrangement& arrangement, KvsFile& file,
                const std::string& documentPath) {
  kvsAddSection(file, kThickness);
  for (int entry = arrangement.concentrations + 1; entry <= entries.GetCount(); ++entry) {
    kvsAddSection(file, formatted(kLayer, entry - arrangement.concentrations));
    entries.GetItem(entry)->Save(file, documentPath, true);
    kvsEndSection(file);
  }
  kvsEndSection(file);
}

bool accessLayers(Entries& entries, const Arrangement& arrangement, std::string_view path,
                  PathAccess& access) {
  if (path.empty()) {
    access.isSection = true;
    if (access.what == PathAccess::What::write)
      saveLayers(entries, arrangement, *access.out, *access.documentPath);
    return true;
  }
  const PathStep step = stepOf(path);
  const std::optional<int> number = numberIn(step.first, kLayer);
  if (!number || *number < 1 || *number > entries.GetCount() - arrangement.concentrations) return false;
  Entry& layer = *entries.GetItem(arrangement.concentrations + *number);
  if (!step.isLast()) return layer.AccessPath(step.rest, access, true);
  access.isSection = true;
  if (access.what == PathAccess::What::write) {
    kvsAddSection(*access.out, formatted(kLayer, *number));
    layer.Save(*access.out, *access.documentPath, true);
    kvsEndSection(*access.out);
  }
  return true;
}

}  // namespace

void Initial::RequestDataFile(CVdFileSelectorDlg& selector, int entry, int area) {
  const CNmtTaskSelectionKvs* task = mudTaskOf(*this);
  const bool isThickness = task != nullptr && task->IsThickness(entry);
  const std::string name = isThickness ? task->EntryName(entry) : std::string();
  requestMap(selector, *this, area, isThickness ? Text{name} : texts::mtInitialConditionRequest, {});
  requestSimulationPeriod(selector, *this);
  selector.AllowOneTimeStep();
}

void Entry::Save(KvsFile& file, const std::string& documentPath, bool isThickness) {
  if (!isThickness) {
    Save(file, documentPath);
    return;
  }
  if (GetCount() > 0) kShared.save(at(1), file, documentPath);
  for (int area = 1; area <= GetCount(); ++area) {
    kvsAddSection(file, formatted(kArea, area));
    kOwn.save(at(area), file, documentPath);
    kvsEndSection(file);
  }
}

void Entry::Load(KvsSection section, const std::string& documentPath, bool isThickness) {
  if (!isThickness) {
    Load(section, documentPath);
    return;
  }
  if (GetCount() > 0) kShared.load(at(1), section, documentPath);
  for (int area = 1; area <= GetCount(); ++area)
    kOwn.load(at(area), kvsSectionByNameNum(section, formatted(kArea, area), 1), documentPath);
}

bool Entry::AccessPath(std::string_view path, PathAccess& access, bool isThickness) {
  if (!isThickness) return AccessPath(path, access);
  const PathStep step = stepOf(path);
  const std::optional<int> number = numberIn(step.first, kArea);
  Initial* value = number ? GetItem(*number) : nullptr;
  if (value == nullptr) return GetCount() > 0 && kShared.access(at(1), path, access);
  if (!step.isLast()) return kOwn.access(*value, step.rest, access);
  access.isSection = true;
  if (access.what == PathAccess::What::write) {
    kvsAddSection(*access.out, formatted(kArea, *number));
    kOwn.save(*value, *access.out, *access.documentPath);
    kvsEndSection(*access.out);
  }
  return true;
}

unsigned Entry::Validate(ValidationList& messages, int deep, int entry) {
  const CNmtTaskSelectionKvs* task = mudTaskOf(*this);
  const bool isThickness = task != nullptr && task->IsThickness(entry);
  unsigned faults = 0;
  for (int area = 1; deep != 0 && area <= GetCount(); ++area) {
    if (at(FormatArea(area, isThickness)).format != Initial::kMap) continue;
    CVdFileSelectorDlg selector;
    at(area).RequestDataFile(selector, entry, area);
    faults += checkedEntry(messages, {area, GetCount()}, [&] {
      return checkDataFile(messages, PageId::mtInitialConcentration, selector, at(area).file);
    });
  }
  return faults;
}

void Entries::EntriesRow::save(const Entries& held, KvsFile& file, const std::string& documentPath) const {
  auto& entries = const_cast<Entries&>(held);  // to ask its model
  const Arrangement arrangement(entries);
  for (int entry = 1; entry <= arrangement.concentrations; ++entry) {
    kvsAddSection(file, arrangement.sectionOf(entry));
    entries.GetItem(entry)->Save(file, documentPath, false);
    kvsEndSection(file);
  }
  if (arrangement.hasLayers) saveLayers(entries, arrangement, file, documentPath);
}

void Entries::EntriesRow::load(Entries& entries, KvsSection from, const std::string& documentPath) const {
  const Arrangement arrangement(entries);
  const KvsSection layers =
      arrangement.hasLayers ? kvsSectionByNameNum(from, kThickness, 1) : KvsSection{nullptr};
  for (int entry = 1; entry <= entries.GetCount(); ++entry) {
    const bool isThickness = entry > arrangement.concentrations;
    const KvsSection parent = isThickness ? layers : from;
    if (parent == nullptr) break;
    const std::string name =
        isThickness ? formatted(kLayer, entry - arrangement.concentrations) : arrangement.sectionOf(entry);
    const KvsSection section = kvsSectionByNameNum(parent, name, 1);
    if (section != nullptr) entries.GetItem(entry)->Load(section, documentPath, isThickness);
  }
}

bool Entries::EntriesRow::access(Entries& entries, std::string_view path, PathAccess& access) const {
  const Arrangement arrangement(entries);
  const PathStep step = stepOf(path);
  if (arrangement.hasLayers && sameName(step.first, kThickness))
    return accessLayers(entries, arrangement, step.rest, access);
  const int entry = arrangement.entryOf(step.first);
  if (entry == 0) return false;
  if (!step.isLast()) return entries.GetItem(entry)->AccessPath(step.rest, access, false);
  access.isSection = true;
  if (access.what == PathAccess::What::write) {
    kvsAddSection(*access.out, arrangement.sectionOf(entry));
    entries.GetItem(entry)->Save(*access.out, *access.documentPath, false);
    kvsEndSection(*access.out);
  }
  return true;
}

}  // namespace gridbay
