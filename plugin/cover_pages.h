#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace gridbay {

// The short help, as Markdown, that the pane shows for an item of the tree without a page of its own: what
// its group is for, and in what order to fill it. An item whose page this version does not have says so.
std::string coverPage(std::int32_t id, std::string_view pageClass);

}  // namespace gridbay
