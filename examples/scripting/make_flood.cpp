// Makes the setup of a flood in the estuary of examples/estuary, from the grids and series in a folder, and
// then one of the same flood with a higher sea.

#include <gridbay_setup/climate_change.h>
#include <gridbay_setup/flood_models.h>

#include <exception>
#include <iostream>
#include <string>

namespace {

using gridbay::scripting::CClimateChange_V27;
using gridbay::scripting::DateTime;
using gridbay::scripting::Flooding_V27FlowModel;

constexpr DateTime kStart{46102.25};  // 2026-03-21 06:00
constexpr DateTime kEnd{46102.75};

void makeFlood(const std::string& folder, const std::string& setup) {
  constexpr int kLevel = 1;
  constexpr int kFlux = 2;
  constexpr int kSeries = 3;
  Flooding_V27FlowModel flood;
  flood.SetSimulationPeriod(kStart, kEnd, 3);
  flood.setDryingFloodingDepth(0.1F, 0.2F);
  flood.setCoarseBathymetryFile(folder + "/estuary.tsb2");
  flood.setResistance_File(folder + "/estuary_roughness.tsb2", 1);
  flood.setInitialCondition_Value(0.2);
  flood.setEddyViscosity_IncludedWithDefaultValue();
  flood.setRain_File(folder + "/rain.tsb0", 1, 1);

  flood.setNoOfBndCondition(2);
  flood.setHDBndCondition_File(1, 0, 0, 0, 90, kLevel, kSeries, folder + "/tide.tsb0", 1);
  flood.setHDBndCondition_File(2, 120, 38, 120, 46, kFlux, kSeries, folder + "/river.tsb0", 1);
  flood.setNoOfSourceSink(1);
  flood.setHDSourceSink_Value(1, 0, 75, 60, 0, 0, 4, 0.5, 180);

  flood.setOutput_MaximumFloodDepthAndExtend(folder + "/deepest.tsb2", 600);
  flood.AddOutput_MapsAndTimeSeriesJK(0, 0, 0, 0, 0, 0, {}, {}, 0, {}, {}, 600, folder + "/flood.tsb2",
                                      "Flood maps", {1, 4});
  flood.AddOutput_MapsAndTimeSeriesJK(1, 0, 0, 0, 0, 0, {5, 48, 70}, {45, 45, 46}, 0, {}, {}, 20,
                                      folder + "/gauges.tsb0", "Gauges", {4});
  flood.SaveFile(setup);
}

// Who opens a setup finds what drives it, and changes that alone.
void makeClimate(const std::string& setup, const std::string& changed, const std::string& tide) {
  CClimateChange_V27 climate;
  if (climate.OpenFile(setup) == 0) throw std::runtime_error("cannot read " + setup);
  for (int index = 1; index <= climate.GetNoWLTimeSeries(); ++index) {
    std::string file;
    std::string where;
    int item = 0;
    int boundary = 0;
    climate.GetWLFileItem(index, file, item);
    climate.GetWLTSIDLocation(index, boundary, where);
    std::cout << "boundary " << boundary << " at " << where << ": item " << item << " of " << file << '\n';
    climate.SetWLFile(index, tide);
  }
  climate.SaveFile(changed);
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 3) {
    std::cerr << "usage: make_flood FOLDER SETUP\n";
    return 2;
  }
  const std::string folder = argv[1];
  const std::string setup = argv[2];
  try {
    makeFlood(folder, setup);
    makeClimate(setup, folder + "/higher_sea.v27", folder + "/higher_tide.tsb0");
  } catch (const std::exception& fault) {
    std::cerr << fault.what() << '\n';
    return 1;
  }
  return 0;
}
