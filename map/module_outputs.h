#pragma once

#include <functional>
#include <vector>

#include "core/page_id.h"
#include "families/line_box.h"
#include "families/mass_budget.h"
#include "families/transport_results.h"
#include "map/map_scene.h"
#include "setup/global_kvs.h"

// What the module that is chosen writes: outputs on areas, transports through lines, masses in boxes.

namespace gridbay {

struct ModuleOutputs {
  PageId page = PageId::none;
  int count = 0;
  int most = 0;
  std::function<TransportOutput*(int number)> item = {};
  std::function<void(int count)> setCount = {};
};

// With no page where no module, or one without outputs, is chosen.
ModuleOutputs moduleOutputs(CGlobalKvs& root);
std::vector<LineOrBoxList*> linesAndBoxes(CGlobalKvs& root);
// The masses in polygons; null where the module that is chosen has none.
MassFileList* massFiles(CGlobalKvs& root);
// The list on a page; null where the module that is chosen has none there.
LineOrBoxList* lineOrBoxList(CGlobalKvs& root, std::int32_t page);

// Null where it is not of the module that is chosen.
TransportOutput* moduleOutput(CGlobalKvs& root, MapFeatureId id);
LineOrBox* lineOrBox(CGlobalKvs& root, MapFeatureId id);

}  // namespace gridbay
