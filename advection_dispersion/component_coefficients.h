#pragma once

#include "advection_dispersion/component.h"
#include "advection_dispersion/transported.h"
#include "families/area_values.h"

namespace gridbay {

// A coefficient of one component, which may vary in time. `Self` says what is asked of its file by
// `kDescription` and `kQuantity`.
template <class Self>
class ComponentCoefficientKvs : public ValueOrFileKvs<Self> {
 public:
  static constexpr std::int32_t kTimeSeries = 1;

  using ValueOrFileKvs<Self>::ValueOrFileKvs;

  void RequestDataFile(CVdFileSelectorDlg& selector, int) {
    requestTimeSeries(selector, *this, Self::kDescription, Self::kQuantity);
  }
};

// A coefficient for each component, of which only those of the type `Self::kComponentType` mean anything. All
// are on file, in the section `Self::kSection`; `Self::kMissing` is the text for one that is not there, and
// `Self::kPage` the page of the messages.
template <class Self, class Item>
class ComponentCoefficientsKvs : public ListKvs<Self, Item> {
 public:
  using ListKvs<Self, Item>::ListKvs;

  static constexpr auto table() { return section(Self::kSection, items("COMPONENT_%d", Self::kMissing)); }

  unsigned Validate(ValidationList& messages, int deep) override {
    CNadComponentKvs* components = componentsOf(*this);
    unsigned faults = 0;
    for (int number = 1; number <= this->GetCount(); ++number) {
      const CNadComponentObjectKvs* component = components == nullptr ? nullptr : components->GetItem(number);
      Item& item = *this->GetItem(number);
      if (component == nullptr) {
        faults += report(messages, Self::kPage, Severity::fault, texts::noSuchComponent, number);
      } else if (deep != 0 && component->type == Self::kComponentType && item.format == Item::kTimeSeries) {
        CVdFileSelectorDlg selector;
        item.RequestDataFile(selector, number);
        faults += checkDataFile(messages, Self::kPage, selector, item.file);
      }
    }
    return faults;
  }

  // How many components the coefficient means anything to; the number of the n-th of them, from 1, or -1; and
  // its coefficient, or null.
  int MeantCount() {
    CNadComponentKvs* components = componentsOf(*this);
    return components == nullptr ? 0 : components->CountOfType(Self::kComponentType);
  }
  int MeantNumber(int n) {
    CNadComponentKvs* components = componentsOf(*this);
    return components == nullptr ? -1 : components->NumberOfType(Self::kComponentType, n);
  }
  Item* MeantItem(int n) { return this->GetItem(MeantNumber(n)); }
};

}  // namespace gridbay
