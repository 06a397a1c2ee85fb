#include "platform/tsb/hdf5_check.h"

#include <hdf5.h>

#include <algorithm>
#include <array>
#include <fstream>
#include <string_view>
#include <vector>

namespace gridbay {
namespace {

constexpr std::size_t kLongestAttribute = std::size_t{16} << 20;
constexpr hsize_t kLargestChunk = hsize_t{1} << 30;
constexpr herr_t kGoOn = 0;
constexpr herr_t kStop = -1;

// A handle of the library, closed by the function that suits it.
class Handle {
 public:
  using Close = herr_t (*)(hid_t);
  Handle(hid_t id, Close close) : id_(id), close_(close) {}
  Handle(const Handle&) = delete;
  Handle& operator=(const Handle&) = delete;
  ~Handle() {
    if (id_ >= 0) close_(id_);
  }
  hid_t get() const { return id_; }
  explicit operator bool() const { return id_ >= 0; }

 private:
  hid_t id_;
  Close close_;
};

// Keeps the library from writing what it finds wrong to the terminal.
class Quiet {
 public:
  Quiet() {
    H5Eget_auto2(H5E_DEFAULT, &function_, &data_);
    H5Eset_auto2(H5E_DEFAULT, nullptr, nullptr);
  }
  Quiet(const Quiet&) = delete;
  Quiet& operator=(const Quiet&) = delete;
  ~Quiet() { H5Eset_auto2(H5E_DEFAULT, function_, data_); }

 private:
  H5E_auto2_t function_ = nullptr;
  void* data_ = nullptr;
};

// The netCDF library knows older kinds of file too, which have nothing by which damage would show.
bool hasSignature(const std::string& path) {
  static constexpr std::string_view kSignature = "\x89HDF\r\n\x1a\n";
  std::array<char, kSignature.size()> start{};
  std::ifstream file(path, std::ios::binary);
  return file.read(start.data(), start.size()) && std::ranges::equal(start, kSignature);
}

herr_t readAttribute(hid_t object, const char* name, const H5A_info_t*, void*) {
  const Handle attribute(H5Aopen(object, name, H5P_DEFAULT), H5Aclose);
  if (!attribute) return kStop;
  const Handle space(H5Aget_space(attribute.get()), H5Sclose);
  const Handle stored(H5Aget_type(attribute.get()), H5Tclose);
  if (!space || !stored) return kStop;
  const Handle type(H5Tget_native_type(stored.get(), H5T_DIR_DEFAULT), H5Tclose);
  if (!type) return kStop;
  const hssize_t count = H5Sget_simple_extent_npoints(space.get());
  const std::size_t size = H5Tget_size(type.get());
  if (count < 0 || size == 0 || static_cast<std::size_t>(count) > kLongestAttribute / size) return kStop;
  std::vector<char> values(static_cast<std::size_t>(count) * size);
  if (values.empty()) return kGoOn;
  if (H5Aread(attribute.get(), type.get(), values.data()) < 0) return kStop;
  H5Dvlen_reclaim(type.get(), space.get(), H5P_DEFAULT, values.data());
  return kGoOn;
}

// Only the ways of packing that data files of this field have; the others are seldom tried in the library.
bool isPlainlyPacked(hid_t properties) {
  const int filters = H5Pget_nfilters(properties);
  for (unsigned filter = 0; filter < static_cast<unsigned>(std::max(filters, 0)); ++filter) {
    unsigned flags = 0;
    std::size_t parameters = 0;
    const H5Z_filter_t kind =
        H5Pget_filter2(properties, filter, &flags, &parameters, nullptr, 0, nullptr, nullptr);
    if (kind != H5Z_FILTER_DEFLATE && kind != H5Z_FILTER_SHUFFLE && kind != H5Z_FILTER_FLETCHER32)
      return false;
  }
  return filters >= 0;
}

// The index of the chunks is walked once from end to end.
bool chunksAreKnown(hid_t dataset, hid_t properties) {
  std::array<hsize_t, H5S_MAX_RANK> lengths{};
  const int rank = H5Pget_chunk(properties, static_cast<int>(lengths.size()), lengths.data());
  if (rank < 0) return false;
  const Handle type(H5Dget_type(dataset), H5Tclose);
  hsize_t bytes = type ? H5Tget_size(type.get()) : 0;
  for (int i = 0; i < rank && bytes > 0; ++i) {
    const hsize_t length = lengths[static_cast<std::size_t>(i)];
    bytes = length > kLargestChunk / bytes ? 0 : bytes * length;
  }
  const Handle space(H5Dget_space(dataset), H5Sclose);
  hsize_t chunks = 0;
  return bytes > 0 && space && H5Dget_num_chunks(dataset, space.get(), &chunks) >= 0;
}

bool isSoundDataset(hid_t dataset) {
  const Handle properties(H5Dget_create_plist(dataset), H5Pclose);
  if (!properties || !isPlainlyPacked(properties.get())) return false;
  return H5Pget_layout(properties.get()) != H5D_CHUNKED || chunksAreKnown(dataset, properties.get());
}

herr_t readObject(hid_t root, const char* name, const H5O_info_t* info, void*) {
  const Handle object(H5Oopen(root, name, H5P_DEFAULT), H5Oclose);
  if (!object) return kStop;
  if (info->type == H5O_TYPE_DATASET && !isSoundDataset(object.get())) return kStop;
  return H5Aiterate2(object.get(), H5_INDEX_NAME, H5_ITER_NATIVE, nullptr, readAttribute, nullptr);
}

}  // namespace

void prepareHdf5() {
  H5open();
}

bool isSoundHdf5(const std::string& path) {
  if (!hasSignature(path)) return false;
  const Quiet quiet;
  const Handle file(H5Fopen(path.c_str(), H5F_ACC_RDONLY, H5P_DEFAULT), H5Fclose);
  return file && H5Ovisit(file.get(), H5_INDEX_NAME, H5_ITER_NATIVE, readObject, nullptr) >= 0;
}

}  // namespace gridbay
