#include "platform/tsb/tsb_writer.h"

#include <fmt/format.h>
#include <hdf5.h>
#include <netcdf.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cerrno>
#include <optional>
#include <set>
#include <string_view>
#include <vector>

#include "platform/cartography/cartography.h"
#include "platform/cartography/grid_mapping.h"
#include "platform/files/file_descriptor.h"
#include "platform/files/unfinished_file.h"
#include "platform/tsb/netcdf_names.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

// A file that a full disk kept from being closed stays open for the library, which would fall over it at the
// end of the program. All others are closed by then.
[[maybe_unused]] const bool isLeftOpenAtEnd = H5dont_atexit() >= 0;

// Gives up at the first call of the library that fails.
struct LibraryError {
  int status;
};

void check(int status) {
  if (status != NC_NOERR) throw LibraryError{status};
}

void putText(int file, int variable, const char* name, std::string_view text) {
  check(nc_put_att_text(file, variable, name, text.size(), text.data()));
}
void putNumber(int file, int variable, const char* name, double number) {
  check(nc_put_att_double(file, variable, name, NC_DOUBLE, 1, &number));
}
void putInteger(int file, int variable, const char* name, int number) {
  check(nc_put_att_int(file, variable, name, NC_INT, 1, &number));
}

int addDimension(int file, const char* name, std::size_t length) {
  int dimension = 0;
  check(nc_def_dim(file, name, length, &dimension));
  return dimension;
}

int addVariable(int file, const std::string& name, nc_type type, const std::vector<int>& dimensions) {
  int variable = 0;
  check(nc_def_var(file, name.c_str(), type, static_cast<int>(dimensions.size()), dimensions.data(),
                   &variable));
  return variable;
}

// A name that every reader takes: small letters, digits and underscores, and none twice.
std::string plainName(std::string_view text, std::set<std::string>& taken) {
  std::string name;
  for (const char c : text) {
    const auto byte = static_cast<unsigned char>(c);
    name.push_back(std::isalnum(byte) != 0 && byte < 0x80 ? static_cast<char>(std::tolower(byte)) : '_');
  }
  if (name.empty() || std::isalpha(static_cast<unsigned char>(name.front())) == 0) name = "item_" + name;
  while (!taken.insert(name).second) name += "_2";
  return name;
}

class DefinitionWriter {
 public:
  DefinitionWriter(int file, const TsbDefinition& definition) : file_(file), definition_(definition) {
    if (!definition_.geography) return;
    const CVdMapProjection projection(definition_.geography->projection);
    wkt1_ = projection.Wkt();
    wkt2_ = projection.Wkt2();
    mapping_ = gridMappingOf(wkt2_.empty() ? wkt1_ : wkt2_);
    isTurned_ = definition_.geography->isTurned();
  }

  std::vector<int> write() {
    putText(file_, NC_GLOBAL, "Conventions", "CF-1.8");
    putText(file_, NC_GLOBAL, tsb::kTitle, definition_.title);
    if (!definition_.history.empty()) putText(file_, NC_GLOBAL, tsb::kHistory, definition_.history);
    putInteger(file_, NC_GLOBAL, tsb::kDataType, definition_.dataType);
    addTime();
    addAxes();
    addProjection();
    std::vector<int> items = addItems();
    addCustomBlocks();
    check(nc_enddef(file_));
    putAxisValues();
    putCustomBlocks();
    return items;
  }

 private:
  void addTime() {
    const TsbTimeAxis& time = definition_.time;
    dimensions_.push_back(addDimension(file_, tsb::kTime, time.count));
    timeVariable_ = addVariable(file_, tsb::kTime, NC_DOUBLE, dimensions_);
    std::string units = time.unit;
    if (time.isCalendar()) {
      const auto [year, month, day, hour, minute, second] = time.start;
      units +=
          fmt::format(" since {:04}-{:02}-{:02} {:02}:{:02}:{:02}", year, month, day, hour, minute, second);
      putText(file_, timeVariable_, "standard_name", "time");
      putText(file_, timeVariable_, "calendar", "proleptic_gregorian");
    }
    putText(file_, timeVariable_, "units", units);
    if (qunAreEquivalent(time.unit, "s")) putText(file_, timeVariable_, "axis", "T");
    putInteger(file_, timeVariable_, tsb::kAxisType, static_cast<int>(time.type));
    if (time.isEquidistant()) {
      putNumber(file_, timeVariable_, tsb::kFirst, time.first);
      putNumber(file_, timeVariable_, tsb::kStep, time.step);
    }
  }

