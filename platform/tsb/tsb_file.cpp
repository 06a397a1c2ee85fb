#include "platform/tsb/tsb_file.h"

#include <netcdf.h>

#include <algorithm>
#include <array>
#include <filesystem>
#include <iterator>
#include <map>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/apart.h"
#include "platform/files/paths.h"
#include "platform/tsb/hdf5_check.h"
#include "platform/tsb/known_files.h"
#include "platform/tsb/netcdf_file.h"
#include "platform/tsb/tsb_definition_reader.h"

namespace gridbay {
namespace {

constexpr std::string_view kNoDataFile = "it is no data file, or it is damaged";

// Seconds of computing for a look at a file before it is opened: more where there may be much to unpack.
unsigned secondsFor(std::uintmax_t size) {
  constexpr std::uintmax_t kLeast = 2;
  constexpr std::uintmax_t kMost = 60;
  return static_cast<unsigned>(std::min(kLeast + (size >> 24U), kMost));
}

Failure cannotRead(const std::string& path, std::string_view why) {
  return Failure{"cannot read \"" + path + "\": " + std::string(why)};
}

// Why a file can't be looked at; empty when it can.
std::string_view hindranceOf(const std::string& path) {
  std::error_code error;
  const std::filesystem::file_status status = std::filesystem::status(path, error);
  if (!std::filesystem::exists(status)) return "there is no such file";
  if (!std::filesystem::is_regular_file(status)) return "it is not a file";
  return isReadableFile(path) ? "" : "no permission";
}

// 0 where there is no such file.
std::uintmax_t sizeOf(const std::string& path) {
  std::error_code error;
  const std::uintmax_t size = std::filesystem::file_size(path, error);
  return error ? 0 : size;
}

KnownFiles& knownFiles() {
  static KnownFiles files;
  return files;
}

// The contents of known files, by the state in which they were read: a model asks for its files at each
// check, and to open one takes longer than most of what is done with it.
std::map<FileStamp, std::shared_ptr<const TsbContent>>& knownContents() {
  static std::map<FileStamp, std::shared_ptr<const TsbContent>> contents;
  return contents;
}

void keepContent(const FileStamp& state, const std::shared_ptr<const TsbContent>& content) {
  constexpr std::size_t kMost = 64;
  if (knownContents().size() >= kMost) knownContents().clear();
  knownContents()[state] = content;
}

}  // namespace

struct TsbFile::State {
  State(std::string name, NetcdfFile open) : path(std::move(name)), file(std::move(open)) {}
  State(std::string name, const FileStamp& as, std::shared_ptr<const TsbContent> known)
      : path(std::move(name)), knownAs(as), content(std::move(known)) {}

  std::string path;
  mutable std::optional<NetcdfFile> file;  // opened when it is read from
  std::optional<FileStamp> knownAs;        // where the content was read before
  std::shared_ptr<const TsbContent> content;

  // Whether the library stands all that is asked of it for each file. Its reader was not written for files
  // that are made to harm, so it is tried apart.
  static std::vector<bool> canBeRead(std::span<const std::string> paths) {
    return knownFiles().hold(paths, [](std::span<const std::string> unknown) {
      // Set up here, once, and not in each copy.
      prepareHdf5();
      nc_initialize();
      std::uintmax_t largest = 0;
      for (const std::string& name : unknown) largest = std::max(largest, sizeOf(name));
      return holdApart(
          unknown.size(), [&](std::size_t i) { return tryToRead(unknown[i]); }, secondsFor(largest));
    });
  }

  static bool tryToRead(const std::string& path) {
    if (!isSoundHdf5(path)) return false;
    std::optional<NetcdfFile> file = NetcdfFile::open(path);
    if (!file) return false;
    State state(path, *std::move(file));
    if (!state.readDefinition()) return true;  // the caller will see why
    const std::size_t steps = state.definition().time.count;
    const std::size_t rows = state.rowCount();
    std::vector<float> row(state.definition().pointCount() / rows);
    for (std::size_t item = 1; item <= state.content->itemVariables.size(); ++item) {
      // What can't be read is told when it is asked for.
      static_cast<void>(
          static_cast<bool>(state.readBlock(item, {0, 1}, {0, 1}, std::span(row), nc_get_vara_float)));
      static_cast<void>(static_cast<bool>(
          state.readBlock(item, {steps - 1, 1}, {rows - 1, 1}, std::span(row), nc_get_vara_float)));
    }
    return true;
  }

