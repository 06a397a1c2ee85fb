#pragma once

#include <string>
#include <vector>

#include "core/kvs_base.h"

namespace gridbay {

// The names of the components, which are the entries of this module's lines, boxes and mass files; none for
// an object that stands in no whole model.
std::vector<std::string> componentNames(CKvsBase& object);
int componentCount(CKvsBase& object);

}  // namespace gridbay
