#include "platform/tsb/tsb_file.h"

#include <netcdf.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <filesystem>
#include <iterator>
#include <limits>
#include <map>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/apart.h"
#include "platform/files/paths.h"
#include "platform/tsb/hdf5_check.h"
#include "platform/tsb/known_files.h"
#include "platform/tsb/netcdf_file.h"
#include "platform/tsb/netcdf_names.h"

namespace gridbay {
namespace {

// A compressed file can hold about this many times its own length; one that claims more is damaged or made to
// harm.
constexpr double kGreatestRatio = 1100;
constexpr std::string_view kNoDataFile = "it is no data file, or it is damaged";
constexpr std::size_t kMostItems = 10000;
constexpr std::size_t kLongestText = 1 << 20;
constexpr std::size_t kLongestBlock = 1 << 20;

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

std::optional<std::string> textAttribute(int file, int variable, const char* name) {
  nc_type type = NC_NAT;
  std::size_t length = 0;
  if (nc_inq_att(file, variable, name, &type, &length) != NC_NOERR || length > kLongestText)
    return std::nullopt;
  if (type == NC_STRING && length == 1) {
    char* text = nullptr;
    if (nc_get_att_string(file, variable, name, &text) != NC_NOERR || text == nullptr) return std::nullopt;
    std::string copy(text);
    nc_free_string(1, &text);
    return copy;
  }
  if (type != NC_CHAR) return std::nullopt;
  std::string text(length, '\0');
  if (nc_get_att_text(file, variable, name, text.data()) != NC_NOERR) return std::nullopt;
  text.resize(std::min(text.find('\0'), text.size()));
  return text;
}

std::optional<double> numberAttribute(int file, int variable, const char* name) {
  nc_type type = NC_NAT;
  std::size_t length = 0;
  double number = 0;
  if (nc_inq_att(file, variable, name, &type, &length) != NC_NOERR || length != 1) return std::nullopt;
  if (type == NC_CHAR || type == NC_STRING || nc_get_att_double(file, variable, name, &number) != NC_NOERR) {
    return std::nullopt;
  }
  return number;
}

std::optional<int> integerAttribute(int file, int variable, const char* name) {
  const std::optional<double> number = numberAttribute(file, variable, name);
  if (!number || !(std::abs(*number) < 1e9)) return std::nullopt;
  return static_cast<int>(*number);
}

// The dimensions of a variable as their lengths, or nothing when it is not there.
std::optional<std::vector<std::size_t>> shapeOf(int file, int variable) {
  int rank = 0;
  if (nc_inq_varndims(file, variable, &rank) != NC_NOERR || rank < 0 || rank > 8) return std::nullopt;
  std::vector<int> dimensions(static_cast<std::size_t>(rank));
  if (nc_inq_vardimid(file, variable, dimensions.data()) != NC_NOERR) return std::nullopt;
  std::vector<std::size_t> shape(dimensions.size());
  for (std::size_t i = 0; i < shape.size(); ++i) {
    if (nc_inq_dimlen(file, dimensions[i], &shape[i]) != NC_NOERR) return std::nullopt;
  }
  return shape;
}

// The library reads texts where it is asked for numbers, and forgets them.
bool holdsNumbers(int file, int variable) {
  nc_type type = NC_NAT;
  return nc_inq_vartype(file, variable, &type) == NC_NOERR && type != NC_CHAR && type <= NC_MAX_ATOMIC_TYPE &&
         type != NC_STRING;
}

std::optional<std::vector<double>> numbersOf(int file, int variable, std::size_t count) {
  std::vector<double> numbers(count);
  if (!holdsNumbers(file, variable) || nc_get_var_double(file, variable, numbers.data()) != NC_NOERR)
    return std::nullopt;
  return numbers;
}

// The moment after "since" in the units of a calendar axis.
std::optional<std::array<std::int32_t, 6>> startOf(std::string_view text) {
  std::array<std::int32_t, 6> parts{};
  for (std::size_t i = 0; i < parts.size(); ++i) {
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), parts[i]);
    if (error != std::errc()) return std::nullopt;
    text.remove_prefix(static_cast<std::size_t>(end - text.data()));
    if (!text.empty()) text.remove_prefix(1);
  }
  return parts;
}

