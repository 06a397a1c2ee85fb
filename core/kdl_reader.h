#pragma once

#include <memory>
#include <string>

#include "core/parameter_tree.h"
#include "platform/files/read_file.h"

namespace gridbay {

// Where and why a text is not a parameter file. Line and column are counted from 1, the column in characters.
struct SyntaxError {
  std::size_t line = 0;
  std::size_t column = 0;
  std::string found;
  std::string expected;

  // "line 3, column 14: found "}", expected a value"
  std::string text() const;
};

struct ReadText {
  std::unique_ptr<ParameterTree> tree;  // null when the text has an error
  SyntaxError error;
};

// The deepest nesting of blocks that is read.
inline constexpr std::size_t kDeepestBlock = 512;

// Reads KDL 2.0 text in one pass. A node with a block becomes a section, any other node a keyword. What a
// parameter file cannot hold (properties, null, other type annotations than (file) and (result), a node with
// values and a block) is refused, unless it is commented out by a slashdash.
ReadText readKdl(FileText text);

}  // namespace gridbay
