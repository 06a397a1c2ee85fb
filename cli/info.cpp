#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <filesystem>
#include <fstream>
#include <limits>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "cli/commands.h"
#include "cli/info_modules.h"
#include "cli/info_report.h"
#include "cli/info_topics.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"

namespace gridbay::cli {
namespace {

struct InfoOptions {
  std::string file;
  bool json = false;
};

std::string_view typeName(int code) {
  const QunItem* found = qunFindItem(code);
  return found == nullptr ? "unknown quantity" : found->name;
}

Json describeTime(const TsbTimeAxis& time) {
  Json axis{{"steps", time.count}, {"unit", time.unit}, {"equidistant", time.isEquidistant()}};
  if (time.isCalendar()) axis["start"] = dateTimeText(DateTime::of(time.start));
  axis["first"] = time.at(0);
  axis["last"] = time.at(time.count - 1);
  if (time.isEquidistant()) axis["step"] = time.step;
  return axis;
}

// Least and greatest value, missing values left out.
template <class Number>
class Range {
 public:
  explicit Range(double missing) : missing_(missing) {}

  void take(std::span<const Number> values) {
    const auto missing = static_cast<Number>(missing_);
    for (const Number value : values) {
      if (std::isnan(value) || value == missing) continue;
      least_ = std::min(least_, static_cast<double>(value));
      greatest_ = std::max(greatest_, static_cast<double>(value));
    }
  }
  // Null when there is no value.
  Json json() const {
    return least_ > greatest_
               ? Json(nullptr)
               : Json{{"least", plain<Number>(least_)}, {"greatest", plain<Number>(greatest_)}};
  }

