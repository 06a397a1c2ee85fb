#pragma once

#include <string>
#include <vector>

namespace gridbay::cli {

// Whether a file can be run.
bool isProgram(const std::string& path);

// The folders in which programs are looked for by their name (PATH), in their order.
std::vector<std::string> foldersOfPrograms();

// The file of a program on the PATH; empty where there is none of the name.
std::string findProgram(const std::string& name);

}  // namespace gridbay::cli