// Reads the parts of a definition one after another; each step says what it could not find.
class DefinitionReader {
 public:
  DefinitionReader(int file, double fileSize, TsbDefinition& definition, std::vector<int>& itemVariables)
      : file_(file), fileSize_(fileSize), definition_(definition), itemVariables_(itemVariables) {}

  Outcome read() {
    definition_.title = textAttribute(file_, NC_GLOBAL, tsb::kTitle).value_or("");
    definition_.history = textAttribute(file_, NC_GLOBAL, tsb::kHistory).value_or("");
    definition_.dataType = integerAttribute(file_, NC_GLOBAL, tsb::kDataType).value_or(0);
    if (Outcome time = readTime(); !time) return time;
    if (Outcome axes = readAxes(); !axes) return axes;
    if (Outcome items = readItems(); !items) return items;
    readGeography();
    readCustomBlocks();
    return {};
  }

 private:
  Outcome readTime() {
    const std::optional<int> variable = findVariable(file_, tsb::kTime);
    const auto shape = variable ? shapeOf(file_, *variable) : std::nullopt;
    if (!shape || shape->size() != 1) return Failure{"it has no time axis"};
    TsbTimeAxis& time = definition_.time;
    time.count = shape->front();
    if (time.count == 0) return Failure{"its time axis has no steps"};
    if (!fits(time.count)) return Failure{"its time axis says more steps than the file can hold"};
    const int type = integerAttribute(file_, *variable, tsb::kAxisType).value_or(0);
    if (type < 1 || type > 4) return Failure{"its time axis is of an unknown kind"};
    time.type = static_cast<TsbTimeAxisType>(type);
    const std::string units = textAttribute(file_, *variable, "units").value_or("");
    const std::size_t since = units.find(" since ");
    time.unit = units.substr(0, since);
    if (time.isCalendar()) {
      constexpr std::size_t kSinceLength = 7;
      const auto start =
          since == units.npos ? std::nullopt : startOf(std::string_view(units).substr(since + kSinceLength));
      if (!start) return Failure{"its time axis has no start date"};
      time.start = *start;
    }
    if (time.isEquidistant()) {
      const auto first = numberAttribute(file_, *variable, tsb::kFirst);
      const auto step = numberAttribute(file_, *variable, tsb::kStep);
      if (!first || !step) return Failure{"its equidistant time axis has no step"};
      time.first = *first;
      time.step = *step;
      return {};
    }
    auto values = numbersOf(file_, *variable, time.count);
    if (!values) return Failure{"its time axis cannot be read"};
    time.values = *std::move(values);
    return {};
  }

  Outcome readAxes() {
    for (const char* name : tsb::kAxes) {
      const std::optional<int> variable = findVariable(file_, name);
      if (!variable) break;
      const auto shape = shapeOf(file_, *variable);
      const auto first = numberAttribute(file_, *variable, tsb::kFirst);
      const auto spacing = numberAttribute(file_, *variable, tsb::kStep);
      if (!shape || shape->size() != 1 || !first || !spacing) {
        return Failure{"its axis " + std::string(name) + " is not equidistant"};
      }
      if (shape->front() == 0) return Failure{"its axis " + std::string(name) + " has no points"};
      definition_.axes.push_back(
          {shape->front(), *first, *spacing, textAttribute(file_, *variable, "units").value_or("")});
    }
    double points = 1;
    for (const TsbGridAxis& axis : definition_.axes) points *= static_cast<double>(axis.points);
    if (!fits(points)) return Failure{"its axes say more points than the file can hold"};
    return {};
  }

