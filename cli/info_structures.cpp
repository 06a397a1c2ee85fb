#include <fmt/format.h>
#include <fmt/ranges.h>

#include "cli/info_topics.h"
#include "hydrodynamic/result.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay::cli {
namespace {

template <class List>
Json structures(List& list) {
  Json report = Json::array();
  for (int number = 1; number <= list.GetCount(); ++number) {
    const auto& structure = list.at(number);
    std::size_t points = 0;
    if constexpr (requires { structure.points; }) {
      points = structure.points.size();
    } else {
      points = std::min(structure.x.size(), structure.y.size());
    }
    report.push_back({{"name", structure.name}, {"points", points}});
  }
  return report;
}

// How many there are, and the names of the first of them.
void printStructures(std::string_view label, const Json& report, const Line& line) {
  constexpr std::size_t kMostNamed = 5;
  if (report.empty()) return;
  std::vector<std::string> names;
  for (const Json& structure : report) {
    if (names.size() == kMostNamed) {
      names.emplace_back("...");
      break;
    }
    const auto points = structure["points"].get<std::size_t>();
    names.push_back(fmt::format("{} of {} point{}", structure["name"].get<std::string>(), points,
                                points == 1 ? "" : "s"));
  }
  line(label, fmt::format("{}: {}", report.size(), fmt::join(names, ", ")));
}

Json describeDikes(CGlobalKvs& model) {
  return structures(*model.nhdDike);
}
void printDikes(const Json& report, const Line& line) {
  printStructures("Dikes", report, line);
}
Json describeWeirs(CGlobalKvs& model) {
  return structures(*model.nhdWeir);
}
void printWeirs(const Json& report, const Line& line) {
  printStructures("Weirs", report, line);
}
Json describeCulverts(CGlobalKvs& model) {
  return structures(*model.nhdCulvert);
}
void printCulverts(const Json& report, const Line& line) {
  printStructures("Culverts", report, line);
}

Json range(const USubLine& line) {
  return {line.first, line.last, line.interval};
}

Json describeOutputs(CGlobalKvs& model) {
  Json report = Json::array();
  for (int number = 1; number <= model.nhdResult->outputs.GetCount(); ++number) {
    const CNhdResultObjectKvs& output = model.nhdResult->outputs.at(number);
    Json entry{{"title", output.title}, {"file", output.file.text()}};
    if (output.type == CNhdResultObjectKvs::kPoints) {
      entry["points"] = output.PointCount();
    } else {
      entry["j"] = range(output.part.x);
      entry["k"] = range(output.part.y);
    }
    entry["steps"] = range(output.steps);
    entry["items"] = output.items;
    report.push_back(std::move(entry));
  }
  return report;
}
void printOutputs(const Json& report, const Line& line) {
  const auto words = [](const Json& of) {
    return fmt::format("{} to {} by {}", of[0].get<int>(), of[1].get<int>(), of[2].get<int>());
  };
  int number = 0;
  for (const Json& output : report) {
    const std::string part = output.contains("points")
                                 ? fmt::format("{} points", output["points"].get<int>())
                                 : fmt::format("J {}, K {}", words(output["j"]), words(output["k"]));
    const auto items = output["items"].get<std::vector<int>>();
    const auto title = output["title"].get<std::string>();
    line(fmt::format("Output {}", ++number),
         fmt::format("{}, time steps {}, {} item{}, to {}{}", part, words(output["steps"]), items.size(),
                     items.size() == 1 ? "" : "s", output["file"].get<std::string>(),
                     title.empty() ? "" : fmt::format(" ({})", title)));
  }
}

Json describeHotStart(CGlobalKvs& model) {
  Json files = Json::array();
  for (int area = 1; area <= model.nhdResult->hotStarts.GetCount(); ++area)
    files.push_back(model.nhdResult->hotStarts.at(area).file.text());
  return {{"written", model.nhdResult->generateHotStart}, {"files", files}};
}
void printHotStart(const Json& report, const Line& line) {
  const auto files = report["files"].get<std::vector<std::string>>();
  line("Hot start", report["written"].get<bool>() ? fmt::format("written to {}", fmt::join(files, ", "))
                                                  : std::string("not written"));
}

constexpr Topic kStructureTopics[] = {
    {"dikes", describeDikes, printDikes},           {"weirs", describeWeirs, printWeirs},
    {"culverts", describeCulverts, printCulverts},  {"outputs", describeOutputs, printOutputs},
    {"hot_start", describeHotStart, printHotStart},
};

}  // namespace

std::span<const Topic> structureTopics() {
  return kStructureTopics;
}

}  // namespace gridbay::cli
