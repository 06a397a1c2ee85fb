#pragma once

#include <string>
#include <vector>

#include "core/kvs_base.h"

namespace gridbay {

// What an output can be of: the state variables, whether transported or not, and the further items that the
// model works out, by their symbols in the order of its definition. An item that has no symbol is called by
// its description. None for an object that stands in no whole model.
std::vector<std::string> stateVariableNames(CKvsBase& object);
std::vector<std::string> additionalItemNames(CKvsBase& object);
int stateVariableCount(CKvsBase& object);
int additionalItemCount(CKvsBase& object);

}  // namespace gridbay
