#pragma once

#include <optional>
#include <string>
#include <utility>

namespace gridbay {

// A file that is open for reading in the netCDF library, closed at the end of its life.
class NetcdfFile {
 public:
  // Nothing when the library refuses it.
  static std::optional<NetcdfFile> open(const std::string& path);

  NetcdfFile(NetcdfFile&& other) noexcept : id_(std::exchange(other.id_, -1)) {}
  NetcdfFile& operator=(NetcdfFile&&) = delete;
  ~NetcdfFile();

  int id() const { return id_; }

 private:
  explicit NetcdfFile(int id) : id_(id) {}

  int id_;
};

}  // namespace gridbay
