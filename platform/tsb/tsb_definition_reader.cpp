#include "platform/tsb/tsb_definition_reader.h"

#include <netcdf.h>

#include <array>
#include <charconv>
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "platform/tsb/netcdf_attributes.h"
#include "platform/tsb/netcdf_names.h"

namespace gridbay {
namespace {

// A compressed file can hold about this many times its own length; one that claims more is damaged or made to
// harm.
constexpr double kGreatestRatio = 1100;
constexpr std::size_t kMostItems = 10000;
constexpr std::size_t kLongestBlock = 1 << 20;

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
  DefinitionReader(int file, double fileSize, TsbContent& content)
      : file_(file),
        fileSize_(fileSize),
        definition_(content.definition),
        itemVariables_(content.itemVariables) {}

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

}  // namespace

Outcome readTsbContent(int file, double fileSize, TsbContent& content) {
  return DefinitionReader(file, fileSize, content).read();
}

}  // namespace gridbay
