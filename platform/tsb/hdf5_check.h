#pragma once

#include <string>

namespace gridbay {

// Whether a file is in HDF5, all that is attached to its parts can be read, and the places of all that is
// stored in it are known. Made to be asked apart: in a damaged file the library may go astray.
// What `prepareHdf5` makes ready need not be made ready in each copy of the process.
void prepareHdf5();
bool isSoundHdf5(const std::string& path);

}  // namespace gridbay
