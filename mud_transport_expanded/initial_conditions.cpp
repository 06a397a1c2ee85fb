#include "mud_transport_expanded/initial_conditions.h"

#include <numeric>

#include "core/table_code.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {
namespace {

using Initial = CNmtExpInitialConditionsKvs;

constexpr PageId kPage = PageId::mtExpInitialConditions;
constexpr float kNewSalinity = 40;  // PSU
constexpr Text kFractionSection{"SEDIMENT_FRACTION_%d"};
constexpr std::string_view kSalinitySection = "Salinity";

int salinityEntries(const Initial& object) {
  return carriesSalinity(const_cast<Initial&>(object)) ? 1 : 0;
}

// A new entry has its areas at once.
template <class Entry>
void startEntry(CKvsBase& owner, Entry& entry, int) {
  entry.SetCount(areaCount(owner));
}

void shareLayer(CKvsBase& owner, CNmtExpBedDistributionObjectKvs& layer, int) {
  layer.Share(fractionCount(owner));
}

}  // namespace

template <ExpInitial what>
unsigned ExpInitialObject<what>::Check(ValidationList& messages, std::int32_t givenAs, int area) {
  unsigned faults = 0;
  if (givenAs == kMap) {
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, 0, area);
    faults += checkDataFile(messages, kPage, selector, this->file);
  }
  if (this->value < 0)
    faults +=
        report(messages, kPage, Severity::fault,
               what == ExpInitial::thickness ? texts::bedThicknessNegative : texts::expConcentrationNegative);
  return faults;
}

template <ExpInitial what>
void ExpInitialObject<what>::RequestDataFile(CVdFileSelectorDlg& selector, int, int area) {
  requestMap(selector, *this, area, texts::expInitialRequest, {});
  requestSimulationPeriod(selector, *this);
  selector.AllowOneTimeStep();
}

// The salinity is the first of the components, where it is included.
template <ExpInitial what>
float ExpInitialEntry<what>::newValue() {
  if constexpr (what == ExpInitial::concentration) {
    auto* module = this->template parts<MudTransportExpandedParts>();
    if (module != nullptr && carriesSalinity(*this) &&
        module->nmtExpInitialConditions->components.GetItem(1) == this)
      return kNewSalinity;
  }
  return 0;
}

template class ExpInitialObject<ExpInitial::concentration>;
template class ExpInitialObject<ExpInitial::thickness>;
template class ExpInitialEntry<ExpInitial::concentration>;
template class ExpInitialEntry<ExpInitial::thickness>;

void CNmtExpBedDistributionObjectKvs::Share(int fractions) {
  constexpr std::int32_t kWhole = 100;
  percentages.clear();
  if (fractions <= 0) return;
  percentages.assign(static_cast<std::size_t>(fractions), kWhole / fractions);
  percentages.front() += kWhole % fractions;
}

unsigned CNmtExpBedDistributionObjectKvs::Validate(ValidationList& messages, int) {
  constexpr std::int64_t kWhole = 100;
  if (std::accumulate(percentages.begin(), percentages.end(), std::int64_t{0}) == kWhole) return 0;
  return report(messages, kPage, Severity::fault, texts::bedDistributionNot100);
}

CNmtExpInitialConditionsKvs::CNmtExpInitialConditionsKvs(CKvsBase* parent)
    : TableKvs(parent),
      components(this, startEntry<CNmtExpInitialComponentKvs>),
      thicknesses(this, startEntry<CNmtExpInitialThicknessKvs>),
      distribution(this, shareLayer) {}

void CNmtExpInitialConditionsKvs::SetCounts(int entries, int layers, int fractions) {
  components.SetCount(entries);
  thicknesses.SetCount(layers);
  const CNmtExpBedDistributionObjectKvs* first = distribution.GetItem(1);
  const bool isSame = distribution.GetCount() == layers &&
                      (first == nullptr || static_cast<int>(first->percentages.size()) == fractions);
  if (isSame) return;
  distribution.SetCount(layers);
  for (int layer = 1; layer <= distribution.GetCount(); ++layer) distribution.at(layer).Share(fractions);
}

void CNmtExpInitialConditionsKvs::SetNoAreas(int n) {
  for (int entry = 1; entry <= components.GetCount(); ++entry) components.at(entry).SetCount(n);
  for (int layer = 1; layer <= thicknesses.GetCount(); ++layer) thicknesses.at(layer).SetCount(n);
}

unsigned CNmtExpInitialConditionsKvs::Validate(ValidationList& messages, int deep) {
  unsigned faults = 0;
  const auto check = [&](auto& list) {
    for (int number = 1; deep != 0 && number <= list.GetCount(); ++number)
      faults += checkedEntry(messages, {number, list.GetCount()},
                             [&] { return list.at(number).Validate(messages, deep); });
  };
  check(components);
  check(thicknesses);
  check(distribution);
  return faults;
}

void CNmtExpInitialConditionsKvs::ComponentsRow::save(const Self& object, KvsFile& file,
                                                      const std::string& documentPath) const {
  auto& entries = const_cast<Self&>(object).components;
  const int salinity = salinityEntries(object);
  const auto put = [&](std::string_view name, int entry) {
    kvsAddSection(file, name);
    entries.at(entry).Save(file, documentPath);
    kvsEndSection(file);
  };
  NumberedText name(kFractionSection);
  for (int entry = 1 + salinity; entry <= entries.GetCount(); ++entry) put(name.of(entry - salinity), entry);
  if (salinity != 0 && entries.GetCount() > 0) put(kSalinitySection, 1);
}

void CNmtExpInitialConditionsKvs::ComponentsRow::load(Self& object, KvsSection from,
                                                      const std::string& documentPath) const {
  const int salinity = salinityEntries(object);
  NumberedText name(kFractionSection);
  for (int entry = 1; entry <= object.components.GetCount(); ++entry) {
    const bool isSalinity = entry <= salinity;
    const KvsSection section =
        kvsSectionByNameNum(from, isSalinity ? kSalinitySection : name.of(entry - salinity), 1);
    if (section != nullptr) object.components.at(entry).Load(section, documentPath);
  }
}

bool CNmtExpInitialConditionsKvs::ComponentsRow::access(Self& object, std::string_view path,
                                                        PathAccess& access) const {
  const PathStep step = stepOf(path);
  const int salinity = salinityEntries(object);
  const bool isSalinity = salinity != 0 && sameName(step.first, kSalinitySection);
  const std::optional<int> fraction = numberIn(step.first, kFractionSection);
  if (!isSalinity && (!fraction || *fraction < 1)) return false;
  CNmtExpInitialComponentKvs* entry = object.components.GetItem(isSalinity ? 1 : *fraction + salinity);
  if (entry == nullptr) return false;
  if (!step.isLast()) return entry->AccessPath(step.rest, access);
  access.isSection = true;
  if (access.what == PathAccess::What::write) {
    kvsAddSection(*access.out,
                  isSalinity ? std::string(kSalinitySection) : formatted(kFractionSection, *fraction));
    entry->Save(*access.out, *access.documentPath);
    kvsEndSection(*access.out);
  }
  return true;
}

}  // namespace gridbay
