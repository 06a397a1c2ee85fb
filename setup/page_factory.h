#pragma once

#include <memory>
#include <string_view>

#include "pages/form_view.h"

namespace gridbay {

// A page by its class name, ready to be shown; null for a class that this version does not have.
std::unique_ptr<CV27SetupFormView> makePage(std::string_view pageClass, CVdDoc& document);

}  // namespace gridbay
