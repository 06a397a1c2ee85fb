#include "platform/files/may_write.h"

#include <fmt/format.h>

#include <filesystem>

namespace gridbay {

Outcome mayWrite(const std::string& path, bool force, std::span<const std::string> inputs,
                 std::string_view forceName) {
  std::error_code error;
  for (const std::string& input : inputs) {
    if (std::filesystem::equivalent(path, input, error))
      return Failure{
          fmt::format("\"{}\" is a file that is read here: give what is written another name", path)};
  }
  if (std::filesystem::is_directory(path, error)) return Failure{fmt::format("\"{}\" is a folder", path)};
  const std::filesystem::file_status status = std::filesystem::status(path, error);
  if (std::filesystem::exists(status) && !std::filesystem::is_regular_file(status))
    return Failure{fmt::format("\"{}\" is a device or a pipe", path)};
  if (!force && std::filesystem::exists(path, error))
    return Failure{fmt::format("\"{}\" is there already; {} replaces it", path, forceName)};
  return {};
}

}  // namespace gridbay