  void addAxes() {
    constexpr const char* kNames[] = {"projection_x_coordinate", "projection_y_coordinate"};
    constexpr const char* kLetters[] = {"X", "Y"};
    // The coordinates of a grid that is turned are its own: neither the map's axes nor eastings and
    // northings.
    const bool isProjected = !wkt2_.empty() && !isTurned_ && !isInDegrees();
    for (std::size_t i = definition_.axes.size(); i-- > 0;) {
      const TsbGridAxis& axis = definition_.axes[i];
      const int dimension = addDimension(file_, tsb::kAxes[i], axis.points);
      dimensions_.push_back(dimension);
      const int variable = addVariable(file_, tsb::kAxes[i], NC_DOUBLE, {dimension});
      axisVariables_.insert(axisVariables_.begin(), variable);
      putText(file_, variable, "units", axis.unit);
      if (!isTurned_) putText(file_, variable, "axis", kLetters[i]);
      if (isProjected) putText(file_, variable, "standard_name", kNames[i]);
      putNumber(file_, variable, tsb::kFirst, axis.first);
      putNumber(file_, variable, tsb::kStep, axis.spacing);
    }
  }

  void addProjection() {
    if (!definition_.geography) return;
    const TsbGeography& place = *definition_.geography;
    const int variable = addVariable(file_, tsb::kProjection, NC_INT, {});
    putText(file_, variable, tsb::kProjectionName, place.projection);
    putNumber(file_, variable, tsb::kLongitude, place.longitude);
    putNumber(file_, variable, tsb::kLatitude, place.latitude);
    putNumber(file_, variable, tsb::kRotation, place.rotation);
    if (mapping_) {
      putText(file_, variable, "grid_mapping_name", mapping_->name);
      for (const auto& [name, values] : mapping_->numbers)
        check(nc_put_att_double(file_, variable, name.c_str(), NC_DOUBLE, values.size(), values.data()));
      for (const auto& [name, text] : mapping_->texts) putText(file_, variable, name.c_str(), text);
    }
    if (!wkt2_.empty()) putText(file_, variable, "crs_wkt", wkt2_);
    if (!wkt1_.empty()) putText(file_, variable, "spatial_ref", wkt1_);
    if (isTurned_ && !isInDegrees()) putGeoTransform(variable, place);
  }

  bool isInDegrees() const { return mapping_ && mapping_->name == kGeographicMapping; }

  // The corner of the first point's cell and the steps along a row and from row to row, by which the raster
  // library places a grid that is turned.
  void putGeoTransform(int variable, const TsbGeography& place) {
    double east = 0;
    double north = 0;
    if (definition_.axes.size() != 2 ||
        !CVdMapProjection(place.projection).Geo2Proj(place.longitude, place.latitude, &east, &north))
      return;
    const CVdCartography grid(place.projection, east, north, place.rotation);
    const double dx = definition_.axes[0].spacing;
    const double dy = definition_.axes[1].spacing;
    const auto at = [&grid](double x, double y) {
      std::array<double, 2> there{};
      grid.Xy2Proj(x, y, &there[0], &there[1]);
      return there;
    };
    const auto corner = at(-dx / 2, -dy / 2);
    const auto alongRow = at(dx / 2, -dy / 2);
    const auto nextRow = at(-dx / 2, dy / 2);
    putText(file_, variable, "GeoTransform",
            fmt::format("{:.17g} {:.17g} {:.17g} {:.17g} {:.17g} {:.17g}", corner[0], alongRow[0] - corner[0],
                        nextRow[0] - corner[0], corner[1], alongRow[1] - corner[1], nextRow[1] - corner[1]));
  }

