#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace gridbay {

// What an open file of the netCDF library says of a variable (by its number there; NC_GLOBAL for the file
// itself). Each is nothing where it isn't there, is of another kind, or can't be read.
std::optional<std::string> textAttribute(int file, int variable, const char* name);
std::optional<double> numberAttribute(int file, int variable, const char* name);
std::optional<int> integerAttribute(int file, int variable, const char* name);

// The lengths of a variable's dimensions, the slowest first.
std::optional<std::vector<std::size_t>> shapeOf(int file, int variable);

// The library reads texts where it is asked for numbers, and forgets them.
bool holdsNumbers(int file, int variable);

// All numbers of a variable of so many.
std::optional<std::vector<double>> numbersOf(int file, int variable, std::size_t count);

}  // namespace gridbay
