#pragma once

#include <string>
#include <string_view>

#include "core/parameter_tree.h"
#include "platform/result.h"

namespace gridbay {

// Takes the text of a file piece by piece.
class TextSink {
 public:
  virtual ~TextSink() = default;
  virtual Outcome write(std::string_view text) = 0;
};

// Writes what a section holds as KDL 2.0, four blanks for each level: an empty section as NAME {}, texts in
// quotes, file names behind (file) and result file names behind (result). Fails where the sink does, and for
// a text that is not UTF-8.
Outcome writeKdl(const Node& section, TextSink& sink);

// The same as one text; what a user reads or an error in it.
Result<std::string> kdlText(const Node& section);

// One value as it stands on file.
std::string valueText(const Value& value);

}  // namespace gridbay