  std::vector<int> addItems() {
    std::set<std::string> taken{tsb::kTime, tsb::kAxes[0], tsb::kAxes[1], tsb::kProjection,
                                tsb::kCustomBlocks};
    std::vector<int> variables;
    for (const TsbItem& item : definition_.items) {
      const int variable =
          addVariable(file_, plainName(item.name, taken), item.isDouble ? NC_DOUBLE : NC_FLOAT, dimensions_);
      variables.push_back(variable);
      check(nc_def_var_chunking(file_, variable, NC_CONTIGUOUS, nullptr));
      const auto single = static_cast<float>(item.deleteValue);
      check(nc_def_var_fill(file_, variable, NC_NOFILL,
                            item.isDouble ? static_cast<const void*>(&item.deleteValue) : &single));
      if (item.isDouble) {
        check(nc_put_att_double(file_, variable, "_FillValue", NC_DOUBLE, 1, &item.deleteValue));
      } else {
        check(nc_put_att_float(file_, variable, "_FillValue", NC_FLOAT, 1, &single));
      }
      putText(file_, variable, "long_name", item.name);
      putText(file_, variable, "units", item.unit);
      if (const std::string_view name = standardNameOf(item); !name.empty())
        putText(file_, variable, "standard_name", name);
      putInteger(file_, variable, tsb::kItemType, item.type);
      putInteger(file_, variable, tsb::kItemNumber, static_cast<int>(variables.size()));
      if (definition_.geography) putText(file_, variable, "grid_mapping", tsb::kProjection);
    }
    return variables;
  }

  void addCustomBlocks() {
    if (definition_.customBlocks.empty()) return;
    int group = 0;
    check(nc_def_grp(file_, tsb::kCustomBlocks, &group));
    std::set<std::string> taken;
    for (const TsbCustomBlock& block : definition_.customBlocks) {
      const std::string name = plainName(block.name, taken);
      const int dimension = addDimension(group, (name + "_values").c_str(), block.values.size());
      const int variable = addVariable(group, name, NC_FLOAT, {dimension});
      putText(group, variable, tsb::kBlockName, block.name);
      blockVariables_.push_back({group, variable});
    }
  }

  void putCustomBlocks() {
    for (std::size_t i = 0; i < blockVariables_.size(); ++i) {
      check(nc_put_var_float(blockVariables_[i].group, blockVariables_[i].variable,
                             definition_.customBlocks[i].values.data()));
    }
  }

  void putAxisValues() {
    std::vector<double> values;
    for (std::size_t i = 0; i < definition_.time.count; ++i) values.push_back(definition_.time.at(i));
    check(nc_put_var_double(file_, timeVariable_, values.data()));
    for (std::size_t a = 0; a < definition_.axes.size(); ++a) {
      const TsbGridAxis& axis = definition_.axes[a];
      values.clear();
      for (std::size_t i = 0; i < axis.points; ++i)
        values.push_back(axis.first + static_cast<double>(i) * axis.spacing);
      check(nc_put_var_double(file_, axisVariables_[a], values.data()));
    }
  }

  // None for a component of a vector, which has the code of the whole, nor for a unit of another kind.
  static std::string_view standardNameOf(const TsbItem& item) {
    const QunItem* quantity = qunFindItem(item.type);
    if (quantity == nullptr || quantity->standardName.empty()) return {};
    std::string name = item.name;
    std::ranges::transform(name, name.begin(),
                           [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    if (name.find("component") != name.npos) return {};
    return qunAreEquivalent(item.unit, qunBaseUnit(item.type)->text) ? quantity->standardName
                                                                     : std::string_view();
  }

  int file_;
  const TsbDefinition& definition_;
  std::string wkt1_;  // of the projection; empty without one
  std::string wkt2_;
  std::optional<GridMapping> mapping_;
  bool isTurned_ = false;
  std::vector<int> dimensions_;  // time, then y, then x
  std::vector<int> axisVariables_;
  int timeVariable_ = 0;
  struct BlockVariable {
    int group;
    int variable;
  };
  std::vector<BlockVariable> blockVariables_;
};

std::string whyNot(const TsbDefinition& definition) {
  if (definition.items.empty()) return "no items are defined";
  if (definition.axes.size() > 2) return "a grid has at most two directions";
  if (definition.pointCount() == 0 || definition.time.count == 0) return "an axis has no points";
  if (!definition.time.isEquidistant() && definition.time.values.size() != definition.time.count) {
    return "the time axis has another number of values than steps";
  }
  return {};
}

}  // namespace

struct TsbWriter::State {
  State(const std::string& name, const TsbDefinition& wanted)
      // A symbolic link stays one, and what it leads to is replaced.
      : path(name), unfinished(name), definition(wanted) {}

