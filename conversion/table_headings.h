#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace gridbay {

// What the heading of a table says of a column, in UTF-8: its name ("Column 2" where there is none) and its
// unit as it is written.
struct ColumnHeading {
  std::string name;
  std::string unit;
};

// The last heading line that has as many fields as there are columns names them, "level (m)", or the one
// before it where the last has nothing but units.
std::vector<ColumnHeading> columnHeadings(std::span<const std::string_view> lines, char separator,
                                          std::size_t columns);

// The unit of a column of times by its heading: s, min, h or d; empty where it tells none.
std::string timeUnitOfHeading(std::string_view name, std::string_view unit);

// A unit of a heading as data files have it, as "m3/s" for "m³/s" or "cumecs"; empty for what is no unit.
std::string unitOfHeading(std::string_view text);
// The item type that the name and unit (as data files have it) of a column speak of, by its code; 0 for none.
int itemTypeOfHeading(std::string_view name, std::string_view unit);

}  // namespace gridbay
