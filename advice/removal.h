#pragma once

#include <string>

#include "advice/advice.h"

namespace gridbay {

class CGlobalKvs;

// Takes out of the model what a fix says. An entry that there is not is a std::invalid_argument.
void makeRemoval(CGlobalKvs& model, const AdviceRemoval& removal);

// "weir 2", "equal points of dike 1"
std::string textOf(const AdviceRemoval& removal);

}  // namespace gridbay
