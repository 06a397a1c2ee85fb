#include "advection_dispersion/component.h"

#include "core/table_code.h"

namespace gridbay {

unsigned CNadComponentObjectKvs::Validate(ValidationList& messages, int) {
  if (type <= kHeatDissipating) return 0;
  return report(messages, PageId::adComponent, Severity::fault, texts::wrongComponentType);
}

// Followers hear of the count that is read, not of the list being emptied.
void CNadComponentKvs::Load(KvsSection section, const std::string& documentPath) {
  itemList().SetCount(0);
  ListKvs::Load(section, documentPath);
}

unsigned CNadComponentKvs::Validate(ValidationList& messages, int deep) {
  const auto fault = [&messages](const Text& text) {
    return report(messages, PageId::adComponent, Severity::fault, text);
  };
  unsigned faults = 0;
  if (GetCount() < 1 || GetCount() > kMostComponents) faults += fault(texts::componentCount);
  faults += ListKvs::Validate(messages, deep);
  if (CountOfType(CNadComponentObjectKvs::kHeatExchange) > 1) faults += fault(texts::oneHeatExchange);
  return faults;
}

int CNadComponentKvs::CountOfType(std::int32_t type) const {
  int count = 0;
  for (int number = 1; number <= GetCount(); ++number) count += GetItem(number)->type == type ? 1 : 0;
  return count;
}

int CNadComponentKvs::NumberOfType(std::int32_t type, int n) const {
  constexpr int kNone = -1;
  for (int number = 1; n >= 1 && number <= GetCount(); ++number) {
    if (GetItem(number)->type == type && --n == 0) return number;
  }
  return kNone;
}

}  // namespace gridbay