  Outcome readItems() {
    int count = 0;
    if (nc_inq_nvars(file_, &count) != NC_NOERR || count < 0) return Failure{"its items cannot be read"};
    std::map<int, int> byNumber;
    for (int variable = 0; variable < count; ++variable) {
      if (const auto number = integerAttribute(file_, variable, tsb::kItemNumber))
        byNumber.emplace(*number, variable);
    }
    if (byNumber.empty()) return Failure{"it has no items (variables with an item type)"};
    if (byNumber.size() > kMostItems) return Failure{"it has too many items"};
    std::vector<std::size_t> wanted{definition_.time.count};
    for (auto axis = definition_.axes.rbegin(); axis != definition_.axes.rend(); ++axis)
      wanted.push_back(axis->points);
    for (const auto& [number, variable] : byNumber) {
      TsbItem item;
      item.name = textAttribute(file_, variable, "long_name").value_or("");
      item.type = integerAttribute(file_, variable, tsb::kItemType).value_or(item.type);
      item.unit = textAttribute(file_, variable, "units").value_or("");
      nc_type type = NC_NAT;
      const bool typed =
          nc_inq_vartype(file_, variable, &type) == NC_NOERR && (type == NC_FLOAT || type == NC_DOUBLE);
      const auto shape = shapeOf(file_, variable);
      if (!typed || !shape || *shape != wanted) {
        return Failure{"its item \"" + item.name + "\" does not have the shape of its axes"};
      }
      item.isDouble = type == NC_DOUBLE;
      item.deleteValue = numberAttribute(file_, variable, "_FillValue").value_or(item.deleteValue);
      definition_.items.push_back(std::move(item));
      itemVariables_.push_back(variable);
    }
    return {};
  }

  void readGeography() {
    const std::optional<int> variable = findVariable(file_, tsb::kProjection);
    if (!variable) return;
    const auto name = textAttribute(file_, *variable, tsb::kProjectionName);
    const auto longitude = numberAttribute(file_, *variable, tsb::kLongitude);
    const auto latitude = numberAttribute(file_, *variable, tsb::kLatitude);
    if (!name || !longitude || !latitude) return;
    const double rotation = numberAttribute(file_, *variable, tsb::kRotation).value_or(0);
    definition_.geography = TsbGeography{*name, *longitude, *latitude, rotation};
  }

  // A block that cannot be read stays in the row as such: who needs it finds out there.
  void readCustomBlocks() {
    int group = 0;
    int count = 0;
    if (nc_inq_grp_ncid(file_, tsb::kCustomBlocks, &group) != NC_NOERR) return;
    if (nc_inq_nvars(group, &count) != NC_NOERR) return;
    for (int variable = 0; variable < count; ++variable) {
      TsbCustomBlock block{textAttribute(group, variable, tsb::kBlockName).value_or(""), {}, false};
      const auto shape = shapeOf(group, variable);
      if (shape && shape->size() == 1 && shape->front() <= kLongestBlock) {
        block.values.resize(shape->front());
        block.readable = holdsNumbers(group, variable) &&
                         nc_get_var_float(group, variable, block.values.data()) == NC_NOERR;
      }
      definition_.customBlocks.push_back(std::move(block));
    }
  }

  bool fits(auto count) const {
    return static_cast<double>(count) * sizeof(float) <= fileSize_ * kGreatestRatio;
  }

  static std::optional<int> findVariable(int file, const char* name) {
    int variable = 0;
    return nc_inq_varid(file, name, &variable) == NC_NOERR ? std::optional(variable) : std::nullopt;
  }

  int file_;
  double fileSize_;
  TsbDefinition& definition_;
  std::vector<int>& itemVariables_;
};

// What a file says of itself, and its items' variables in the library.
struct Content {
  TsbDefinition definition;
  std::vector<int> itemVariables;
};

KnownFiles& knownFiles() {
  static KnownFiles files;
  return files;
}

// The contents of known files, by the state in which they were read: a model asks for its files at each
// check, and to open one takes longer than most of what is done with it.
std::map<FileStamp, std::shared_ptr<const Content>>& knownContents() {
  static std::map<FileStamp, std::shared_ptr<const Content>> contents;
  return contents;
}

void keepContent(const FileStamp& state, const std::shared_ptr<const Content>& content) {
  constexpr std::size_t kMost = 64;
  if (knownContents().size() >= kMost) knownContents().clear();
  knownContents()[state] = content;
}

}  // namespace

struct TsbFile::State {
  State(std::string name, NetcdfFile open) : path(std::move(name)), file(std::move(open)) {}
  State(std::string name, const FileStamp& as, std::shared_ptr<const Content> known)
      : path(std::move(name)), knownAs(as), content(std::move(known)) {}

  std::string path;
  mutable std::optional<NetcdfFile> file;  // opened when it is read from
  std::optional<FileStamp> knownAs;        // where the content was read before
  std::shared_ptr<const Content> content;

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
    auto reading = std::make_shared<Content>();
    content = reading;
    return DefinitionReader(file->id(), static_cast<double>(sizeOf(path)), reading->definition,
                            reading->itemVariables)
        .read();
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
