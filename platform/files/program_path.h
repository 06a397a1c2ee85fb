#pragma once

#include <string>

namespace gridbay {

// Where the program and its parts are installed.
class CKTOConfigFiles {
 public:
  // The folder of the running program; with `withSeparator` 1 it ends in a slash. Empty where the system does
  // not tell.
  static std::string GetProgramPath(int withSeparator);
};

}  // namespace gridbay
