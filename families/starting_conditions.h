#pragma once

#include <cstdint>

#include "core/list_kvs.h"
#include "families/data_files.h"

// How the calculation of a module begins: cold, or hot from a file for each area; and when. The modules
// differ in their keywords, in the page of their messages, and in what they ask of a hot start file and take
// from it.

namespace gridbay {

// The last time step of the simulation; 0 for an object that stands in no whole model.
std::int32_t lastTimeStep(CKvsBase& object);

// Whether the model as a whole begins hot: only then may a module.
bool isHotModel(CKvsBase& object);

// Messages for a range of time steps that lies outside of the simulation. Returns the number of faults.
unsigned checkTimeSteps(CKvsBase& object, ValidationList& messages, PageId page, std::int32_t first,
                        std::int32_t last);

// The hot start file of an area. `Self` checks it by
//   unsigned Validate(ValidationList& messages, int deep, int area)   area from 1
template <class Self>
class HotStartFileKvs : public TableKvs<Self> {
 public:
  using TableKvs<Self>::TableKvs;
  using TableKvs<Self>::Validate;

  UFileName file;

  static constexpr auto table() { return section("DATA_FILE", keyword("File_Name", &Self::file)); }
};

// The files of all areas, and whether they are used; follows the count of areas.
template <class Self, class HotFile>
class HotStartKvs : public ListKvs<Self, HotFile> {
 public:
  using ListKvs<Self, HotFile>::ListKvs;

  bool hotStart = false;

  // In area order, each with its number: what the file of area 1 changes in the model holds for the others.
  unsigned Validate(ValidationList& messages, int deep) override {
    return hotStart ? ListKvs<Self, HotFile>::Validate(messages, deep) : 0;
  }

 protected:
  // In a model that begins cold the flag is cleared, whatever the file says.
  struct LoadInHotModel {
    void load(HotStartKvs& object, KvsSection from, const std::string& documentPath) const {
      if (isHotModel(object)) {
        getValue(from, "Hot_Start", object.hotStart, documentPath);
      } else {
        object.hotStart = false;
      }
    }
  };
  // The rows of the table.
  static constexpr auto hotStartRow() {
    return loadedAs(keyword("Hot_Start", &HotStartKvs::hotStart), LoadInHotModel{});
  }
  static constexpr auto hotFileRows() { return items("AREA_%d"); }
};

// The same with the hydrodynamic time steps over which the module runs. `Self::kPage` is the page of the
// messages.
template <class Self, class HotFile>
class StartingConditionsKvs : public HotStartKvs<Self, HotFile> {
 public:
  explicit StartingConditionsKvs(CKvsBase* parent)
      : HotStartKvs<Self, HotFile>(parent), lastStep(lastTimeStep(*this)) {}

  std::int32_t firstStep = 0;
  std::int32_t lastStep;

  unsigned Validate(ValidationList& messages, int deep) override {
    const unsigned faults = checkTimeSteps(*this, messages, Self::kPage, firstStep, lastStep);
    return faults + HotStartKvs<Self, HotFile>::Validate(messages, deep);
  }
};

}  // namespace gridbay
