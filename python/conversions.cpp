#include <fmt/format.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <algorithm>
#include <filesystem>

#include "conversion/raster_conversion.h"
#include "conversion/series_conversion.h"
#include "platform/files/may_write.h"
#include "platform/units/units.h"
#include "python/arguments.h"
#include "python/item_type_text.h"

namespace gridbay::python {
namespace py = pybind11;

namespace {

// One for all columns, or one for each.
struct ItemTypes {
  std::vector<std::string> texts;
};
// One number, or several.
struct Numbers {
  std::vector<double> all;
};
// A moment as a datetime or its text.
struct MomentText {
  std::string text;
};
// One of several names.
struct ResamplingName {
  Resampling way;
};
struct GriddingName {
  Gridding way;
};
struct DateOrderName {
  DateOrder order;
};
// A function of what is done and the whole, or None.
struct Progress {
  py::object function;
};

}  // namespace

template <>
struct Taken<ItemTypes> {
  static constexpr const char* kName = "str | int | list";
  static ItemTypes from(const Given& given) {
    if (ItemTypeText::isOne(given.value)) return {{Taken<ItemTypeText>::from(given).text}};
    ItemTypes types;
    for (ItemTypeText& type : Taken<std::vector<ItemTypeText>>::from(given))
      types.texts.push_back(std::move(type.text));
    return types;
  }
};
template <>
struct Taken<Numbers> {
  static constexpr const char* kName = "float | list";
  static Numbers from(const Given& given) {
    if (PySequence_Check(given.value.ptr()) != 0) return {Taken<std::vector<double>>::from(given)};
    return {{Taken<double>::from(given)}};
  }
};
template <>
struct Taken<MomentText> {
  static constexpr const char* kName = "datetime.datetime";
  static MomentText from(const Given& given) {
    if (PyUnicode_Check(given.value.ptr()) != 0) return {textOf(given.value, given.path)};
    const auto [year, month, day, hour, minute, second] = momentOf(given.value, given.path);
    return {fmt::format("{:04}-{:02}-{:02} {:02}:{:02}:{:02}", year, month, day, hour, minute, second)};
  }
};
template <class Value>
Value named(const std::map<std::string, Value>& names, const Given& given) {
  const std::string name = textOf(given.value, given.path);
  const auto found = names.find(name);
  if (found != names.end()) return found->second;
  std::string allowed;
  for (const auto& [each, value] : names) allowed += (allowed.empty() ? "" : ", ") + each;
  throw refusal(kWrongValue, given.path, shown(given.value), allowed);
}
template <>
struct Taken<ResamplingName> {
  static constexpr const char* kName = "str";
  static ResamplingName from(const Given& given) { return {named(resamplingNames(), given)}; }
};
template <>
struct Taken<GriddingName> {
  static constexpr const char* kName = "str";
  static GriddingName from(const Given& given) { return {named(griddingNames(), given)}; }
};
template <>
struct Taken<DateOrderName> {
  static constexpr const char* kName = "str";
  static DateOrderName from(const Given& given) { return {named(dateOrderNames(), given)}; }
};
template <>
struct Taken<Progress> {
  static constexpr const char* kName = "Callable[[int, int], bool | None] | None";
  static Progress from(const Given& given) {
    if (!given.value.is_none() && PyCallable_Check(given.value.ptr()) == 0)
      throw refusal(kWrongType, given.path, shown(given.value), "a function of two numbers, or None");
    return {py::reinterpret_borrow<py::object>(given.value)};
  }
};

namespace {

// Keeps the notes, calls a function of the script as the work goes on, and lets Ctrl-C stop it.
class ScriptConversion final : public ConversionHost {
 public:
  explicit ScriptConversion(py::object progress) : progress_(std::move(progress)) {}

  void note(const std::string& text) override { notes.push_back(text); }
  bool reached(std::size_t done, std::size_t total) override {
    if (PyErr_CheckSignals() != 0) throw py::error_already_set();
    if (progress_.is_none()) return true;
    const py::object answer = progress_(done, total);
    return answer.is_none() || py::cast<bool>(answer);
  }
  std::string option(std::string_view name, std::string_view placeholder) const override {
    std::string text(name);
    std::ranges::replace(text, '-', '_');
    if (!placeholder.empty()) text += "=" + std::string(placeholder);
    return name == "force" ? "force=True" : text;
  }
  std::string itemTypeList() const override { return "gridbay_setup.item_types() lists them"; }

  std::vector<std::string> notes;

