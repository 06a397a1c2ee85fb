#include <fmt/format.h>

#include <cmath>
#include <filesystem>

#include "basic/bathymetry.h"
#include "cli/commands.h"
#include "core/grid_point.h"
#include "map/nesting_words.h"
#include "map/setup_map.h"
#include "setup/entry_removal.h"

namespace gridbay::cli {
namespace {

struct AreaOptions {
  std::string setup;
  std::string grid;
  int number = 0;
  std::optional<int> enclosing;
  std::optional<std::string> at;
  bool snap = false;
  bool force = false;  // an area that can't nest
};

Result<std::optional<GridPoint>> given(const AreaOptions& options) {
  if (!options.at) return std::optional<GridPoint>();
  const std::optional<GridPoint> point = pointOfText(*options.at);
  if (!point) return Failure{fmt::format("\"{}\" is no grid point; write it as J,K", *options.at)};
  return point;
}

// A distance to the centimetre.
std::string metres(double distance) {
  return fmt::format("{} m", std::round(distance * 100) / 100);
}

std::string placeText(const CBathymetryObjectKvs& area, int number) {
  return fmt::format("Area {} lies in area {} from {}", number, area.enclosingArea, pointText(area.origin));
}

// Whether an area lies in another one, or in one that does.
bool liesWithin(CBathymetryKvs& areas, int number, int other) {
  // No further up than there are areas: a faulty setup may have them in a circle.
  for (int up = 0; up < areas.GetCount() && number > 1 && number <= areas.GetCount(); ++up) {
    number = areas.at(number).enclosingArea;
    if (number == other) return true;
  }
  return false;
}

// Gives the area its position, and says how it goes with the coordinates of the grids.
Outcome place(SetupMap& map, CGlobalKvs& root, int number, const std::optional<GridPoint>& at, bool snap,
              const Console& console) {
  CBathymetryObjectKvs& area = root.bathymetry->at(number);
  if (at) area.origin = *at;
  const Result<AreaSnap> found = map.snapOf(root, number);
  if (!found && snap) return Failure{found.error()};
  if (found) {
    const std::string where = fmt::format("By the grids' coordinates its first point lies at ({:.2f},{:.2f})",
                                          found->exact[0], found->exact[1]);
    if (snap) {
      const bool isOther = at && *at != found->nearest;
      if (isOther) console.note(fmt::format("{} is {} off", pointText(*at), metres(found->heldOffBy)));
      area.origin = found->nearest;
      console.out << fmt::format("{}, {} from the point that it snaps to\n", where, metres(found->offBy));
    } else if (found->nearest != area.origin) {
      console.note(fmt::format("{}: {} is {} off, {} would be {} off", where, pointText(area.origin),
                               metres(found->heldOffBy), pointText(found->nearest), metres(found->offBy)));
    }
  }
  return {};
}

// What stands against where the area lies now; empty where nothing does.
std::string faultOf(SetupMap& map, CGlobalKvs& root, int number) {
  const MapScene& scene = map.scene(root);
  const MapArea& area = *scene.area(number);
  const MapArea* outer = scene.area(area.enclosing);
  if (area.fault.empty() || !area.isPlaced || outer == nullptr) return area.fault;
  const std::string words = nestingWords(area, *outer);
  return words.empty() ? area.fault : area.fault + "\n" + words;
}

// A fault is told here, and is for the check to count.
int finish(SetupFile& setup, const AreaOptions& options, int number, const std::string& fault,
           const Console& console) {
  if (!fault.empty()) console.note(fault);
  if (const int status = saveSetup(setup, options.setup, console); status != kClean) return status;
  console.out << placeText(setup.model().bathymetry->at(number), number) << '\n';
  return kClean;
}

int add(const AreaOptions& options, SetupFile& setup, const std::optional<GridPoint>& at,
        const Console& console) {
  CGlobalKvs& root = setup.model();
  SetupMap map;
  const int enclosing = options.enclosing.value_or(1);
  if (enclosing < 1 || enclosing > root.bathymetry->GetCount())
    return console.fail(fmt::format("There is no area {} for it to lie in: the setup has {}", enclosing,
                                    root.bathymetry->GetCount()));
  if (!at && !options.snap)
    return console.fail("Say where it lies, with --at J,K, or take that from the grids with --snap");
  const std::string grid = std::filesystem::absolute(options.grid).lexically_normal().string();
  if (const GridHeader& header = map.headers().of(grid); !header.fault.empty())
    return console.fail(header.fault);
  const MapEdit made = map.addArea(root, enclosing, at.value_or(GridPoint{}), grid);
  if (!made.fault.empty()) return console.fail(made.fault);
  const int number = root.bathymetry->GetCount();
  if (const Outcome done = place(map, root, number, at, options.snap, console); !done)
    return console.fail(done.error() + "; the setup is unchanged");
  const std::string fault = faultOf(map, root, number);
  if (!fault.empty() && !options.force)
    return console.fail(fault + "\nThe setup is unchanged; --force adds the area all the same");
  return finish(setup, options, number, fault, console);
}

int move(const AreaOptions& options, SetupFile& setup, const std::optional<GridPoint>& at,
         const Console& console) {
  CGlobalKvs& root = setup.model();
  const int count = root.bathymetry->GetCount();
  if (options.number < 2 || options.number > count)
    return console.fail(
        fmt::format("There is no area {} that could be moved: the setup has {}, of which the first lies "
                    "where its file says",
                    options.number, count));
  if (root.bathymetry->hotStart == 1) return console.fail("A hot start file says itself where its area lies");
  if (!at && !options.snap && !options.enclosing)
    return console.fail("Say where it lies, with --at J,K, or take that from the grids with --snap");
  if (options.enclosing &&
      (*options.enclosing < 1 || *options.enclosing > count || *options.enclosing == options.number))
    return console.fail(fmt::format("Area {} can't lie in area {}", options.number, *options.enclosing));
  if (options.enclosing && liesWithin(*root.bathymetry, *options.enclosing, options.number))
    return console.fail(
        fmt::format("Area {} can't lie in area {}, which lies in it", options.number, *options.enclosing));
  if (options.enclosing) root.bathymetry->at(options.number).enclosingArea = *options.enclosing;
  SetupMap map;
  // A position that is not given is the one that the setup has.
  const std::optional<GridPoint> held = at ? at : std::optional(root.bathymetry->at(options.number).origin);
  if (const Outcome done = place(map, root, options.number, held, options.snap, console); !done)
    return console.fail(done.error() + "; the setup is unchanged");
  return finish(setup, options, options.number, faultOf(map, root, options.number), console);
}

int remove(const AreaOptions& options, SetupFile& setup, const std::optional<GridPoint>&,
           const Console& console) {
  CGlobalKvs& root = setup.model();
  const int count = root.bathymetry->GetCount();
  if (options.number < 1 || options.number > count)
    return console.fail(fmt::format("There is no area {}: the setup has {}", options.number, count));
  if (count == 1) return console.fail("A setup keeps one area at least");
  std::string inside;
  for (int other = 1; other <= count; ++other) {
    if (other != options.number && root.bathymetry->at(other).enclosingArea == options.number)
      inside += fmt::format("{}{}", inside.empty() ? "" : ", ", other);
  }
  if (!inside.empty())
    return console.fail(fmt::format("Area {} can't be removed: it encloses area {}", options.number, inside));
  if (options.number == 1) return console.fail("Area 1, on which all others lie, can't be removed");
  if (options.number < count && root.bathymetry->hotStart == 1)
    return console.fail(
        fmt::format("Area {} can't be removed before those behind it, whose hot start files name the areas "
                    "that enclose them by their numbers",
                    options.number));
  SetupMap map;
  for (const MapFeature& feature : map.scene(root).features) {
    if (feature.area == options.number || feature.lastArea == options.number)
      console.note(fmt::format("\"{}\" of page {} stands on it, and stands on no area then", feature.label,
                               feature.id.page));
  }
  removeArea(root, options.number);
  if (const int status = saveSetup(setup, options.setup, console); status != kClean) return status;
  console.out << fmt::format("Area {} is removed; its grid file is left\n", options.number);
  if (options.number < count)
    console.out << fmt::format("The areas behind it, up to {}, have numbers less by one now\n", count);
  return kClean;
}

// Opens the setup for an edit, which saves it, at the point that was given.
template <int edit(const AreaOptions&, SetupFile&, const std::optional<GridPoint>&, const Console&)>
int opened(const AreaOptions& options, const Console& console) {
  const Result<std::optional<GridPoint>> at = given(options);
  if (!at) return console.fail(at.error());
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.setup, &host);
  if (!setup) return console.fail(setup.error());
  return edit(options, *setup, *at, console);
}

void addPosition(CLI::App& command, AreaOptions& options) {
  command.add_option("--in", options.enclosing, "Number of the area that encloses it");
  command.add_option("--at", options.at, "J,K: the point of that area at which its first point lies");
  command.add_flag("--snap", options.snap,
                   "Take the point from the coordinates of the grids, and say how far a given one is off");
}

}  // namespace

void addArea(CLI::App& tool, Action& action) {
  CLI::App& area = *tool.add_subcommand("area", "Adds, moves and removes nested areas");
  area.require_subcommand(1);
  std::shared_ptr<AreaOptions> options;
  CLI::App& adding = addCommand(area, action, "add", "Adds an area of a grid file (default: in area 1)",
                                opened<add>, options);
  adding.add_option("FILE", options->setup, "The setup")->required();
  adding.add_option("GRID", options->grid, "The grid file (*.tsb2)")->required();
  addPosition(adding, *options);
  adding.add_flag("--force", options->force, "Add an area that can't nest");
  CLI::App& moving = addCommand(area, action, "move", "Places an area anew", opened<move>, options);
  moving.add_option("FILE", options->setup, "The setup")->required();
  moving.add_option("AREA", options->number, "Its number, from 2")->required();
  addPosition(moving, *options);
  CLI::App& removing = addCommand(area, action, "remove",
                                  "Removes an area that encloses no other, with all that is set up for it; "
                                  "those behind it take its number",
                                  opened<remove>, options);
  removing.add_option("FILE", options->setup, "The setup")->required();
  removing.add_option("AREA", options->number, "Its number")->required();
}

}  // namespace gridbay::cli
