#pragma once

#include <string>

namespace gridbay {

// Changes a data file so that it is still whole to the library that stores it, but says something else:
// attributes of other kinds and values or none, variables of any shape, other numbers. Bytes that are
// changed at random nearly always fail that library's checksums instead. False when it is no data file
// that can be read.
bool mutateDataFile(const std::string& path, unsigned seed);

}  // namespace gridbay