 private:
  py::object progress_;
};

// The result as a dictionary; an error as an exception.
template <class Converted, class Conversion>
py::dict convert(Result<Converted> (*work)(const Conversion&, ConversionHost&), const Conversion& conversion,
                 const py::object& progress, std::string_view allowed, auto fill) {
  ScriptConversion host(progress);
  const Result<Converted> converted = work(conversion, host);
  if (!converted) {
    if (converted.error() == kConversionStopped) throw Refusal{kStopped, converted.error(), conversion.in};
    std::error_code error;
    if (!std::filesystem::exists(conversion.in, error))
      throw fileRefusal(conversion.in, converted.error(), "a file that is there");
    const Outcome free = mayWrite(conversion.out, conversion.force, {&conversion.in, 1}, "force=True");
    if (!free && free.error() == converted.error())
      throw fileRefusal(conversion.out, converted.error(), kNewFile);
    if (converted.error().find('"' + conversion.out + '"') != std::string::npos)
      throw fileRefusal(conversion.out, converted.error(), "a file that can be written");
    Refusal wrong = fileRefusal(conversion.in, converted.error(), allowed);
    wrong.kind = kWrongValue;
    throw wrong;
  }
  py::dict result;
  result["summary"] = textObject(converted->summary);
  result["notes"] = host.notes;
  fill(result, *converted);
  return result;
}

py::dict raster(RasterConversion conversion, const py::object& progress) {
  return convert(convertRaster, conversion, progress, "a raster, and options that make a map of it",
                 [](py::dict& result, const ConvertedRaster& made) {
                   result["points"] = py::make_tuple(made.points[0], made.points[1]);
                   result["spacing"] = py::make_tuple(made.spacing[0], made.spacing[1]);
                   result["first"] = py::make_tuple(made.first[0], made.first[1]);
                   result["rotation"] = made.rotation;
                   result["missing"] = made.missing;
                 });
}

py::dict series(SeriesConversion conversion, const py::object& progress) {
  return convert(convertSeries, conversion, progress, "a text, and options that make a time series of it",
                 [](py::dict& result, const ConvertedSeries& made) {
                   result["items"] = made.items;
                   result["steps"] = made.steps;
                   result["equidistant"] = made.equidistant;
                   result["first"] = made.first;
                   result["last"] = made.last;
                 });
}

}  // namespace

void addConversions(py::module_& module) {
  using Path = std::string;
  const auto file = [](const char* name) { return Argument{.name = name, .form = Argument::Form::file}; };
  addFunction(
      module, "convert_raster",
      [](Path in, Path out, std::optional<float> land, std::optional<ItemTypeText> itemType,
         std::optional<int> band, std::optional<int> subdataset, std::optional<float> nodataAs,
         std::string crs, std::string reproject, std::optional<double> resample, ResamplingName resampling,
         std::optional<GriddingName> gridding, std::optional<double> originX, std::optional<double> originY,
         int coarsen, std::optional<std::array<int, 4>> window, std::optional<std::array<double, 4>> extent,
         bool force, std::string history, Progress progress) {
        RasterConversion conversion{
            .in = std::move(in),
            .out = std::move(out),
            .land = land,
            .itemType = itemType ? std::optional(std::move(itemType->text)) : std::nullopt,
            .band = band,
            .subdataset = subdataset.value_or(0),
            .missingAs = nodataAs,
            .crs = std::move(crs),
            .reproject = std::move(reproject),
            .resample = resample,
            .resampling = resampling.way,
            .gridding = gridding ? std::optional(gridding->way) : std::nullopt,
            .originX = originX,
            .originY = originY,
            .coarsen = coarsen,
            .window = window,
            .extent = extent,
            .force = force,
            .history = std::move(history)};
        return raster(std::move(conversion), progress.function);
      },
      {file("source"), file("target"), {"land"},     {"item_type"}, {"band"},
       {"subdataset"}, {"nodata_as"},  {"crs"},      {"reproject"}, {"resample"},
       {"resampling"}, {"gridding"},   {"origin_x"}, {"origin_y"},  {"coarsen"},
       {"window"},     {"extent"},     {"force"},    {"history"},   {"progress"}},
      "Makes a map from a raster.");
  addFunction(
      module, "convert_series",
      [](Path in, Path out, std::optional<ItemTypes> itemTypes, std::optional<MomentText> start,
         std::string timeUnit, int skipLines, std::optional<Numbers> missing,
         std::optional<DateOrderName> dates, bool force, std::string history, Progress progress) {
        return series({.in = std::move(in),
                       .out = std::move(out),
                       .itemTypes = itemTypes ? std::move(itemTypes->texts) : std::vector<std::string>(),
                       .start = start ? std::move(start->text) : std::string(),
                       .timeUnit = std::move(timeUnit),
                       .skipLines = skipLines,
                       .force = force,
                       .history = std::move(history),
                       .dateOrder = dates ? std::optional(dates->order) : std::nullopt,
                       .missing = missing ? std::move(missing->all) : std::vector<double>()},
                      progress.function);
      },
      {file("source"),
       file("target"),
       {"item_type"},
       {"start"},
       {"time_unit"},
       {"skip_lines"},
       {"missing"},
       {"dates"},
       {"force"},
       {"history"},
       {"progress"}},
      "Makes a time series from text.");
  module.def(
      "item_types",
      [] {
        std::vector<std::tuple<int, std::string, std::string>> types;
        for (const QunItem& quantity : qunItems())
          types.emplace_back(quantity.code, quantity.name, qunBaseUnit(quantity.code)->symbol);
        return types;
      },
      "Code, name and symbol of the base unit of each quantity.");
}

}  // namespace gridbay::python
