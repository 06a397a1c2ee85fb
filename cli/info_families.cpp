#include "cli/info_families.h"

#include <fmt/ranges.h>

namespace gridbay::cli {
namespace {

Json steps(const USubLine& line) {
  return {line.first, line.last, line.interval};
}
Json point(GridPoint at) {
  return {at.j, at.k};
}

Json chosenNames(const std::vector<std::string>& names, const EntryFlags& flags) {
  Json chosen = Json::array();
  for (std::size_t i = 0; i < std::min(names.size(), flags.size()); ++i) {
    if (flags[i] != 0) chosen.push_back(names[i]);
  }
  return chosen;
}

std::string wordsOfPoint(const Json& at) {
  return fmt::format("({},{})", at[0].get<int>(), at[1].get<int>());
}
// "12 to 40 by 2"
std::string wordsOfRange(const Json& range) {
  return fmt::format("{} to {} by {}", range[0].get<int>(), range[1].get<int>(), range[2].get<int>());
}
// " of Salt, Effluent, to inlet.tsb0 (Through the inlet)"
std::string wordsOfOutput(const Json& output) {
  const auto title = output["title"].get<std::string>();
  const auto file = output["file"].get<std::string>();
  std::string text;
  if (output.contains("of")) {
    const auto names = output["of"].get<std::vector<std::string>>();
    text = names.empty() ? " of nothing" : fmt::format(" of {}", fmt::join(names, ", "));
  }
  text += fmt::format(", to {}", file.empty() ? "a file that is not named" : file);
  return title.empty() ? text : fmt::format("{} ({})", text, title);
}

void printPlaces(std::string_view label, const Json& places, const Line& line) {
  int number = 0;
  for (const Json& place : places) line(fmt::format("{} {}", label, ++number), wordsOfConcentrations(place));
}

void printLinesOrBoxes(std::string_view label, const Json& report, const Line& line) {
  int number = 0;
  for (const Json& place : report) {
    line(fmt::format("{} {}", label, ++number),
         fmt::format("{} - {} of area {}, time steps {} to {}{}", wordsOfPoint(place["from"]),
                     wordsOfPoint(place["to"]), place["area"].get<int>(), place["steps"][0].get<int>(),
                     place["steps"][1].get<int>(), wordsOfOutput(place)));
  }
}

}  // namespace

Json dataFile(const FileNameValue& file) {
  return {{"file", file.text()}};
}

Json describeLinesOrBoxes(LineOrBoxList& list) {
  const std::vector<std::string> names = list.entryNames();
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    const LineOrBox& place = *list.GetLineOrBox(number);
    report.push_back({{"area", place.areaNumber},
                      {"from", point(place.first)},
                      {"to", point(place.last)},
                      {"steps", {place.steps.first, place.steps.last}},
                      {"of", chosenNames(names, place.entries)},
                      {"title", place.title},
                      {"file", place.file.text()}});
  }
  return report;
}

Json describeMassFiles(MassFileList& list) {
  const std::vector<std::string> names = list.entryNames();
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    const MassFile& mass = *list.GetMassFile(number);
    report.push_back({{"polygon", mass.polygon},
                      {"steps", steps(mass.steps)},
                      {"of", chosenNames(names, mass.entries)},
                      {"title", mass.title},
                      {"file", mass.file.text()}});
  }
  return report;
}

Json describeTransportOutput(const TransportOutput& output) {
  return {{"area", output.areaNumber},    {"j", steps(output.part.x)}, {"k", steps(output.part.y)},
          {"steps", steps(output.steps)}, {"title", output.title},     {"file", output.file.text()}};
}

std::string wordsOfConcentrations(const Json& report) {
  if (!report.contains("values")) {
    const auto kind = report["given_as"].get<std::string>();
    if (!report.contains("file")) return kind;
    const auto file = report["file"].get<std::string>();
    return fmt::format("{} in {}", kind, file.empty() ? "a file that is not named" : file);
  }
  std::string text;
  for (const Json& value : report["values"]) {
    text += fmt::format("{}{} {}", text.empty() ? "" : ", ", value["name"].get<std::string>(),
                        wordsOfQuantity(value));
  }
  return text.empty() ? "nothing" : text;
}

