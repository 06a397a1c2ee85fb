#include "conversion/point_file.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <numeric>
#include <optional>
#include <string_view>

#include "conversion/conversion_host.h"
#include "core/nearest.h"
#include "core/number_text.h"
#include "platform/files/line_reader.h"

namespace gridbay {
namespace {

constexpr std::string_view kBlanks = " \t\r";

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(kBlanks);
  if (first == text.npos) return {};
  return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

// How the lines of a file are divided. Where commas don't divide them, they are decimal ones.
struct Separation {
  char separator = ' ';  // a blank for any number of them

  static Separation of(std::string_view line) {
    for (const char separator : {';', '\t'}) {
      if (line.find(separator) != line.npos) return {separator};
    }
    if (line.find(',') == line.npos) return {};
    const std::vector<std::string_view> words = Separation().fieldsOf(line);
    const bool isDecimal = words.size() >= 3 && std::ranges::none_of(words, [](std::string_view word) {
                             return word.front() == ',' || word.back() == ',';
                           });
    return {isDecimal ? ' ' : ','};
  }

  std::vector<std::string_view> fieldsOf(std::string_view line) const {
    std::vector<std::string_view> fields;
    line = trimmed(line);
    while (!line.empty()) {
      const std::size_t end = separator == ' ' ? line.find_first_of(kBlanks) : line.find(separator);
      fields.push_back(trimmed(line.substr(0, end)));
      if (end == line.npos) break;
      line = separator == ' ' ? trimmed(line.substr(end)) : line.substr(end + 1);
    }
    return fields;
  }

