#pragma once

#include <functional>
#include <string>
#include <string_view>

#include "core/kvs.h"
#include "core/message.h"
#include "core/page_place.h"

namespace gridbay {

// The place that a message of a check speaks of: the entry of a list that was checked, and the field where
// its text tells one.
PagePlace placeOfMessage(const CMessage& message);

// Entries of a page's lists in words, as "component 2, area 3"; empty where they have no names.
std::string thingOf(PageId page, const std::vector<ListEntry>& entries);

// Tells each keyword of a setup's target with the place where it is edited, in the order of the file; a page
// that is not known is that of none.
void eachKeyword(const KvsFile& file,
                 const std::function<void(const PagePlace& place, const Node& keyword)>& tell);

}  // namespace gridbay
