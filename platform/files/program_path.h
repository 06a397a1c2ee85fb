#pragma once

#include <string>

namespace gridbay {

// Where the program and its parts are. In a build folder all lie beside each other; what is installed is
// found from where the program, or the library that holds this code, lies below its prefix, so that a prefix
// can be moved as a whole.
class CKTOConfigFiles {
 public:
  // The folder of help pages and templates; with `withSeparator` 1 it ends in a slash. Empty where the system
  // does not tell.
  static std::string GetProgramPath(int withSeparator);
};

// The folder of what is loaded when it is wanted: the editors' plug-ins and the raster reader.
std::string pluginFolder();

}  // namespace gridbay
