#include <fmt/format.h>

#include <filesystem>

#include "basic/bathymetry.h"
#include "cli/commands.h"
#include "conversion/vector_writer.h"
#include "core/parameter_tree.h"
#include "map/gis_export.h"
#include "map/setup_map.h"
#include "platform/files/may_write.h"

namespace gridbay::cli {
namespace {

struct GisExportOptions {
  std::string setup;
  std::string out;
  bool force = false;
};

int exportGis(const GisExportOptions& options, const Console& console) {
  if (!sameName(std::filesystem::path(options.out).extension().string(), ".gpkg"))
    return console.fail(fmt::format("\"{}\" must end in .gpkg", options.out));
  ConsoleMessageHost host(console);
  Result<SetupFile> setup = SetupFile::open(options.setup, &host);
  if (!setup) return console.fail(setup.error());
  std::vector<std::string> inputs{options.setup};
  CBathymetryKvs& areas = *setup->model().bathymetry;
  for (int number = 1; number <= areas.GetCount(); ++number)
    inputs.push_back(areas.at(number).fileName.absolute());
  if (const Outcome free = mayWrite(options.out, options.force, inputs, "--force"); !free)
    return console.fail(free.error());
  SetupMap map;
  const MapScene& scene = map.scene(setup->model());
  for (const MapArea& area : scene.areas) {
    if (!area.isPlaced) console.note(area.fault);
  }
  if (scene.area(1) == nullptr || !scene.area(1)->isPlaced)
    return console.fail("Without the grid of Area 1 nothing has a place on the map");
  if (scene.projectionText.empty())
    console.note("The grid of Area 1 names no projection: the layers have local coordinates");
  int leftOut = 0;
  const VectorFile file = gisLayers(setup->model(), scene, &leftOut);
  for (const MapFeature& feature : scene.features) {
    if (!feature.fault.empty())
      console.note(fmt::format("Page {}, {}: {}", feature.id.page, feature.label, feature.fault));
  }
  if (const Outcome written = writeGeoPackage(options.out, file); !written)
    return console.fail(written.error());
  for (const VectorLayer& layer : file.layers)
    console.out << fmt::format("{} {}\n", layer.name, layer.features.size());
  if (leftOut > 0) console.note(fmt::format("Left out, as they can't be placed: {}", leftOut));
  return kClean;
}

}  // namespace

void addExport(CLI::App& tool, Action& action) {
  CLI::App& exporting = *tool.add_subcommand("export", "Writes a setup for other programs");
  exporting.require_subcommand(1);
  std::shared_ptr<GisExportOptions> options;
  CLI::App& gis =
      addCommand(exporting, action, "gis",
                 "All that is placed, as a GeoPackage with a layer for each kind, in the projection "
                 "of Area 1",
                 exportGis, options);
  gis.add_option("FILE", options->setup, "The setup")->required();
  gis.add_option("OUT", options->out, "The file to write (*.gpkg)")->required();
  addForce(gis, options->force);
}

}  // namespace gridbay::cli
