#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <algorithm>
#include <filesystem>

#include "conversion/raster_conversion.h"
#include "conversion/series_conversion.h"
#include "platform/units/units.h"
#include "python/refusal.h"

namespace gridbay::python {
namespace py = pybind11;

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
                 const py::object& progress, auto fill) {
  ScriptConversion host(progress);
  const Result<Converted> converted = work(conversion, host);
  if (!converted) {
    const bool stopped = converted.error() == kConversionStopped;
    const bool isOfFiles = !std::filesystem::exists(conversion.in) ||
                           (!conversion.force && std::filesystem::exists(conversion.out));
    throw Refusal{stopped     ? kStopped
                  : isOfFiles ? kFileError
                              : kWrongValue,
                  converted.error(), conversion.in};
  }
  py::dict result;
  result["summary"] = converted->summary;
  result["notes"] = host.notes;
  fill(result, *converted);
  return result;
}

py::dict raster(RasterConversion conversion, const py::object& progress) {
  return convert(convertRaster, conversion, progress, [](py::dict& result, const ConvertedRaster& made) {
    result["points"] = py::make_tuple(made.points[0], made.points[1]);
    result["spacing"] = py::make_tuple(made.spacing[0], made.spacing[1]);
    result["first"] = py::make_tuple(made.first[0], made.first[1]);
    result["rotation"] = made.rotation;
    result["missing"] = made.missing;
  });
}

py::dict series(SeriesConversion conversion, const py::object& progress) {
  return convert(convertSeries, conversion, progress, [](py::dict& result, const ConvertedSeries& made) {
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
  module.def(
      "convert_raster",
      [](Path in, Path out, std::optional<float> land, std::optional<std::string> itemType,
         std::optional<int> band, std::optional<int> subdataset, std::optional<float> nodataAs,
         std::string crs, std::string reproject, std::optional<double> resample,
         std::optional<double> originX, std::optional<double> originY, int coarsen,
         std::optional<std::array<int, 4>> window, bool force, std::string history,
         const py::object& progress) {
        return raster({.in = std::move(in),
                       .out = std::move(out),
                       .land = land,
                       .itemType = std::move(itemType),
                       .band = band,
                       .subdataset = subdataset.value_or(0),
                       .missingAs = nodataAs,
                       .crs = std::move(crs),
                       .reproject = std::move(reproject),
                       .resample = resample,
                       .originX = originX,
                       .originY = originY,
                       .coarsen = coarsen,
                       .window = window,
                       .force = force,
                       .history = std::move(history)},
                      progress);
      },
      py::arg("source"), py::arg("target"), py::kw_only(), py::arg("land"), py::arg("item_type"),
      py::arg("band"), py::arg("subdataset"), py::arg("nodata_as"), py::arg("crs"), py::arg("reproject"),
      py::arg("resample"), py::arg("origin_x"), py::arg("origin_y"), py::arg("coarsen"), py::arg("window"),
      py::arg("force"), py::arg("history"), py::arg("progress"), "Makes a map from a raster.");
  module.def(
      "convert_series",
      [](Path in, Path out, std::vector<std::string> itemTypes, std::string start, std::string timeUnit,
         int skipLines, bool force, std::string history, const py::object& progress) {
        return series({.in = std::move(in),
                       .out = std::move(out),
                       .itemTypes = std::move(itemTypes),
                       .start = std::move(start),
                       .timeUnit = std::move(timeUnit),
                       .skipLines = skipLines,
                       .force = force,
                       .history = std::move(history)},
                      progress);
      },
      py::arg("source"), py::arg("target"), py::kw_only(), py::arg("item_types"), py::arg("start"),
      py::arg("time_unit"), py::arg("skip_lines"), py::arg("force"), py::arg("history"), py::arg("progress"),
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
