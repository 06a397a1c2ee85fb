#pragma once

#include <string>

namespace gridbay {

// A keyword by its path with the text of its values, as the command line and scripts give them.
struct Setting {
  std::string path;
  std::string value;

  bool operator==(const Setting&) const = default;
};

}  // namespace gridbay
