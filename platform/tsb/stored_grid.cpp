#include "platform/tsb/stored_grid.h"

#include <fcntl.h>
#include <hdf5.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <optional>

#include "platform/no_copy_now.h"
#include "platform/tsb/netcdf_names.h"
#include "platform/tsb/tsb_file.h"

namespace gridbay {
namespace {

// An identifier of the file library, closed at the end of its scope.
class Handle {
 public:
  Handle(hid_t id, herr_t (*close)(hid_t)) : id_(id), close_(close) {}
  Handle(const Handle&) = delete;
  Handle& operator=(const Handle&) = delete;
  ~Handle() {
    if (id_ >= 0) close_(id_);
  }
  explicit operator bool() const { return id_ >= 0; }
  hid_t get() const { return id_; }

 private:
  hid_t id_;
  herr_t (*close_)(hid_t);
};

// Opened by a way of its own, which has nothing in common with what the data file library has open.
Handle openFile(const std::string& path) {
  const Handle access(H5Pcreate(H5P_FILE_ACCESS), H5Pclose);
  H5Pset_fapl_stdio(access.get());
  return {H5Fopen(path.c_str(), H5F_ACC_RDONLY, access.get()), H5Fclose};
}

std::optional<int> itemNumberOf(hid_t dataset) {
  if (H5Aexists(dataset, tsb::kItemNumber) <= 0) return std::nullopt;
  const Handle attribute(H5Aopen(dataset, tsb::kItemNumber, H5P_DEFAULT), H5Aclose);
  const Handle space(H5Aget_space(attribute.get()), H5Sclose);
  int number = 0;
  if (!space || H5Sget_simple_extent_npoints(space.get()) != 1 ||
      H5Aread(attribute.get(), H5T_NATIVE_INT, &number) < 0)
    return std::nullopt;
  return number;
}

// The dataset that holds an item; less than 0 where there is none.
hid_t openItem(hid_t file, std::size_t item) {
  H5G_info_t group{};
  if (H5Gget_info(file, &group) < 0) return -1;
  for (hsize_t i = 0; i < group.nlinks; ++i) {
    const hid_t object = H5Oopen_by_idx(file, ".", H5_INDEX_NAME, H5_ITER_NATIVE, i, H5P_DEFAULT);
    if (object < 0) continue;
    if (H5Iget_type(object) == H5I_DATASET && itemNumberOf(object) == static_cast<int>(item)) return object;
    H5Oclose(object);
  }
  return -1;
}

// Whether the values of a dataset are as this machine has them in memory; nothing where they are not.
std::optional<bool> isDouble(hid_t dataset) {
  const Handle type(H5Dget_type(dataset), H5Tclose);
  if (type && H5Tequal(type.get(), H5T_NATIVE_FLOAT) > 0) return false;
  if (type && H5Tequal(type.get(), H5T_NATIVE_DOUBLE) > 0) return true;
  return std::nullopt;
}

std::optional<PackedLayout::Step> stepOf(H5Z_filter_t filter) {
  switch (filter) {
    case H5Z_FILTER_DEFLATE:
      return PackedLayout::Step::inflate;
    case H5Z_FILTER_SHUFFLE:
      return PackedLayout::Step::unshuffle;
    case H5Z_FILTER_FLETCHER32:
      return PackedLayout::Step::dropChecksum;
    default:
      return std::nullopt;
  }
}

// Nothing for values that are packed in another way than usual, or in pieces that are very large or very
// many.
std::optional<PackedLayout> layoutOf(hid_t dataset, const StoredGrid::Source& source, bool isDouble) {
  const Handle properties(H5Dget_create_plist(dataset), H5Pclose);
  if (!properties || H5Pget_layout(properties.get()) != H5D_CHUNKED) return std::nullopt;
  constexpr int kMostRank = 8;
  std::array<hsize_t, kMostRank> sizes{};
  const int rank = H5Pget_chunk(properties.get(), kMostRank, sizes.data());
  if (rank < 2 || rank > kMostRank) return std::nullopt;
  PackedLayout layout{.columns = source.columns, .rows = source.rows};
  layout.isDouble = isDouble;
  layout.missing = source.missing;
  layout.pieceColumns = sizes[static_cast<std::size_t>(rank) - 1];
  layout.pieceRows = sizes[static_cast<std::size_t>(rank) - 2];
  for (int i = 0; i < rank; ++i) {
    const hsize_t size = sizes[static_cast<std::size_t>(i)];
    if (size < 1 || size > PackedGrid::kMostKept / layout.pieceValues) return std::nullopt;
    layout.pieceValues *= size;
  }
  for (int i = 0; i < H5Pget_nfilters(properties.get()); ++i) {
    unsigned flags = 0;
    std::size_t values = 0;
    unsigned config = 0;
    const auto step = stepOf(H5Pget_filter2(properties.get(), static_cast<unsigned>(i), &flags, &values,
                                            nullptr, 0, nullptr, &config));
    if (!step) return std::nullopt;
    layout.steps.push_back(*step);
  }
  constexpr std::size_t kMostPieces = 1'000'000;
  if ((source.rows / layout.pieceRows + 1) * (source.columns / layout.pieceColumns + 1) > kMostPieces)
    return std::nullopt;
  std::array<hsize_t, kMostRank> at{};
  for (std::size_t row = 0; row < source.rows; row += layout.pieceRows) {
    for (std::size_t column = 0; column < source.columns; column += layout.pieceColumns) {
      at[static_cast<std::size_t>(rank) - 2] = row;
      at[static_cast<std::size_t>(rank) - 1] = column;
      unsigned left = 0;
      haddr_t place = HADDR_UNDEF;
      hsize_t bytes = 0;
      if (H5Dget_chunk_info_by_coord(dataset, at.data(), &left, &place, &bytes) < 0) return std::nullopt;
      // What is packed is hardly larger than what is in it.
      if (bytes > 2 * layout.pieceValues * sizeof(double) + 64) return std::nullopt;
      const bool isThere = place != HADDR_UNDEF;
      layout.pieces.push_back({isThere ? place : 0, isThere ? static_cast<std::uint32_t>(bytes) : 0, left});
    }
  }
  return layout;
}

// The first time step of a dataset as a whole.
bool readWhole(hid_t dataset, const StoredGrid::Source& source, std::vector<float>& values) {
  const Handle space(H5Dget_space(dataset), H5Sclose);
  constexpr int kMostRank = 8;
  std::array<hsize_t, kMostRank> sizes{};
  const int rank = space ? H5Sget_simple_extent_ndims(space.get()) : -1;
  if (rank < 2 || rank > kMostRank) return false;
  H5Sget_simple_extent_dims(space.get(), sizes.data(), nullptr);
  if (sizes[static_cast<std::size_t>(rank) - 1] != source.columns ||
      sizes[static_cast<std::size_t>(rank) - 2] != source.rows)
    return false;
  std::array<hsize_t, kMostRank> first{};
  std::array<hsize_t, kMostRank> count{};
  std::fill_n(count.begin(), rank - 2, 1);
  count[static_cast<std::size_t>(rank) - 2] = source.rows;
  count[static_cast<std::size_t>(rank) - 1] = source.columns;
  H5Sselect_hyperslab(space.get(), H5S_SELECT_SET, first.data(), nullptr, count.data(), nullptr);
  const std::array<hsize_t, 1> points{source.rows * source.columns};
  const Handle memory(H5Screate_simple(1, points.data(), nullptr), H5Sclose);
  values.resize(points[0]);
  return H5Dread(dataset, H5T_NATIVE_FLOAT, memory.get(), space.get(), H5P_DEFAULT, values.data()) >= 0;
}

Failure cannotShow(const std::string& path, const std::string& why) {
  return Failure{"cannot show \"" + path + "\": " + why};
}

}  // namespace

Result<StoredGrid::Source> StoredGrid::find(const std::string& path, std::size_t item) {
  const Result<TsbFile> file = TsbFile::open(path);
  if (!file) return Failure{file.error()};
  const TsbDefinition& definition = file->definition();
  if (definition.axes.size() != 2) return cannotShow(path, "it is not two-dimensional");
  if (item < 1 || item > definition.items.size())
    return cannotShow(path, "it has no item " + std::to_string(item));
  return Source{path, item, definition.axes[0].points, definition.axes[1].points,
                static_cast<float>(definition.items[item - 1].deleteValue)};
}

bool StoredGrid::opensInAnyThread() {
  hbool_t isSafe = 0;
  return H5is_library_threadsafe(&isSafe) >= 0 && isSafe != 0;
}

Result<StoredGrid> StoredGrid::open(const std::string& path, std::size_t item) {
  const Result<Source> source = find(path, item);
  if (!source) return Failure{source.error()};
  return open(*source);
}

Result<StoredGrid> StoredGrid::open(const Source& source, const Progress& progress) {
  FileDescriptor descriptor(::open(source.path.c_str(), O_RDONLY | O_CLOEXEC));
  if (!descriptor) return Failure{systemError("cannot open", source.path)};
  StoredGrid grid(std::move(descriptor), source);
  std::string fault;
  std::optional<NoCopyNow> whileItIsOpened(std::in_place);
  H5E_BEGIN_TRY {
    const Handle file = openFile(source.path);
    const Handle dataset(file ? openItem(file.get(), source.item) : -1, H5Dclose);
    const std::optional<bool> isWide = dataset ? isDouble(dataset.get()) : std::nullopt;
    const haddr_t place = isWide ? H5Dget_offset(dataset.get()) : HADDR_UNDEF;
    if (!dataset) {
      fault = "its values can't be found";
    } else if (place != HADDR_UNDEF) {
      grid.place_ = place;
      grid.isDouble_ = *isWide;
    } else if (auto layout = isWide ? layoutOf(dataset.get(), source, *isWide) : std::nullopt) {
      grid.packed_ = std::make_unique<PackedGrid>(std::move(grid.file_), *std::move(layout));
    } else if (source.columns * source.rows > kMostAtOnce) {
      fault = "it is packed in a way of its own, and too large to be unpacked here";
    } else if (!readWhole(dataset.get(), source, grid.unpacked_)) {
      fault = "its values can't be read";
    }
  }
  H5E_END_TRY
  whileItIsOpened.reset();
  if (!fault.empty()) return cannotShow(source.path, fault);
  if (grid.packed_) {
    if (const Outcome made = grid.makeOverview(progress); !made) return cannotShow(source.path, made.error());
  }
  return grid;
}

Outcome StoredGrid::makeOverview(const Progress& progress) {
  const double points = static_cast<double>(columns()) * static_cast<double>(rows());
  if (points <= static_cast<double>(kMostAtOnce)) return {};
  const auto step =
      static_cast<std::size_t>(std::ceil(std::sqrt(points / static_cast<double>(kOverviewPoints))));
  std::vector<float> row(columns());
  overviewColumns_ = (columns() + step - 1) / step;
  for (std::size_t k = 0; k < rows(); k += step) {
    const double done = static_cast<double>(k) / static_cast<double>(rows());
    if (progress && !progress(done)) return Failure{"it was cancelled"};
    if (!packed_->read(k, 0, row)) return Failure{"a part of it can't be unpacked"};
    for (std::size_t j = 0; j < columns(); j += step) overview_.push_back(row[j]);
  }
  overviewStep_ = step;
  packed_->trim();
  return {};
}

bool StoredGrid::readAtOnce(std::size_t row, std::size_t column, float& value) const {
  if (packed_ && row < rows() && column < columns()) return packed_->readAtOnce(row, column, value);
  return read(row, column, {&value, 1});
}

bool StoredGrid::read(std::size_t row, std::size_t firstColumn, std::span<float> values, double apart) const {
  if (row >= rows() || firstColumn > columns() || values.size() > columns() - firstColumn) return false;
  const std::size_t first = row * columns() + firstColumn;
  if (!unpacked_.empty()) {
    std::copy_n(unpacked_.begin() + static_cast<std::ptrdiff_t>(first), values.size(), values.begin());
    return true;
  }
  if (overviewStep_ > 0 && apart >= static_cast<double>(overviewStep_)) {
    const std::size_t half = overviewStep_ / 2;
    const std::size_t lines = overview_.size() / overviewColumns_;
    const std::size_t line = std::min((row + half) / overviewStep_, lines - 1) * overviewColumns_;
    for (std::size_t i = 0; i < values.size(); ++i)
      values[i] = overview_[line + std::min((firstColumn + i + half) / overviewStep_, overviewColumns_ - 1)];
    return true;
  }
  if (packed_) return packed_->read(row, firstColumn, values);
  if (!isDouble_)
    return readFully(file_.get(), place_ + first * sizeof(float), std::as_writable_bytes(values));
  std::vector<double> wide(values.size());
  if (!readFully(file_.get(), place_ + first * sizeof(double), std::as_writable_bytes(std::span(wide))))
    return false;
  std::ranges::transform(wide, values.begin(), [](double value) { return static_cast<float>(value); });
  return true;
}

}  // namespace gridbay
