#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "plugin/setup_editor.h"

namespace gridbay {

// The local page that the enumerator names for an item without a page of its own,
// "res://V27Nested.dll/Basic_Parameters.htm": what the item's group is for, and in what order to fill it.
// A name that is not known gets the default page.
SetupEditor::Cover coverPage(std::string_view localPage);

// What stands for an item whose page this version does not have.
SetupEditor::Cover missingPage(std::string_view caption);

}  // namespace gridbay
