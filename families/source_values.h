#pragma once

#include "families/data_files.h"
#include "families/entry_constants.h"

namespace gridbay {

// What one source brings with its water. `Self::kPage` is the page of its messages.
template <class Self, class Module>
class SourceValuesKvs : public EntryConstantsKvs<Self, Module> {
 public:
  enum Format : std::int32_t { kConstant = 0, kTimeSeries = 1 };

  using EntryConstantsKvs<Self, Module>::EntryConstantsKvs;
  using EntryConstantsKvs<Self, Module>::Validate;

  // Number of the source, from 1, which says what it is.
  unsigned Validate(ValidationList& messages, int, int number) {
    if (this->format == kConstant) return this->CheckConstants(messages, number);
    if (this->format < kConstant) return 0;
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, number);
    return checkDataFile(messages, Self::kPage, selector, this->file);
  }

  void RequestDataFile(CVdFileSelectorDlg& selector, int number) {
    Module::requestSourceItems(selector, *this, number);
    selector.SetDimensions(0);
    requestSimulationPeriod(selector, *this);
    requestForEngine(selector);
  }
};

// What all sources bring; follows their count.
template <class Self, class Item>
class SourceValuesListKvs : public EntryConstantsListKvs<Self, Item> {
 public:
  using EntryConstantsListKvs<Self, Item>::EntryConstantsListKvs;
};

}  // namespace gridbay
