#pragma once

#include <string_view>

#include "core/string_table.h"

namespace gridbay {

// What tells the two editions apart. All else is compiled once and linked into both; each program or plug-in
// links one of the files that define `theEdition`.
struct Edition {
  // One area, hydrodynamics only; what the edition does not offer is pinned on file.
  bool wetlandSweepKit;
  Text document;
  Text editorName;
  // The extension of a setup without its dot.
  std::string_view fileKind;
};

extern const Edition theEdition;

}  // namespace gridbay
