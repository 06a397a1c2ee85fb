#include "advection_dispersion/starting_conditions.h"

#include <optional>
#include <vector>

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

constexpr int kHotStartDataType = 2;
constexpr int kTypeItems = 1;  // behind those of the components

// The type in a cell of the types' item, cut to a whole number; nothing for one that a file cannot bring.
std::optional<std::int32_t> typeIn(float cell) {
  if (!(cell > -1 && cell < CNadComponentObjectKvs::kHeatDissipating + 1)) return std::nullopt;
  return static_cast<std::int32_t>(cell);
}

}  // namespace

void CNadHotStartObjectKvs::RequestFile(CVdFileSelectorDlg& selector, int number) {
  auto* module = parts<AdvectionDispersionParts>();
  const int components = module == nullptr ? 0 : module->nadComponent->GetCount();
  requestArea(selector, *this, number);
  selector.SetDataType(kHotStartDataType);
  if (number == 1) {
    selector.SetMinNoItems(1 + kTypeItems);
  } else {
    selector.SetNoItems(components + kTypeItems);
  }
  selector.SetVane27Compliant();
}

unsigned CNadHotStartObjectKvs::Validate(ValidationList& messages, int, int number) {
  CVdFileSelectorDlg selector;
  RequestFile(selector, number);
  TsbHeader header;
  std::string why;
  if (tsbFileRead(file.absolute(), &header, &why) != 0 || !selector.IsTsbFileValid(header, &why))
    return reportDataFile(messages, CNadStartingConditionsKvs::kPage, file, why, Reason::left,
                          Severity::dependedUpon);
  const unsigned faults = number == 1 ? takeComponents(messages, header) : 0;
  tsbFileClose(&header);
  tsbHeaderDestroy(&header);
  return faults;
}

// Component i has the name of item i, and the type in cell i (from 0) of the last item, so that the first
// cell is not used. Nothing changes before the types have been read.
unsigned CNadHotStartObjectKvs::takeComponents(ValidationList& messages, TsbHeader& header) {
  const int count = tsbGetNoOfItems(header) - kTypeItems;
  std::vector<float> types(header.file->definition().pointCount());
  if (tsbFindItemDynamic(&header, 0, count + kTypeItems) != 0 || tsbReadItemTimeStep(header, types) != 0)
    return reportDataFile(messages, CNadStartingConditionsKvs::kPage, file, {}, Reason::left,
                          Severity::dependedUpon);
  auto* module = parts<AdvectionDispersionParts>();
  if (module == nullptr) return 0;
  CNadComponentKvs& components = *module->nadComponent;
  components.SetCount(count);
  unsigned faults = 0;
  for (int i = 1; i <= count; ++i) {
    CNadComponentObjectKvs& component = components.at(i);
    component.name = tsbItemD(header, i)->name;
    const auto cell = static_cast<std::size_t>(i);
    const std::optional<std::int32_t> type = cell < types.size() ? typeIn(types[cell]) : std::nullopt;
    if (type) {
      component.type = *type;
    } else {
      faults += report(messages, CNadStartingConditionsKvs::kPage, Severity::dependedUpon,
                       texts::hotStartTypeNotValid, i, file.text());
    }
  }
  return faults;
}

}  // namespace gridbay
