#include "platform/files/paths.h"

#include <unistd.h>

#include <algorithm>
#include <filesystem>

namespace gridbay {

namespace fs = std::filesystem;

std::string absolutePath(std::string_view name, std::string_view folder) {
  if (name.empty()) return {};
  std::error_code error;
  const fs::path base = folder.empty() ? fs::current_path(error) : fs::path(folder);
  return (base / fs::path(name)).lexically_normal().string();
}

std::string folderOfFile(std::string_view file) {
  return fs::path(absolutePath(file, {})).parent_path().string();
}

std::string pathOnFile(std::string_view absolute, std::string_view folder) {
  const fs::path target(absolute);
  const fs::path base(folder);
  const auto first = [](const fs::path& path) {
    const fs::path inside = path.relative_path();
    return inside.empty() ? fs::path() : *inside.begin();
  };
  if (first(target) != first(base)) return target.string();
  const fs::path relative = target.lexically_relative(base);
  return relative.empty() ? target.string() : relative.string();
}

bool isUsablePathName(std::string_view path) {
  constexpr std::size_t kLongestPart = 255;
  constexpr std::size_t kLongestPath = 4095;
  if (path.empty() || path.size() > kLongestPath) return false;
  if (std::ranges::any_of(path, [](char c) { return static_cast<unsigned char>(c) < 0x20 || c == 0x7F; })) {
    return false;
  }
  const fs::path parts(path);
  const std::string file = parts.filename().string();
  if (file.empty() || file == "." || file == ".." || file.find_first_not_of(' ') == std::string::npos)
    return false;
  return std::ranges::all_of(parts,
                             [](const fs::path& part) { return part.string().size() <= kLongestPart; });
}

std::string endOfLinks(const std::string& path) {
  constexpr int kMostLinks = 40;
  std::error_code error;
  fs::path end(path);
  for (int i = 0; i < kMostLinks && fs::is_symlink(end, error); ++i) {
    fs::path next = fs::read_symlink(end, error);
    if (error) break;
    end = next.is_absolute() ? std::move(next) : end.parent_path() / next;
  }
  return end.string();
}

bool isReadableFile(const std::string& path) {
  std::error_code error;
  return fs::is_regular_file(path, error) && ::access(path.c_str(), R_OK) == 0;
}

}  // namespace gridbay
