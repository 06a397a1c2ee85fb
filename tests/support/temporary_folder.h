#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace gridbay::test {

// A folder of its own for a test, gone at its end.
class TemporaryFolder {
 public:
  TemporaryFolder();
  TemporaryFolder(const TemporaryFolder&) = delete;
  TemporaryFolder& operator=(const TemporaryFolder&) = delete;
  ~TemporaryFolder();

  const std::filesystem::path& path() const { return path_; }
  // The path of a file in it.
  std::string file(std::string_view name) const { return (path_ / name).string(); }
  // Makes a file with a text and returns its path.
  std::string write(std::string_view name, std::string_view text) const;

 private:
  std::filesystem::path path_;
};

std::string textOf(const std::string& path);

// A small file system in memory mounted on a folder; `mounted` is false where the system does not allow it.
class SmallDisk {
 public:
  SmallDisk(const std::filesystem::path& folder, std::size_t bytes);
  SmallDisk(const SmallDisk&) = delete;
  SmallDisk& operator=(const SmallDisk&) = delete;
  ~SmallDisk();

  bool mounted() const { return mounted_; }

 private:
  std::filesystem::path folder_;
  bool mounted_ = false;
};

}  // namespace gridbay::test
