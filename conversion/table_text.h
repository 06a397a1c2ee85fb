#pragma once

#include <string>
#include <string_view>

#include "platform/result.h"

namespace gridbay {

// The text of a table as UTF-8 with lines that end in a line feed, whatever it is written in: UTF-8 or
// UTF-16, with a mark of that or without, and else the characters of Western Europe (Windows-1252). An error
// for what is no text.
Result<std::string> tableText(std::string_view bytes);

}  // namespace gridbay
