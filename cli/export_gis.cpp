#include <fmt/format.h>
#include <fmt/ranges.h>

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
  const GisExport made = gisLayers(setup->model(), scene, options.setup);
  for (const MapFeature& feature : scene.features) {
    if (!feature.fault.empty())
      console.note(fmt::format("Page {}, {}: {}", feature.id.page, feature.label, feature.fault));
  }
  if (const Outcome written = writeGeoPackage(options.out, made.file); !written)
    return console.fail(written.error());
  for (const VectorLayer& layer : made.file.layers)
    console.out << fmt::format("{} {}\n", layer.name, layer.features.size());
  if (made.leftOut.empty()) return kClean;
  console.note(fmt::format("{} is not whole. Left out, having no place on the map: {}", options.out,
                           fmt::join(made.leftOut, "; ")));
  return kFaultsFound;
}

}  // namespace

void addExport(CLI::App& tool, Action& action) {
  CLI::App& exporting = *tool.add_subcommand("export", "Writes a setup for other programs");
  exporting.require_subcommand(1);
  std::shared_ptr<GisExportOptions> options;
  CLI::App& gis =
      addCommand(exporting, action, "gis",
                 "All that is placed, as a GeoPackage with a layer for each kind, in the projection "
                 "of Area 1; exit status 1 where something has no place and is left out",
                 exportGis, options);
  gis.add_option("FILE", options->setup, "The setup")->required();
  gis.add_option("OUT", options->out, "The file to write (*.gpkg)")->required();
  addForce(gis, options->force);
}

}  // namespace gridbay::cli
