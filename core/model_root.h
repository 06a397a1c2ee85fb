#pragma once

#include <memory>
#include <span>

#include "core/kvs_base.h"

namespace gridbay {

// What the module that runs beside hydrodynamics writes, as it is set up now.
struct ModuleOutput {
  double megabytes = 0;
  int hotStartItems = 0;  // in the hot start file of an area
};

// What a part may ask of the root of its model beside its members, which each room declares for itself.
class ModelRoot : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;

  // Tells all lists that follow this one, in their order, what its counts are now; a list has one.
  virtual void TellFollowers(const CKvsBase& leader, std::span<const int> counts) = 0;

  // The areas have other grids than before.
  virtual void TellOfGrids() {}

  virtual ModuleOutput OutputOfModule() { return {}; }
};

// Makes what a room has in the root. To be called in one place for each: all code of the objects follows from
// it.
template <class... Members>
void makeMembers(CKvsBase& root, std::unique_ptr<Members>&... members) {
  ((members = std::make_unique<Members>(&root)), ...);
}

}  // namespace gridbay
