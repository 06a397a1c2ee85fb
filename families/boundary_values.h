#pragma once

#include "basic/boundary.h"
#include "families/data_files.h"
#include "families/entry_constants.h"

namespace gridbay {

// What comes in with the water at one open boundary. `Self::kPage` is the page of its messages.
template <class Self, class Module>
class BoundaryValuesKvs : public EntryConstantsKvs<Self, Module> {
 public:
  enum Format : std::int32_t { kConstant = 0, kTimeSeries = 1, kProfile = 2 };

  using EntryConstantsKvs<Self, Module>::EntryConstantsKvs;
  using EntryConstantsKvs<Self, Module>::Validate;

  // Number of the boundary, from 1.
  unsigned Validate(ValidationList& messages, int, int number) {
    if (this->format == kConstant) return this->CheckConstants(messages, number);
    if (this->format != kTimeSeries && this->format != kProfile) return 0;
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, number);
    return checkDataFile(messages, Self::kPage, selector, this->file);
  }

  // What the data file must be: an item for each entry, and along the boundary where it is a profile.
  void RequestDataFile(CVdFileSelectorDlg& selector, int number) {
    Module::requestItems(selector, *this);
    if (this->format == kProfile) {
      auto* basic = this->template parts<BasicParts>();
      requestAlongBoundary(selector, basic == nullptr ? nullptr : basic->boundary->GetItem(number),
                           pointsByExtent);
    } else {
      selector.SetDimensions(0);
    }
    requestSimulationPeriod(selector, *this);
    requestForEngine(selector);
  }
};

// What comes in at all open boundaries; follows their count.
template <class Self, class Item>
class BoundaryValuesListKvs : public EntryConstantsListKvs<Self, Item> {
 public:
  using EntryConstantsListKvs<Self, Item>::EntryConstantsListKvs;

  static constexpr std::string_view kPlaceSection = "BOUNDARY_%d";
};

}  // namespace gridbay
