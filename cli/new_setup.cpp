#include <fmt/format.h>

#include <filesystem>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "cli/commands.h"
#include "core/edition.h"
#include "platform/tsb/tsb_file.h"

namespace gridbay::cli {
namespace {

// An area of the command line: a grid file and, for a nested one, where it lies.
struct Area {
  std::string file;
  std::optional<GridPoint> origin;
  std::optional<int> enclosing;
};

struct Options {
  std::string file;
  std::vector<std::string> areas;
  std::vector<int> enclosing;
  std::vector<bool> order;  // true for an --area, false for an --enclosing, as they came
  std::string start;
  std::optional<double> step;
  std::optional<int> steps;
  bool force = false;
};

// "grid.tsb2@12,7" is a file and a point; a file name may have an @ of its own.
Area areaOf(const std::string& text) {
  const std::size_t at = text.rfind('@');
  if (at == text.npos) return {text, {}, {}};
  const std::optional<GridPoint> origin = pointOfText(std::string_view(text).substr(at + 1));
  return origin ? Area{text.substr(0, at), origin, {}} : Area{text, {}, {}};
}

// An --enclosing belongs to the --area before it.
Result<std::vector<Area>> areasOf(const Options& options) {
  std::vector<Area> areas;
  std::size_t nextArea = 0;
  std::size_t nextEnclosing = 0;
  for (const bool isArea : options.order) {
    if (isArea) {
      areas.push_back(areaOf(options.areas[nextArea++]));
    } else if (areas.size() < 2) {
      return Failure{"--enclosing follows the --area that it is for; the first area has none"};
    } else {
      areas.back().enclosing = options.enclosing[nextEnclosing++];
    }
  }
  for (std::size_t i = 0; i < areas.size(); ++i) {
    if (i == 0 && areas[i].origin) return Failure{"The first area lies in no other: give it without @J,K"};
    if (i > 0 && !areas[i].origin) {
      return Failure{fmt::format("Area {} lies in another: say where, as {}@J,K", i + 1, areas[i].file)};
    }
  }
  return areas;
}

int newSetup(const Options& options, const Console& console) {
  if (!options.force && std::filesystem::exists(options.file)) {
    return console.fail(fmt::format("\"{}\" is there already; --force replaces it", options.file));
  }
  const Result<std::vector<Area>> areas = areasOf(options);
  if (!areas) return console.fail(areas.error());
  const int most = theEdition.wetlandSweepKit ? 1 : CBathymetryKvs::kMostAreas;
  if (static_cast<int>(areas->size()) > most) {
    return console.fail(fmt::format("The {} has at most {} area{}", theEdition.editorName.format, most,
                                    most == 1 ? "" : "s"));
  }
  ConsoleMessageHost host(console);
  SetupFile setup(&host);
  CGlobalKvs& model = setup.model();
  if (!areas->empty()) model.bathymetry->SetNoAreas(static_cast<int>(areas->size()));
  for (std::size_t i = 0; i < areas->size(); ++i) {
    const Area& given = (*areas)[i];
    if (const Result<TsbFile> file = TsbFile::open(given.file); !file) return console.fail(file.error());
    CBathymetryObjectKvs& area = *model.bathymetry->GetArea(static_cast<int>(i) + 1);
    area.fileName = given.file;
    if (given.origin) area.origin = *given.origin;
    if (given.enclosing) area.enclosingArea = *given.enclosing;
  }
  if (!options.start.empty()) {
    const std::optional<DateTime> start = dateTimeOfText(options.start);
    if (!start)
      return console.fail(fmt::format("\"{}\" is no moment of the form YYYY-MM-DD hh:mm:ss", options.start));
    model.simulationPeriod->start = *start;
  }
  if (options.step) model.simulationPeriod->timeStepInterval = static_cast<float>(*options.step);
  if (options.steps) model.simulationPeriod->noPointsInTime = *options.steps + 1;
  if (!areas->empty()) {
    std::string projection;
    int coriolis = 0;
    model.bathymetry->GetProjection(&projection, &coriolis);
    model.boundary->RecalculateBoundaries();
  }
  if (const int status = saveSetup(setup, options.file, console); status != kClean) return status;
  console.out << fmt::format("{}: {} area{}, {} open boundar{}\n", options.file, model.bathymetry->GetCount(),
                             model.bathymetry->GetCount() == 1 ? "" : "s", model.boundary->GetCount(),
                             model.boundary->GetCount() == 1 ? "y" : "ies");
  return kClean;
}

}  // namespace

void addNew(CLI::App& tool, Action& action) {
  std::shared_ptr<Options> options;
  CLI::App& command =
      addCommand(tool, action, "new", "Makes a setup with the defaults of a new one", newSetup, options);
  command.add_option("FILE", options->file, "The setup to write")->required();
  command
      .add_option("--area", options->areas,
                  "Grid file of an area, outermost first; a nested one as FILE@J,K, the point of "
                  "the enclosing grid that holds its first point")
      ->each([options](const std::string&) { options->order.push_back(true); });
  command
      .add_option("--enclosing", options->enclosing,
                  "Number of the area that encloses the --area before it (default: the area before)")
      ->each([options](const std::string&) { options->order.push_back(false); });
  command.add_option("--start", options->start, "Start of the simulation, \"YYYY-MM-DD hh:mm:ss\"");
  command.add_option("--step", options->step, "Time step (s)");
  command.add_option("--steps", options->steps, "Number of time steps")->check(CLI::Range(0, 2147483645));
  command.add_flag("--force", options->force, "Replace a setup that is there");
}

}  // namespace gridbay::cli
