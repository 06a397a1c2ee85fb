#include "tests/support/temporary_folder.h"

#include <sys/mount.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <sstream>

namespace gridbay::test {

namespace fs = std::filesystem;

TemporaryFolder::TemporaryFolder() {
  std::string name = (fs::temp_directory_path() / "gridbay-test-XXXXXX").string();
  path_ = ::mkdtemp(name.data());
}

TemporaryFolder::~TemporaryFolder() {
  std::error_code error;
  fs::permissions(path_, fs::perms::owner_all, error);
  fs::remove_all(path_, error);
}

std::string TemporaryFolder::write(std::string_view name, std::string_view text) const {
  std::ofstream(path_ / name, std::ios::binary) << text;
  return file(name);
}

std::string textOf(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  std::ostringstream text;
  if (file.peek() != std::ifstream::traits_type::eof()) text << file.rdbuf();
  return std::move(text).str();
}

SmallDisk::SmallDisk(const fs::path& folder, std::size_t bytes) : folder_(folder) {
  fs::create_directories(folder);
  const std::string options = "size=" + std::to_string(bytes);
  mounted_ = ::mount("none", folder.c_str(), "tmpfs", 0, options.c_str()) == 0;
}

SmallDisk::~SmallDisk() {
  if (mounted_) ::umount2(folder_.c_str(), MNT_DETACH);
}

}  // namespace gridbay::test
