#include "platform/tsb/stored_grid.h"

#include <fcntl.h>
#include <hdf5.h>
#include <netcdf.h>

#include <algorithm>
#include <array>
#include <optional>

#include "platform/tsb/netcdf_file.h"
#include "platform/tsb/netcdf_names.h"
#include "platform/tsb/tsb_file.h"

namespace gridbay {
namespace {

struct Place {
  std::uint64_t offset;
  bool isDouble;
};

// The name of the variable that holds an item.
std::optional<std::string> variableOf(const std::string& path, std::size_t item) {
  const std::optional<NetcdfFile> file = NetcdfFile::open(path);
  int count = 0;
  if (!file || nc_inq_nvars(file->id(), &count) != NC_NOERR) return std::nullopt;
  for (int variable = 0; variable < count; ++variable) {
    int number = 0;
    std::size_t length = 0;
    std::array<char, NC_MAX_NAME + 1> name{};
    if (nc_inq_attlen(file->id(), variable, tsb::kItemNumber, &length) != NC_NOERR || length != 1) continue;
    if (nc_get_att_int(file->id(), variable, tsb::kItemNumber, &number) != NC_NOERR) continue;
    if (number != static_cast<int>(item)) continue;
    if (nc_inq_varname(file->id(), variable, name.data()) == NC_NOERR) return std::string(name.data());
  }
  return std::nullopt;
}

// Where the values of a dataset lie in one piece, as this machine has them in memory.
std::optional<Place> placeIn(hid_t dataset) {
  const haddr_t offset = H5Dget_offset(dataset);
  const hid_t type = H5Dget_type(dataset);
  const bool isFloat = type >= 0 && H5Tequal(type, H5T_NATIVE_FLOAT) > 0;
  const bool isDouble = type >= 0 && H5Tequal(type, H5T_NATIVE_DOUBLE) > 0;
  if (type >= 0) H5Tclose(type);
  if (offset == HADDR_UNDEF || (!isFloat && !isDouble)) return std::nullopt;
  return Place{offset, isDouble};
}

// Nothing for values that are packed, or lie in pieces.
std::optional<Place> placeOf(const std::string& path, const std::string& variable) {
  std::optional<Place> place;
  H5E_BEGIN_TRY {
    const hid_t file = H5Fopen(path.c_str(), H5F_ACC_RDONLY, H5P_DEFAULT);
    const hid_t dataset = file < 0 ? file : H5Dopen2(file, variable.c_str(), H5P_DEFAULT);
    if (dataset >= 0) place = placeIn(dataset);
    if (dataset >= 0) H5Dclose(dataset);
    if (file >= 0) H5Fclose(file);
  }
  H5E_END_TRY
  return place;
}

// Fills `bytes` from a place in a file.
bool readFully(int file, std::uint64_t place, std::span<std::byte> bytes) {
  while (!bytes.empty()) {
    const ssize_t got = ::pread(file, bytes.data(), bytes.size(), static_cast<off_t>(place));
    if (got <= 0) return false;
    place += static_cast<std::uint64_t>(got);
    bytes = bytes.subspan(static_cast<std::size_t>(got));
  }
  return true;
}

}  // namespace

Result<StoredGrid> StoredGrid::open(const std::string& path, std::size_t item) {
  Result<TsbFile> file = TsbFile::open(path);
  if (!file) return Failure{file.error()};
  const TsbDefinition& definition = file->definition();
  const auto fail = [&path](const std::string& why) {
    return Failure{"cannot show \"" + path + "\": " + why};
  };
  if (definition.axes.size() != 2) return fail("it is not two-dimensional");
  if (item < 1 || item > definition.items.size()) return fail("it has no item " + std::to_string(item));
  FileDescriptor descriptor(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
  if (!descriptor) return Failure{systemError("cannot open", path)};
  StoredGrid grid(std::move(descriptor), definition.axes[0].points, definition.axes[1].points,
                  static_cast<float>(definition.items[item - 1].deleteValue));
  const std::optional<std::string> variable = variableOf(path, item);
  if (const std::optional<Place> place = variable ? placeOf(path, *variable) : std::nullopt) {
    grid.place_ = place->offset;
    grid.isDouble_ = place->isDouble;
    return grid;
  }
  if (definition.pointCount() > kMostPacked) return fail("it is packed, and too large to be unpacked here");
  grid.unpacked_.resize(definition.pointCount());
  if (const Outcome read = file->read(item, 0, std::span(grid.unpacked_)); !read)
    return Failure{read.error()};
  return grid;
}

bool StoredGrid::read(std::size_t row, std::size_t firstColumn, std::span<float> values) const {
  if (row >= rows_ || firstColumn > columns_ || values.size() > columns_ - firstColumn) return false;
  const std::size_t first = row * columns_ + firstColumn;
  if (!unpacked_.empty()) {
    std::copy_n(unpacked_.begin() + static_cast<std::ptrdiff_t>(first), values.size(), values.begin());
    return true;
  }
  if (!isDouble_)
    return readFully(file_.get(), place_ + first * sizeof(float), std::as_writable_bytes(values));
  std::vector<double> wide(values.size());
  if (!readFully(file_.get(), place_ + first * sizeof(double), std::as_writable_bytes(std::span(wide))))
    return false;
  std::ranges::transform(wide, values.begin(), [](double value) { return static_cast<float>(value); });
  return true;
}

}  // namespace gridbay
