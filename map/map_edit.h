#pragma once

#include <string>
#include <utility>

#include "core/page_id.h"
#include "map/map_scene.h"

namespace gridbay {

// What an edit on the map came to: why it can't be done, or the page and the name of the step.
struct MapEdit {
  std::string fault{};
  PageId page = PageId::none;
  std::string name{};
};

inline MapEdit refusedEdit(std::string fault) {
  return {.fault = std::move(fault)};
}

}  // namespace gridbay
