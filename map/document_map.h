#pragma once

#include <memory>

#include "map/map_editor.h"
#include "setup/setup_doc.h"

namespace gridbay {

// The map of a document, which must outlive it.
std::unique_ptr<MapEditor> makeMapEditor(CV27SetupDoc& document);

}  // namespace gridbay
