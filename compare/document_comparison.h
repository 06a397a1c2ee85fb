#pragma once

#include <memory>

#include "compare/setup_comparison.h"
#include "setup/setup_doc.h"

namespace gridbay {

// The comparison of a document, which must outlive it.
std::unique_ptr<SetupComparison> makeSetupComparison(CV27SetupDoc& document);

}  // namespace gridbay
