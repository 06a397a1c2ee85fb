#include "setup/new_setup.h"

#include <fmt/format.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "cli/commands.h"
#include "platform/files/may_write.h"

namespace gridbay::cli {
namespace {

struct NewSetupOptions {
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
NewArea areaOf(const std::string& text) {
  const std::size_t at = text.rfind('@');
  if (at == text.npos) return {text};
  const std::optional<GridPoint> origin = pointOfText(std::string_view(text).substr(at + 1));
  return origin ? NewArea{text.substr(0, at), origin} : NewArea{text};
}

// An --enclosing belongs to the --area before it.
Result<std::vector<NewArea>> areasOf(const NewSetupOptions& options) {
  std::vector<NewArea> areas;
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
  return areas;
}

// How the place of an area is told, where it is missing or what was given is none.
std::string_view hintFor(const AreaFault& fault, const std::vector<NewArea>& areas) {
  if (fault.area == 0 || areas[fault.area - 1].origin) return {};
  if (!fault.isOfFile) return fault.area > 1 ? ", as --area FILE@J,K" : "";
  const bool hasPlace = areas[fault.area - 1].file.find('@') != std::string::npos;
  return hasPlace ? "; where an area lies is told as FILE@J,K, by two whole numbers" : "";
}

int newSetup(const NewSetupOptions& options, const Console& console) {
  const Result<std::vector<NewArea>> areas = areasOf(options);
  if (!areas) return console.fail(areas.error());
  std::vector<std::string> grids;
  for (const NewArea& area : *areas) grids.push_back(area.file);
  if (const Outcome free = mayWrite(options.file, options.force, grids, "--force"); !free)
    return console.fail(free.error());
  ConsoleMessageHost host(console);
  SetupFile setup(&host);
  CGlobalKvs& model = setup.model();
  if (const auto fault = layAreas(model, *areas))
    return console.fail(fmt::format("{}{}", fault->text, hintFor(*fault, *areas)));
  if (!options.start.empty()) {
    const std::optional<DateTime> start = dateTimeOfText(options.start);
    if (!start)
      return console.fail(fmt::format("\"{}\" is no moment of the form YYYY-MM-DD hh:mm:ss", options.start));
    model.simulationPeriod->start = *start;
  }
  if (options.step) model.simulationPeriod->timeStepInterval = static_cast<float>(*options.step);
  if (options.steps) model.simulationPeriod->noPointsInTime = *options.steps + 1;
  if (const int status = saveSetup(setup, options.file, console); status != kClean) return status;
  console.out << fmt::format("{}: {} area{}, {} open boundar{}\n", options.file, model.bathymetry->GetCount(),
                             model.bathymetry->GetCount() == 1 ? "" : "s", model.boundary->GetCount(),
                             model.boundary->GetCount() == 1 ? "y" : "ies");
  return kClean;
}

}  // namespace

void addNew(CLI::App& tool, Action& action) {
  std::shared_ptr<NewSetupOptions> options;
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