 private:
  double missing_;
  double least_ = std::numeric_limits<double>::infinity();
  double greatest_ = -std::numeric_limits<double>::infinity();
};

// Bytes of values that are read through to tell their range, and those that are in memory at a time.
constexpr std::size_t kMostBytes = std::size_t{256} << 20U;
constexpr std::size_t kBytesAtOnce = std::size_t{16} << 20U;

// The range of an item over the first `steps` time steps, read a part at a time: whole steps, or some rows of
// a large grid. Null where it can't be read.
template <class Number>
Json rangeOf(const TsbFile& file, std::size_t item, std::size_t steps) {
  const TsbDefinition& definition = file.definition();
  const std::size_t points = definition.pointCount();
  constexpr std::size_t kValuesAtOnce = kBytesAtOnce / sizeof(Number);
  Range<Number> range(definition.items[item - 1].deleteValue);
  std::vector<Number> values;
  const bool byRows = definition.axes.size() == 2 && points > kValuesAtOnce;
  const std::size_t parts = byRows ? definition.axes[1].points : steps;
  const std::size_t partSize = byRows ? definition.axes[0].points : points;
  const std::size_t partsAtOnce = std::max<std::size_t>(kValuesAtOnce / partSize, 1);
  for (std::size_t step = 0; step < (byRows ? steps : 1); ++step) {
    for (std::size_t first = 0; first < parts; first += partsAtOnce) {
      values.resize(std::min(partsAtOnce, parts - first) * partSize);
      const std::span<Number> part(values);
      if (const Outcome read =
              byRows ? file.readRows(item, step, first, part) : file.readSteps(item, first, part);
          !read) {
        return nullptr;
      }
      range.take(std::span<const Number>(part));
    }
  }
  return range.json();
}

Json describeRange(const TsbFile& file, std::size_t item, std::size_t steps) {
  return file.definition().items[item - 1].isDouble ? rangeOf<double>(file, item, steps)
                                                    : rangeOf<float>(file, item, steps);
}

// Whether the values are few enough to be read through. They have the files' width: a double's is twice a
// float's.
bool canReadAll(const TsbDefinition& definition) {
  double bytes = 0;
  for (const TsbItem& item : definition.items) bytes += item.isDouble ? sizeof(double) : sizeof(float);
  return bytes * static_cast<double>(definition.pointCount()) * static_cast<double>(definition.time.count) <=
         static_cast<double>(kMostBytes);
}

Json describeDataFile(const TsbFile& file) {
  const TsbDefinition& definition = file.definition();
  Json report{{"kind", "data file"},
              {"title", definition.title},
              {"data_type", definition.dataType},
              {"dimensions", definition.axes.size()},
              {"time", describeTime(definition.time)},
              {"axes", Json::array()},
              {"items", Json::array()},
              {"custom_blocks", Json::object()}};
  for (const TsbGridAxis& axis : definition.axes) {
    report["axes"].push_back(
        {{"points", axis.points}, {"first", axis.first}, {"spacing", axis.spacing}, {"unit", axis.unit}});
  }
  const bool all = canReadAll(definition);
  for (std::size_t i = 0; i < definition.items.size(); ++i) {
    const TsbItem& item = definition.items[i];
    const Json first = describeRange(file, i + 1, 1);
    const Json range = definition.time.count == 1 ? first
                       : all                      ? describeRange(file, i + 1, definition.time.count)
                                                  : Json(nullptr);
    report["items"].push_back({{"number", i + 1},
                               {"name", item.name},
                               {"type", item.type},
                               {"quantity", typeName(item.type)},
                               {"unit", item.unit},
                               {"first_step", first},
                               {"range", range}});
  }
  for (const TsbCustomBlock& block : definition.customBlocks)
    report["custom_blocks"][block.name] = block.values;
  if (definition.geography) {
    const TsbGeography& place = *definition.geography;
    report["geography"] = {{"projection", CVdMapProjection(place.projection).Name()},
                           {"longitude", place.longitude},
                           {"latitude", place.latitude},
                           {"rotation", place.rotation}};
  }
  return report;
}

void printDataFile(const Json& report, const Console& console) {
  const auto line = [&console](std::string_view label, const std::string& text) {
    console.out << fmt::format("{:<12} {}\n", label, text);
  };
  line("Data file",
       fmt::format("{} (data type {})", report["title"].get<std::string>(), report["data_type"].get<int>()));
  const Json& time = report["time"];
  line("Time",
       fmt::format("{} step{}{}, {:g} to {:g} {}", time["steps"].get<std::size_t>(),
                   time["steps"] == 1 ? "" : "s",
                   time.contains("start") ? " from " + time["start"].get<std::string>() : "",
                   time["first"].get<double>(), time["last"].get<double>(), time["unit"].get<std::string>()));
  for (std::size_t i = 0; i < report["axes"].size(); ++i) {
    const Json& axis = report["axes"][i];
    line(fmt::format("Axis {}", "XY"[i]),
         fmt::format("{} points, {:.6g} {} apart, from {:.10g}", axis["points"].get<std::size_t>(),
                     axis["spacing"].get<double>(), axis["unit"].get<std::string>(),
                     axis["first"].get<double>()));
  }
  for (const Json& item : report["items"]) {
    // Of a file too large to be read through the first step has to do.
    const bool isFirstStep = item["range"].is_null();
    const Json& range = item[isFirstStep ? "first_step" : "range"];
    const std::string values = range.is_null() ? ""
                                               : fmt::format(", {:g} to {:g}{}", range["least"].get<double>(),
                                                             range["greatest"].get<double>(),
                                                             isFirstStep ? " at the first step" : "");
    line(fmt::format("Item {}", item["number"].get<int>()),
         fmt::format("{}: {} (type {}) in {}{}", item["name"].get<std::string>(),
                     item["quantity"].get<std::string>(), item["type"].get<int>(),
                     item["unit"].get<std::string>(), values));
  }
  for (const auto& [name, values] : report["custom_blocks"].items()) {
    line("Block", fmt::format("{}: {}", name, fmt::join(values.get<std::vector<float>>(), ", ")));
  }
  if (report.contains("geography")) {
    const Json& place = report["geography"];
    line("Projection", place["projection"].get<std::string>());
    line("First point", fmt::format("longitude {:.6f}, latitude {:.6f}", place["longitude"].get<double>(),
                                    place["latitude"].get<double>()));
    if (const double turn = place["rotation"].get<double>(); turn != 0)
      line("Rotation", fmt::format("{:g} degrees clockwise", turn));
  } else {
    line("Projection", "none");
  }
}

Json describeSetup(CGlobalKvs& model) {
  const CSimulationPeriodKvs& period = *model.simulationPeriod;
  Json report{{"kind", "setup"},
              {"simulation_type", model.moduleSelection->simulationType},
              {"start", dateTimeText(period.start)},
              {"end", dateTimeText(period.End())},
              {"time_step", period.timeStepInterval},
              {"steps", std::int64_t{period.noPointsInTime} - 1},
              {"hot_start", model.bathymetry->hotStart != 0},
              {"projection", CVdMapProjection(model.bathymetry->projection).Name()},
              {"areas", Json::array()},
              {"boundaries", Json::array()},
              {"sources", Json::array()},
              {"polygons", model.massBudget->GetCount()},
              {"drying_depth", model.areaDescription->dryingDepth},
              {"flooding_depth", model.areaDescription->floodingDepth}};
  for (int number = 1; number <= model.bathymetry->GetCount(); ++number) {
    CBathymetryObjectKvs& area = *model.bathymetry->GetArea(number);
    Json entry{{"number", number}, {"file", area.fileName.text()}};
    if (number > 1) {
      entry["origin"] = {area.origin.j, area.origin.k};
      entry["enclosing_area"] = area.enclosingArea;
    }
    ValidationList messages;
    if (area.ReadGrid(messages, number) == 0) {
      entry["points"] = {area.noJ, area.noK};
      entry["spacing"] = {area.dx, area.dy};
      entry["land_value"] = area.landValue;
    } else {
      entry["fault"] = messages.empty() ? "" : messages.front().text;
    }
    report["areas"].push_back(std::move(entry));
  }
  double courant = 0;
  int courantArea = 0;
  model.bathymetry->GetMaxCourant(period.timeStepInterval, &courant, &courantArea);
  report["greatest_courant_number"] = {{"value", courant}, {"area", courantArea}};
  for (int number = 1; number <= model.boundary->GetCount(); ++number) {
    report["boundaries"].push_back(model.boundary->GetItem(number)->Text());
  }
  for (int number = 1; number <= model.sourceSink->GetCount(); ++number) {
    report["sources"].push_back(model.sourceSink->GetItem(number)->Text());
  }
  report["hydrodynamics"] = describeHydrodynamics(model);
  if (Json module = describeModule(model); !module.empty())
    report[topicsOf(model.moduleSelection->simulationType).key] = std::move(module);
  return report;
}

void printSetup(const Json& report, const Console& console) {
  const Line line = [&console](std::string_view label, const std::string& text) {
    console.out << fmt::format("{:<16} {}\n", label, text);
  };
  line("Setup", fmt::format("module code {} ({}){}", report["simulation_type"].get<int>(),
                            topicsOf(report["simulation_type"].get<int>()).words,
                            report["hot_start"].get<bool>() ? ", hot start" : ""));
  line("Period", fmt::format("{} to {}, {} steps of {:g} s", report["start"].get<std::string>(),
                             report["end"].get<std::string>(), report["steps"].get<std::int64_t>(),
                             report["time_step"].get<double>()));
  line("Projection",
       report["projection"].get<std::string>().empty() ? "none" : report["projection"].get<std::string>());
  for (const Json& area : report["areas"]) {
    std::string text = area["file"].get<std::string>();
    if (area.contains("origin")) {
      text += fmt::format(", at ({},{}) of area {}", area["origin"][0].get<int>(),
                          area["origin"][1].get<int>(), area["enclosing_area"].get<int>());
    }
    if (area.contains("points")) {
      text += fmt::format(", {} x {} points, {:.6g} x {:.6g} m apart, land at {:g} m",
                          area["points"][0].get<int>(), area["points"][1].get<int>(),
                          area["spacing"][0].get<double>(), area["spacing"][1].get<double>(),
                          area["land_value"].get<double>());
    } else {
      text += fmt::format(": {}", area["fault"].get<std::string>());
    }
    line(fmt::format("Area {}", area["number"].get<int>()), text);
  }
  const Json& courant = report["greatest_courant_number"];
  if (courant["area"] != 0) {
    line("Courant number", fmt::format("at most {:.6g}, in area {}", courant["value"].get<double>(),
                                       courant["area"].get<int>()));
  }
  for (std::size_t i = 0; i < report["boundaries"].size(); ++i) {
    line(fmt::format("Boundary {}", i + 1), report["boundaries"][i].get<std::string>());
  }
  if (report["polygons"] != 0) line("Polygons", std::to_string(report["polygons"].get<int>()));
  line("Flood and dry",
       fmt::format("drying at {:g} m, flooding at {:g} m", report["drying_depth"].get<double>(),
                   report["flooding_depth"].get<double>()));
  printHydrodynamics(report["hydrodynamics"], line);
  const auto moduleCode = report["simulation_type"].get<std::int32_t>();
  const ModuleTopics& module = topicsOf(moduleCode);
  if (report.contains(module.key)) {
    console.out << '\n';
    printModule(moduleCode, report[module.key], line);
  }
}

int print(const Json& report, const InfoOptions& options, void (*readable)(const Json&, const Console&),
          const Console& console) {
  if (options.json) {
    console.out << report.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
  } else {
    readable(report, console);
  }
  return kClean;
}

bool looksLikeDataFile(const std::string& path) {
  std::error_code error;
  if (!std::filesystem::is_regular_file(path, error)) return false;
  std::array<char, 4> start{};
  std::ifstream file(path, std::ios::binary);
  file.read(start.data(), start.size());
  const std::string_view text(start.data(), start.size());
  return text == "\x89HDF" || text.starts_with("CDF");
}

int info(const InfoOptions& options, const Console& console) {
  if (looksLikeDataFile(options.file)) {
    const Result<TsbFile> file = TsbFile::open(options.file);
    if (!file) return console.fail(file.error());
    return print(describeDataFile(*file), options, printDataFile, console);
  }
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  return print(describeSetup(setup->model()), options, printSetup, console);
}

}  // namespace

void addInfo(CLI::App& tool, Action& action) {
  std::shared_ptr<InfoOptions> options;
  CLI::App& command =
      addCommand(tool, action, "info", "Tells what a setup or a data file holds", info, options);
  command.add_option("FILE", options->file, "The setup or data file")->required();
  command.add_flag("--json", options->json, "The same as JSON");
}

}  // namespace gridbay::cli