std::string wordsOfAreas(const Json& areas) {
  std::string text;
  for (const Json& area : areas) {
    std::string value = "none";
    if (area.contains("file")) {
      value = "map " + wordsOfFile(area);
    } else if (area.contains("value")) {
      value = wordsOfQuantity(area["value"]);
    }
    text += fmt::format("{}{} in area {}", text.empty() ? "" : "; ", value, area["area"].get<int>());
  }
  return text;
}

void printBoundaryValues(const Json& places, const Line& line) {
  printPlaces("At boundary", places, line);
}
void printSourceValues(const Json& places, const Line& line) {
  printPlaces("From source", places, line);
}

void printBeginning(const Json& report, const Line& line) {
  if (!report["hot"].get<bool>()) return printEntryAreas("Initially", report["concentrations"], line);
  int area = 0;
  for (const Json& file : report["files"])
    line("Initially", fmt::format("area {} as in {}", ++area, file.get<std::string>()));
}

void printConstantsOrMaps(std::string_view label, const Json& layers, const Line& line) {
  std::string text;
  for (const Json& layer : layers) {
    text +=
        fmt::format("{}{} in layer {}", text.empty() ? "" : "; ",
                    layer.contains("value") ? wordsOfQuantity(layer["value"]) : wordsOfAreas(layer["areas"]),
                    layer["layer"].get<int>());
  }
  if (!text.empty()) line(label, text);
}

void printEntryAreas(std::string_view label, const Json& entries, const Line& line) {
  for (const Json& entry : entries)
    line(label, fmt::format("{} {}", entry["name"].get<std::string>(), wordsOfAreas(entry["areas"])));
}

void printDispersion(const Json& report, const Line& line) {
  if (report["proportional_to_current"].get<bool>()) {
    line("Dispersion",
         fmt::format("in proportion to the current, by {} along x and {} along y, from {} to {}",
                     report["factor_x"]["value"].get<double>(), report["factor_y"]["value"].get<double>(),
                     wordsOfQuantity(report["least"]), wordsOfQuantity(report["greatest"])));
    return;
  }
  const auto words = [](const Json& along) {
    return along.contains("value") ? wordsOfQuantity(along["value"]) : wordsOfAreas(along["areas"]);
  };
  line("Dispersion", fmt::format("{} along x, {} along y", words(report["x"]), words(report["y"])));
}

void printLines(const Json& report, const Line& line) {
  printLinesOrBoxes("Line", report, line);
}
void printBoxes(const Json& report, const Line& line) {
  printLinesOrBoxes("Box", report, line);
}

void printWaves(const Json& report, const Line& line) {
  const auto kind = report["given_as"].get<std::string>();
  std::string text = kind;
  if (report.contains("file")) text = "maps in " + wordsOfFile(report);
  if (report.contains("maps")) text = fmt::format("a database of {} maps", report["maps"].get<int>());
  if (report.contains("height"))
    text = fmt::format("{} high, {} long, from {}", wordsOfQuantity(report["height"]),
                       wordsOfQuantity(report["period"]), wordsOfQuantity(report["direction"]));
  line("Waves", text);
}

void printMassFiles(const Json& report, const Line& line) {
  int number = 0;
  for (const Json& mass : report) {
    line(fmt::format("Mass budget {}", ++number),
         fmt::format("polygon {}, time steps {}{}", mass["polygon"].get<int>(), wordsOfRange(mass["steps"]),
                     wordsOfOutput(mass)));
  }
}

void printTransportOutputs(const Json& report, const Line& line) {
  int number = 0;
  for (const Json& output : report) {
    line(fmt::format("Output {}", ++number),
         fmt::format("area {}, J {}, K {}, time steps {}{}", output["area"].get<int>(),
                     wordsOfRange(output["j"]), wordsOfRange(output["k"]), wordsOfRange(output["steps"]),
                     wordsOfOutput(output)));
  }
}

}  // namespace gridbay::cli