  Outcome readDefinition() {
    auto reading = std::make_shared<TsbContent>();
    content = reading;
    return readTsbContent(file->id(), static_cast<double>(sizeOf(path)), *reading);
  }

  const TsbDefinition& definition() const { return content->definition; }

  Outcome openFile() const {
    if (file) return {};
    if (fileStamp(path) != knownAs) return fail("it has been written to since it was opened");
    if (std::optional<NetcdfFile> opened = NetcdfFile::open(path)) {
      file.emplace(*std::move(opened));
      return {};
    }
    return fail(kNoDataFile);
  }

  template <class Number, class Get>
  Outcome read(std::size_t item, std::size_t step, std::span<Number> values, Get get) const {
    if (values.size() != definition().pointCount()) return fail("its grid has another size");
    return readBlock(item, {step, 1}, {0, rowCount()}, values, get);
  }

  // Some rows (all, where there are none to choose from) of some time steps.
  struct Block {
    std::size_t first;
    std::size_t count;
  };
  template <class Number, class Get>
  Outcome readBlock(std::size_t item, Block steps, Block rows, std::span<Number> values, Get get) const {
    if (item < 1 || item > content->itemVariables.size())
      return fail("it has no item " + std::to_string(item));
    if (steps.first >= definition().time.count || steps.count > definition().time.count - steps.first)
      return fail("it has no time step " + std::to_string(steps.first));
    if (rows.first + rows.count > rowCount()) return fail("it has no row " + std::to_string(rows.first));
    if (Outcome opened = openFile(); !opened) return opened;
    std::vector<std::size_t> start{steps.first};
    std::vector<std::size_t> count{steps.count};
    for (auto axis = definition().axes.rbegin(); axis != definition().axes.rend(); ++axis) {
      const bool isRows = definition().axes.size() == 2 && axis == definition().axes.rbegin();
      start.push_back(isRows ? rows.first : 0);
      count.push_back(isRows ? rows.count : axis->points);
    }
    const int status =
        get(file->id(), content->itemVariables[item - 1], start.data(), count.data(), values.data());
    if (status == NC_NOERR) return {};
    return fail("item " + std::to_string(item) + ", step " + std::to_string(steps.first) + ": " +
                nc_strerror(status));
  }

  template <class Number, class Get>
  Outcome readRows(std::size_t item, std::size_t step, std::size_t firstRow, std::span<Number> values,
                   Get get) const {
    const std::size_t row = definition().axes.empty() ? 1 : definition().axes[0].points;
    if (definition().axes.size() != 2 || row == 0 || values.size() % row != 0)
      return fail("a part of it was asked for that is not of whole rows");
    if (firstRow > 0) keepPieces(item);
    return readBlock(item, {step, 1}, {firstRow, values.size() / row}, values, get);
  }

  // Where rows are read one after the other, the library keeps all pieces that a row goes through: else it
  // unpacks them again for each.
  void keepPieces(std::size_t item) const {
    if (item < 1 || item > content->itemVariables.size() || !openFile()) return;
    const int variable = content->itemVariables[item - 1];
    constexpr std::size_t kMostDimensions = 8;
    std::array<std::size_t, kMostDimensions> piece{};
    int storage = NC_CONTIGUOUS;
    int dimensions = 0;
    if (nc_inq_varndims(file->id(), variable, &dimensions) != NC_NOERR || dimensions < 2 ||
        dimensions > static_cast<int>(kMostDimensions) ||
        nc_inq_var_chunking(file->id(), variable, &storage, piece.data()) != NC_NOERR ||
        storage != NC_CHUNKED)
      return;
    std::size_t bytes = sizeof(double);
    for (int i = 0; i < dimensions; ++i) bytes *= piece[static_cast<std::size_t>(i)];
    const std::size_t across = piece[static_cast<std::size_t>(dimensions) - 1];
    bytes *= (definition().axes[0].points + across - 1) / across;
    std::size_t held = 0;
    std::size_t pieces = 0;
    float preemption = 0;
    constexpr std::size_t kMost = std::size_t{1} << 29;
    if (nc_get_var_chunk_cache(file->id(), variable, &held, &pieces, &preemption) == NC_NOERR &&
        held < bytes && bytes <= kMost)
      nc_set_var_chunk_cache(file->id(), variable, bytes, pieces, preemption);
  }

