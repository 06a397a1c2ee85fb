#include "cli/programs.h"

#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>

namespace gridbay::cli {

bool isProgram(const std::string& path) {
  std::error_code error;
  return std::filesystem::is_regular_file(path, error) && ::access(path.c_str(), X_OK) == 0;
}

std::vector<std::string> foldersOfPrograms() {
  const char* variable = std::getenv("PATH");
  const std::string path = variable == nullptr ? "" : variable;
  std::vector<std::string> folders;
  for (std::size_t start = 0; start < path.size();) {
    const std::size_t end = std::min(path.find(':', start), path.size());
    folders.push_back(path.substr(start, end - start));
    start = end + 1;
  }
  return folders;
}

std::string findProgram(const std::string& name) {
  for (const std::string& folder : foldersOfPrograms()) {
    const std::string file = (std::filesystem::path(folder) / name).string();
    if (isProgram(file)) return file;
  }
  return {};
}

}  // namespace gridbay::cli
