#pragma once

#include <functional>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

#include "core/number_text.h"

namespace gridbay::cli {

// What `info` tells, in the order in which it tells it.
using Json = nlohmann::ordered_json;

// Takes a line for the reader: what it is about, and what there is to say.
using Line = std::function<void(std::string_view label, const std::string& text)>;

// A number as the digits tell it that it has in its own width: 0.1 of 32 bits is 0.1.
template <class Number>
double plain(double value) {
  return doubleOfText(NumberText(static_cast<Number>(value)).view()).value_or(value);
}

}  // namespace gridbay::cli