  std::optional<double> numberOf(std::string_view field) const {
    std::string plain;
    if (separator != ',' && field.find(',') != field.npos) {
      plain = field;
      plain[plain.find(',')] = '.';
      field = plain;
    }
    if (!field.empty() && field.front() == '+') field.remove_prefix(1);
    const std::optional<double> number = doubleOfText(field);
    return number && std::isfinite(*number) ? number : std::nullopt;
  }
};

bool isPassedOver(std::string_view line) {
  line = trimmed(line);
  return line.empty() || line.front() == '#';
}

using Columns = std::array<std::size_t, 3>;

// Whether the columns of a line are numbers.
bool isPoint(const Separation& separation, std::string_view line, const Columns& columns) {
  const std::vector<std::string_view> fields = separation.fieldsOf(line);
  return std::ranges::all_of(columns, [&](std::size_t column) {
    return column < fields.size() && separation.numberOf(fields[column]);
  });
}

// The columns that a heading names; the first three where it doesn't name all.
Columns columnsOf(std::string_view heading) {
  constexpr std::array<std::array<std::string_view, 5>, 3> kNames{
      {{"x", "easting", "east", "lon", "longitude"},
       {"y", "northing", "north", "lat", "latitude"},
       {"z", "elevation", "height", "level", "value"}}};
  Columns columns{0, 1, 2};
  Columns named{};
  std::size_t count = 0;
  const std::vector<std::string_view> fields = Separation::of(heading).fieldsOf(heading);
  for (std::size_t axis = 0; axis < kNames.size(); ++axis) {
    const auto found = std::ranges::find_if(fields, [&](std::string_view field) {
      const std::string name = lowered(field.substr(0, field.find_first_of("([ ")));
      return std::ranges::find(kNames[axis], name) != kNames[axis].end();
    });
    if (found == fields.end()) continue;
    named[axis] = static_cast<std::size_t>(found - fields.begin());
    ++count;
  }
  return count == kNames.size() ? named : columns;
}

// Whether a text has a line as it is wanted, below one heading at most.
template <class IsWanted>
bool beginsWith(const std::string& path, const IsWanted& isWanted) {
  Result<LineReader> reader = LineReader::open(path);
  if (!reader) return false;
  int others = 0;
  Columns columns{0, 1, 2};
  while (const std::optional<std::string_view> line = reader->next()) {
    if (isPassedOver(*line)) continue;
    if (isWanted(Separation::of(*line), *line, columns)) return true;
    if (++others > 1) return false;
    columns = columnsOf(*line);
  }
  return false;
}

}  // namespace

double PointSet::meanDistance() const {
  if (x.empty()) return 0;
  const auto [west, east] = std::ranges::minmax(x);
  const auto [south, north] = std::ranges::minmax(y);
  return std::sqrt((east - west) * (north - south) / static_cast<double>(x.size()));
}

bool PointSet::areInLine() const {
  const double count = static_cast<double>(x.size());
  const double east = std::accumulate(x.begin(), x.end(), 0.0) / count;
  const double north = std::accumulate(y.begin(), y.end(), 0.0) / count;
  double xx = 0;
  double xy = 0;
  double yy = 0;
  for (std::size_t i = 0; i < x.size(); ++i) {
    xx += (x[i] - east) * (x[i] - east);
    xy += (x[i] - east) * (y[i] - north);
    yy += (y[i] - north) * (y[i] - north);
  }
  constexpr double kNoWidth = 1e-12;
  return !(xx * yy - xy * xy > kNoWidth * xx * yy);
}

bool holdsPoints(const std::string& path) {
  return beginsWith(path, isPoint);
}

bool holdsNumbers(const std::string& path) {
  return beginsWith(path, [](const Separation& separation, std::string_view line, const Columns&) {
    const std::vector<std::string_view> fields = separation.fieldsOf(line);
    return fields.size() > 1 && std::ranges::all_of(fields, [&](std::string_view field) {
             return separation.numberOf(field).has_value();
           });
  });
}

Result<PointSet> readPoints(const std::string& path, const std::function<bool(double)>& progress) {
  Result<LineReader> reader = LineReader::open(path, progress);
  if (!reader) return Failure{reader.error()};
  PointSet points;
  std::optional<Separation> separation;
  Columns columns{0, 1, 2};
  bool hasHeading = false;
  std::size_t number = 0;
  while (const std::optional<std::string_view> line = reader->next()) {
    ++number;
    if (isPassedOver(*line)) continue;
    if (!separation) {
      const Separation own = Separation::of(*line);
      if (!hasHeading && !isPoint(own, *line, columns)) {
        hasHeading = true;
        columns = columnsOf(*line);
        continue;
      }
      separation = own;
    }
    const std::vector<std::string_view> fields = separation->fieldsOf(*line);
    std::array<double, 3> values{};
    for (std::size_t axis = 0; axis < values.size(); ++axis) {
      constexpr std::string_view kNames = "xyz";
      if (columns[axis] >= fields.size())
        return Failure{fmt::format("\"{}\", line {}: a point has three numbers, x, y and z", path, number)};
      const std::optional<double> value = separation->numberOf(fields[columns[axis]]);
      if (!value && kNames[axis] == 'z' && lowered(fields[columns[axis]]) == "nan") {
        values[axis] = std::numeric_limits<double>::quiet_NaN();
        continue;
      }
      if (!value)
        return Failure{fmt::format("\"{}\", line {}: \"{}\" is no number for {}", path, number,
                                   fields[columns[axis]], kNames[axis])};
      values[axis] = *value;
    }
    if (std::isnan(values[2])) continue;
    points.x.push_back(values[0]);
    points.y.push_back(values[1]);
    points.z.push_back(values[2]);
  }
  if (reader->isStopped()) return Failure{std::string(kConversionStopped)};
  if (reader->hasFailed()) return Failure{fmt::format("cannot read \"{}\" behind line {}", path, number)};
  constexpr std::size_t kFewest = 3;
  if (points.x.size() < kFewest)
    return Failure{fmt::format("\"{}\" holds {} point{}; a grid needs at least {}", path, points.x.size(),
                               points.x.size() == 1 ? "" : "s", kFewest)};
  return points;
}

}  // namespace gridbay
