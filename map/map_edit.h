#pragma once

#include <string>

#include "core/page_id.h"
#include "map/map_scene.h"

namespace gridbay {

// What an edit on the map came to: why it can't be done, or the page and the name of the step.
struct MapEdit {
  std::string fault{};
  PageId page = PageId::none;
  std::string name{};
};

MapEdit refusedEdit(std::string fault);
// "Weir", for the names of steps.
std::string editKindName(MapKind kind);

}  // namespace gridbay