  template <class Number, class Get>
  Outcome readSteps(std::size_t item, std::size_t firstStep, std::span<Number> values, Get get) const {
    const std::size_t points = definition().pointCount();
    if (points == 0 || values.size() % points != 0)
      return fail("a part of it was asked for that is not of whole steps");
    return readBlock(item, {firstStep, values.size() / points}, {0, rowCount()}, values, get);
  }

  std::size_t rowCount() const { return definition().axes.size() == 2 ? definition().axes[1].points : 1; }
  Failure fail(std::string_view why) const { return cannotRead(path, why); }
};

TsbFile::TsbFile(std::unique_ptr<State> state) : state_(std::move(state)) {}
TsbFile::TsbFile(TsbFile&&) noexcept = default;
TsbFile& TsbFile::operator=(TsbFile&&) noexcept = default;
TsbFile::~TsbFile() = default;

Result<TsbFile> TsbFile::open(const std::string& path) {
  if (path.empty()) return Failure{"no data file is named"};
  if (const std::string_view why = hindranceOf(path); !why.empty()) return cannotRead(path, why);
  if (!State::canBeRead({&path, 1})[0]) return cannotRead(path, kNoDataFile);
  const std::optional<FileStamp> known = knownFiles().known(path);
  if (known) {
    if (const auto content = knownContents().find(*known); content != knownContents().end())
      return TsbFile(std::make_unique<State>(path, *known, content->second));
  }
  std::optional<NetcdfFile> file = NetcdfFile::open(path);
  if (!file) return cannotRead(path, kNoDataFile);
  auto state = std::make_unique<State>(path, *std::move(file));
  if (const Outcome read = state->readDefinition(); !read) return cannotRead(path, read.error());
  if (known && knownFiles().known(path) == known) keepContent(*known, state->content);
  return TsbFile(std::move(state));
}

void TsbFile::lookAhead(std::span<const std::string> paths) {
  std::vector<std::string> files;
  std::ranges::copy_if(paths, std::back_inserter(files),
                       [](const std::string& path) { return hindranceOf(path).empty(); });
  State::canBeRead(files);
}

const TsbDefinition& TsbFile::definition() const {
  return state_->definition();
}
const std::string& TsbFile::path() const {
  return state_->path;
}

Outcome TsbFile::read(std::size_t item, std::size_t step, std::span<float> values) const {
  return state_->read(item, step, values, nc_get_vara_float);
}

Outcome TsbFile::read(std::size_t item, std::size_t step, std::span<double> values) const {
  return state_->read(item, step, values, nc_get_vara_double);
}

Outcome TsbFile::readRows(std::size_t item, std::size_t step, std::size_t firstRow,
                          std::span<float> values) const {
  return state_->readRows(item, step, firstRow, values, nc_get_vara_float);
}

Outcome TsbFile::readRows(std::size_t item, std::size_t step, std::size_t firstRow,
                          std::span<double> values) const {
  return state_->readRows(item, step, firstRow, values, nc_get_vara_double);
}

Outcome TsbFile::readSteps(std::size_t item, std::size_t firstStep, std::span<float> values) const {
  return state_->readSteps(item, firstStep, values, nc_get_vara_float);
}

Outcome TsbFile::readSteps(std::size_t item, std::size_t firstStep, std::span<double> values) const {
  return state_->readSteps(item, firstStep, values, nc_get_vara_double);
}

}  // namespace gridbay