  std::string path;
  UnfinishedFile unfinished;
  TsbDefinition definition;
  int file = -1;
  std::vector<int> items;

  ~State() {
    if (file >= 0) nc_close(file);
  }

  Failure failure(const std::string& why) const { return {"cannot write \"" + path + "\": " + why}; }

  template <class Number, class Put>
  Outcome write(std::size_t item, std::size_t step, std::size_t firstRow, std::span<const Number> values,
                Put put) {
    if (item < 1 || item > items.size()) return failure("it has no item " + std::to_string(item));
    const std::size_t steps = definition.axes.empty() ? std::max<std::size_t>(values.size(), 1) : 1;
    if (step >= definition.time.count || steps > definition.time.count - step)
      return failure("it has no time step " + std::to_string(step + steps - 1));
    std::vector<std::size_t> start{step};
    std::vector<std::size_t> count{steps};
    std::size_t wanted = steps;
    for (std::size_t i = definition.axes.size(); i-- > 0;) {
      const bool isRows = i == 1;
      const std::size_t rowLength = definition.axes[0].points;
      const std::size_t length = isRows ? values.size() / rowLength : definition.axes[i].points;
      start.push_back(isRows ? firstRow : 0);
      count.push_back(length);
      wanted *= length;
      if (isRows && firstRow + length > definition.axes[1].points)
        return failure("the grid has no such rows");
    }
    if (values.size() != wanted) return failure("the values do not have the shape of the grid");
    const int status = put(file, items[item - 1], start.data(), count.data(), values.data());
    return status == NC_NOERR ? Outcome() : failure(reason(status));
  }

  static std::string reason(int status) {
    if (errno == ENOSPC || errno == EDQUOT || errno == EFBIG) return "the disk is full";
    return nc_strerror(status);
  }
};

TsbWriter::TsbWriter(std::unique_ptr<State> state) : state_(std::move(state)) {}
TsbWriter::TsbWriter(TsbWriter&&) noexcept = default;
TsbWriter::~TsbWriter() = default;

Result<TsbWriter> TsbWriter::create(const std::string& path, const TsbDefinition& definition) {
  if (const std::string why = whyNot(definition); !why.empty())
    return Failure{"cannot write \"" + path + "\": " + why};
  auto state = std::make_unique<State>(path, definition);
  if (state->unfinished.path().empty()) return Failure{systemError("cannot write", path)};
  try {
    errno = 0;
    check(nc_create(state->unfinished.path().c_str(), NC_NETCDF4 | NC_CLOBBER, &state->file));
    state->items = DefinitionWriter(state->file, definition).write();
  } catch (const LibraryError& error) {
    return state->failure(State::reason(error.status));
  }
  return TsbWriter(std::move(state));
}

Outcome TsbWriter::write(std::size_t item, std::size_t step, std::span<const float> values) {
  return state_->write(item, step, 0, values, nc_put_vara_float);
}

Outcome TsbWriter::write(std::size_t item, std::size_t step, std::span<const double> values) {
  return state_->write(item, step, 0, values, nc_put_vara_double);
}

Outcome TsbWriter::writeRows(std::size_t item, std::size_t step, std::size_t firstRow,
                             std::span<const float> values) {
  return state_->write(item, step, firstRow, values, nc_put_vara_float);
}

Outcome TsbWriter::writeRows(std::size_t item, std::size_t step, std::size_t firstRow,
                             std::span<const double> values) {
  return state_->write(item, step, firstRow, values, nc_put_vara_double);
}

Outcome TsbWriter::commit() {
  errno = 0;
  const int status = nc_close(std::exchange(state_->file, -1));
  if (status != NC_NOERR) return state_->failure(State::reason(status));
  if (!state_->unfinished.finish()) return Failure{systemError("cannot write", state_->path)};
  return {};
}

}  // namespace gridbay
