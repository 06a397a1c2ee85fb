#include <fmt/format.h>

#include <array>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "cli/commands.h"
#include "core/edition.h"
#include "platform/files/may_write.h"
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
    } else if (areas.back().enclosing) {
      return Failure{fmt::format("Area {} lies in one area only: one --enclosing, not two", areas.size())};
    } else {
      areas.back().enclosing = options.enclosing[nextEnclosing++];
    }
  }
  for (std::size_t i = 0; i < areas.size(); ++i) {
    if (i == 0 && areas[i].origin) return Failure{"The first area lies in no other: give it without @J,K"};
    if (i > 0 && !areas[i].origin) {
      return Failure{fmt::format("Area {} lies in another: say where, as {}@J,K", i + 1, areas[i].file)};
    }
    if (i == 0) continue;
    if (areas[i].origin->j < 0 || areas[i].origin->k < 0) {
      return Failure{fmt::format("Area {} cannot lie at {},{}: J and K count from 0", i + 1,
                                 areas[i].origin->j, areas[i].origin->k)};
    }
    const int enclosing = areas[i].enclosing.value_or(static_cast<int>(i));
    if (enclosing < 1 || enclosing > static_cast<int>(i)) {
      return Failure{
          fmt::format("Area {} cannot lie in area {}: --enclosing takes the number of an area before it{}",
                      i + 1, enclosing, i == 1 ? ", which is 1" : fmt::format(", 1 to {}", i))};
    }
  }
  return areas;
}

int newSetup(const Options& options, const Console& console) {
  const Result<std::vector<Area>> areas = areasOf(options);
  if (!areas) return console.fail(areas.error());
  std::vector<std::string> grids;
  for (const Area& area : *areas) grids.push_back(area.file);
  if (const Outcome free = mayWrite(options.file, options.force, grids, "--force"); !free)
    return console.fail(free.error());
  const int most = theEdition.wetlandSweepKit ? 1 : CBathymetryKvs::kMostAreas;
  if (static_cast<int>(areas->size()) > most) {
    return console.fail(fmt::format("The {} has at most {} area{}", theEdition.editorName.format, most,
                                    most == 1 ? "" : "s"));
  }
  ConsoleMessageHost host(console);
  SetupFile setup(&host);
  CGlobalKvs& model = setup.model();
  if (!areas->empty()) model.bathymetry->SetNoAreas(static_cast<int>(areas->size()));
  std::vector<std::array<std::size_t, 2>> sizes;
  for (std::size_t i = 0; i < areas->size(); ++i) {
    const Area& given = (*areas)[i];
    const Result<TsbFile> file = TsbFile::open(given.file);
    if (!file) return console.fail(file.error());
    const std::vector<TsbGridAxis>& axes = file->definition().axes;
    if (axes.size() != 2) return console.fail(fmt::format("\"{}\" holds no map", given.file));
    sizes.push_back({axes[0].points, axes[1].points});
    if (given.origin) {
      const auto enclosing = static_cast<std::size_t>(given.enclosing.value_or(static_cast<int>(i)));
      const auto [noJ, noK] = sizes[enclosing - 1];
      if (static_cast<std::size_t>(given.origin->j) >= noJ ||
          static_cast<std::size_t>(given.origin->k) >= noK) {
        return console.fail(fmt::format("Area {} cannot lie at {},{}: area {} has {} x {} points", i + 1,
                                        given.origin->j, given.origin->k, enclosing, noJ, noK));
      }
    }
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
  command.add_option("--start", options->start,
                     "Start of the simulation, \"YYYY-MM-DD hh:mm:ss\" (default: 1990-01-01 12:00:00)");
  command.add_option("--step", options->step, "Time step (s, at least 0.01; default: 30)")
      ->check(finite(0.01));
  command.add_option("--steps", options->steps, "Number of time steps (default: 100)")
      ->check(CLI::Range(0, 2147483645));
  addForce(command, options->force);
}

}  // namespace gridbay::cli
