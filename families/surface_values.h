#pragma once

#include "families/data_files.h"
#include "families/entry_constants.h"

namespace gridbay {

// What goes with the water that rains, evaporates or infiltrates all over the model, in the section
// `Self::kSection`. A new one has the format `Self::kFormat`; `Self::kPage` is the page of its messages.
// `Self` may have
//   bool Applies()    whether there is such water: without it nothing is checked
//   static constexpr Text kFileNotValid    in place of the usual text for a file that is not what it must be
template <class Self, class Module>
class SurfaceValuesKvs : public EntryConstantsKvs<Self, Module> {
 public:
  enum Format : std::int32_t { kFromAmbientWater = -3, kConstant = -1, kTimeSeries = 0, kMap = 2 };

  explicit SurfaceValuesKvs(CKvsBase* parent) : EntryConstantsKvs<Self, Module>(parent) {
    this->format = Self::kFormat;
  }

  static constexpr auto table() { return section(Self::kSection, EntryConstantsKvs<Self, Module>::table()); }

  bool IsFile() const { return this->format == kTimeSeries || this->format == kMap; }

  unsigned Validate(ValidationList& messages, int) override {
    if constexpr (requires(Self & self) { self.Applies(); }) {
      if (!static_cast<Self&>(*this).Applies()) return 0;
    }
    if (this->format == kConstant) return this->CheckConstants(messages);
    if (!IsFile()) return 0;
    CVdFileSelectorDlg selector;
    RequestDataFile(selector);
    if constexpr (requires { Self::kFileNotValid; }) {
      ValidationList usual;
      const bool isValid = checkDataFile(usual, Self::kPage, selector, this->file) == 0;
      messages.files.insert(messages.files.end(), usual.files.begin(), usual.files.end());
      if (isValid) return 0;
      return report(messages, Self::kPage, Severity::fault, Self::kFileNotValid, this->file.fileName.text());
    } else {
      return checkDataFile(messages, Self::kPage, selector, this->file);
    }
  }

  // What the data file must be: an item for each entry, and a map of Area 1 where it is one.
  void RequestDataFile(CVdFileSelectorDlg& selector) {
    Module::requestItems(selector, *this);
    if (this->format == kMap) {
      requestArea(selector, *this, 1);
      selector.AllowOneTimeStep();
    } else {
      selector.SetDimensions(0);
    }
    requestSimulationPeriod(selector, *this);
    requestForEngine(selector);
  }
};

}  // namespace gridbay
