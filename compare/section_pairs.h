#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "core/kvs.h"

namespace gridbay {

// A thing of one name in several sections: null where a section has none. There is one at least.
template <std::size_t n>
using NodeGroup = std::array<const Node*, n>;

// What the sections hold, each thing with those of its name, number and kind in the others: in the order of
// the first section, and what it lacks behind that. A section that is null holds nothing.
template <std::size_t n>
std::vector<NodeGroup<n>> groupsOf(const NodeGroup<n>& sections);

// How a path names a thing of a section: "weir_data[2]" for the second of its name.
std::string stepOfNode(const Node& section, const Node& node);

// Whether two things hold the same: numbers by their value, all else by its text.
bool sameKeyword(const Node& a, const Node& b);
// Either may be null.
bool sameNode(const Node* a, const Node* b);

// What a thing holds, for people: the values of a keyword, empty for a section, nothing for null.
std::optional<std::string> shownNode(const Node* node);

// Writes a thing with all that it holds under the cursor.
void writeNode(const Node& node, KvsFile& file);

}  // namespace gridbay
