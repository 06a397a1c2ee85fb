#pragma once

#include <span>
#include <string>

#include "platform/result.h"

namespace gridbay::cli {

// Whether a command may write a file: one that is there already only by `force`, and one that the command
// reads not at all, whatever name or link it goes by.
Outcome mayWrite(const std::string& path, bool force, std::span<const std::string> inputs);

}  // namespace gridbay::cli
