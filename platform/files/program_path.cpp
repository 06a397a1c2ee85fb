#include "platform/files/program_path.h"

#include <filesystem>

namespace gridbay {

std::string CKTOConfigFiles::GetProgramPath(int withSeparator) {
  std::error_code error;
  const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
  if (error) return {};
  const std::string folder = program.parent_path().string();
  return withSeparator != 0 && !folder.ends_with('/') ? folder + '/' : folder;
}

}  // namespace gridbay
