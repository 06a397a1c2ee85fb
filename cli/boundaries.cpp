#include <fmt/format.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "cli/commands.h"

namespace gridbay::cli {
namespace {

struct BoundariesOptions {
  std::string file;
  bool detect = false;
};

int boundaries(const BoundariesOptions& options, const Console& console) {
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.file, &host);
  if (!setup) return console.fail(setup.error());
  CBoundaryKvs& list = *setup->model().boundary;
  if (options.detect) {
    // The detection itself empties the list where the grid can't be read; here the old list is kept then.
    ValidationList messages;
    CBathymetryObjectKvs* area = setup->model().bathymetry->GetArea(1);
    if (area == nullptr) return console.fail("The setup has no area");
    if (area->ReadGrid(messages, 1) != 0) {
      for (const CMessage& message : messages) console.note(message.text);
      return console.fail(
          "The boundaries cannot be found without the grid of Area 1; the setup is unchanged");
    }
    list.defaultPosition = 1;
    list.RecalculateBoundaries();
    if (const int status = saveSetup(*setup, options.file, console); status != kClean) return status;
  }
  for (int number = 1; number <= list.GetCount(); ++number) {
    console.out << fmt::format("{} {}\n", number, list.GetItem(number)->Text());
  }
  if (list.GetCount() == 0) console.note("There are no open boundaries");
  return kClean;
}

}  // namespace

void addBoundaries(CLI::App& tool, Action& action) {
  std::shared_ptr<BoundariesOptions> options;
  CLI::App& command =
      addCommand(tool, action, "boundaries", "Lists the open boundaries", boundaries, options);
  command.add_option("FILE", options->file, "The setup")->required();
  command.add_flag("--detect", options->detect, "Find them along the border of Area 1 and store them");
}

}  // namespace gridbay::cli
