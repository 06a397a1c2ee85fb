#pragma once

#include <span>
#include <string>
#include <string_view>

#include "platform/result.h"

namespace gridbay {

// Whether a file may be written: one that is there already only by `force`, which its user knows by
// `forceName`, and one of the inputs not at all, whatever name or link it goes by.
Outcome mayWrite(const std::string& path, bool force, std::span<const std::string> inputs,
                 std::string_view forceName);

}  // namespace gridbay
