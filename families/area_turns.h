#pragma once

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "core/kvs_base.h"

namespace gridbay {

// The area of new item `number`, both from 1: the areas in turn; 0 in a model of no areas.
inline int areaInTurn(CKvsBase& object, int number) {
  auto* basic = object.parts<BasicParts>();
  const int areas = basic == nullptr ? 0 : basic->bathymetry->GetCount();
  return areas == 0 ? 0 : (number - 1) % areas + 1;
}

}  // namespace gridbay
