#include "plugin/cover_pages.h"

#include <algorithm>

#include "core/edition.h"

namespace gridbay {
namespace {

struct Cover {
  std::string_view localPage;
  std::string_view title;
  std::string_view text;
};

constexpr std::string_view kFlowModelPicture = "nested-grids";
constexpr std::string_view kWetlandSweepKitPicture = "wetland";

constexpr Cover kCovers[] = {
    {"res://V27Nested.dll/VANE_27_Flow_Model.htm", "VANE 27 Flow Model",
     "A setup is everything that a simulation needs, in one text file.\n\n"
     "1. **Basic Parameters** first: which modules run, the grids and how they nest, the period, the open "
     "boundaries, sources and sinks.\n"
     "2. **Hydrodynamic Parameters** next: how the water starts, what drives it, what slows it, and the "
     "results to keep.\n"
     "3. Then the group of each further module that is selected.\n"
     "4. **Validate** (F7) lists what is missing or does not fit; a message leads to its page.\n"
     "5. **Start simulation** (F5) hands the saved setup to the engine.\n\n"
     "Pages that do not apply are out of sight; what they hold is kept. F1 explains the page that is open."},
    {"res://V27NestedWSK.dll/VANE_27_Wetland_Sweep_Kit.htm", "VANE 27 Wetland Sweep Kit",
     "A setup is everything that a simulation of a wetland needs, in one text file: one grid, and its "
     "flow.\n\n"
     "1. **Basic Parameters** first: the grid, the period, the open boundaries, sources and sinks, and when "
     "a "
     "point falls dry.\n"
     "2. **Hydrodynamic Parameters** next: how the water starts, what drives it, what slows it, and the "
     "results to keep.\n"
     "3. **Validate** (F7) lists what is missing or does not fit; a message leads to its page.\n"
     "4. **Start simulation** (F5) hands the saved setup to the engine.\n\n"
     "Pages that do not apply are out of sight; what they hold is kept. F1 explains the page that is open."},
    {"res://V27Nested.dll/Basic_Parameters.htm", "Basic Parameters",
     "What every model has. The order matters here, for each page rests on the one before:\n\n"
     "1. **Module Selection**: what is computed beside the flow.\n"
     "2. **Bathymetry**: the grids, outermost first, and where each finer one lies in its enclosing grid.\n"
     "3. **Simulation Period**: start, time step and number of steps. Watch the Courant number.\n"
     "4. **Boundary**: where water can cross the edge of the outermost grid. Program detected finds these "
     "places by itself.\n"
     "5. **Source and Sink**: points where water enters or leaves.\n"
     "6. **Flood and Dry**: the depths at which a point falls dry and is wet again."},
    {"res://V27NestedWSK.dll/Basic_Parameters_WSK.htm", "Basic Parameters",
     "What every model of a wetland has. The order matters here, for each page rests on the one before:\n\n"
     "1. **Bathymetry**: the one grid of the model.\n"
     "2. **Simulation Period**: start, time step and number of steps. Watch the Courant number.\n"
     "3. **Boundary**: where water can cross the edge of the grid. Program detected finds these places by "
     "itself.\n"
     "4. **Source and Sink**: points where water enters or leaves.\n"
     "5. **Flood and Dry**: the depths at which a point falls dry and is wet again, which decide how far the "
     "water spreads."},
    {"res://V27Nested.dll/Advection-Dispersion_Parameters.htm", "Advection-Dispersion Parameters",
     "What is dissolved or suspended in the water.\n\n"
     "1. **Starting Conditions** and **Component**: the substances, and how each behaves.\n"
     "2. **Initial Concentrations**, **Boundary** and **Source and Sink**: where they are at the start and "
     "where they come in.\n"
     "3. **Dispersion Coefficients**, decay and heat: what happens to them on the way.\n"
     "4. Rain, evaporation and infiltration, where the flow has them.\n"
     "5. **Result**: what to keep."},
    {"res://V27Nested.dll/Hydrodynamic_Parameters.htm", "Hydrodynamic Parameters",
     "The flow itself.\n\n"
     "1. **Initial Surface Elevation**: the water level that the simulation starts from.\n"
     "2. **Boundary**: a level or a flux for each open boundary of the basic parameters, constant, as a sine "
     "series or from a file.\n"
     "3. **Source and Sink**: the discharge at each source; rain and evaporation.\n"
     "4. **Resistance** and eddy viscosity: what slows the flow.\n"
     "5. Wind and waves, where they matter.\n"
     "6. **Structures**: weirs, culverts and dikes.\n"
     "7. **Results**: which quantities to keep, where and how often."},
    {"res://V27NestedWSK.dll/Hydrodynamic_Parameters.htm", "Hydrodynamic Parameters",
     "The flow through the wetland.\n\n"
     "1. **Initial Surface Elevation**: the water level that the simulation starts from.\n"
     "2. **Boundary**: a level or a flux for each open boundary of the basic parameters, constant, as a sine "
     "series or from a file.\n"
     "3. **Source and Sink**: the discharge at each source; rain and evaporation.\n"
     "4. **Resistance**: what slows the flow, and above all plants.\n"
     "5. **Structures**: weirs, culverts and dikes.\n"
     "6. **Results**: which quantities to keep, where and how often."},
    {"res://V27Nested.dll/Mud_Transport_Parameters.htm", "Mud Transport Parameters",
     "Mud in the water and in a layered bed.\n\n"
     "1. **Starting Conditions** first: how many fractions and layers there are decides the size of all that "
     "follows.\n"
     "2. **Initial Conditions**, **Boundary**, sources and **Dispersion**: where mud is at the start, where "
     "it "
     "comes in, and how it spreads.\n"
     "3. Waves and dredging, where they matter.\n"
     "4. Settling and deposition: what the water gives to the bed.\n"
     "5. Erosion, density and sliding: what the bed gives back, and how it changes.\n"
     "6. **Results**: what to keep."},
    {"res://V27Nested.dll/BIO_Rig_Parameters.htm", "BIO Rig Parameters",
     "The ecological model.\n\n"
     "1. **Model Definition**: the file that says which state variables, constants and forcings there are. "
     "All other pages follow it.\n"
     "2. **Starting Conditions**, **State Variables** and **Initial Conditions**.\n"
     "3. **AD Transport Parameters**: how the variables that move are carried and spread.\n"
     "4. **Constants** and **Forcings**.\n"
     "5. **Results**."},
    {"res://V27Nested.dll/Structures.htm", "Structures",
     "Lines across the flow that are smaller than the grid can show. **Weirs** hold the water back up to a "
     "crest, **Culverts** let it through, and **Dikes** follow a line of points with a crest of its own. "
     "Each "
     "is placed on grid lines of one area, and has a name by which its results are found."},
    {"res://V27NestedWSK.dll/Structures.htm", "Structures",
     "What holds water in the wetland or lets it out, and is smaller than the grid can show. **Weirs** hold "
     "it "
     "back up to a crest, **Culverts** let it through, and **Dikes** follow a line of points with a crest of "
     "its own. Each is placed on lines of the grid, and has a name by which its results are found."},
    {"res://V27Nested.dll/Bed_Parameters.htm", "Bed Parameters",
     "What the bed is made of and how it changes. Begin with **Erosion** and **Density of Bed Layer**, then "
     "see whether **Sliding**, **Morphology** and the transition between layers are wanted."},
    {"res://V27Nested.dll/v27dialogoverviewb.htm", "AD Transport Parameters",
     "How the state variables are carried and spread by the flow: what comes in at boundaries and sources, "
     "with rain, and how strongly it disperses. Only variables that move have a row here."},
    {"res://V27Nested.dll/default.htm", "VANE 27 Flow Model",
     "There is nothing to fill in here. Choose another page on the left; F1 explains it."},
    {"res://V27NestedWSK.dll/default.htm", "VANE 27 Wetland Sweep Kit",
     "There is nothing to fill in here. Choose another page on the left; F1 explains it."},
};

std::string picture() {
  return std::string(theEdition.wetlandSweepKit ? kWetlandSweepKitPicture : kFlowModelPicture);
}

}  // namespace

SetupEditor::Cover coverPage(std::string_view localPage) {
  const auto* found = std::ranges::find(kCovers, localPage, &Cover::localPage);
  if (found == std::end(kCovers)) found = std::end(kCovers) - (theEdition.wetlandSweepKit ? 1 : 2);
  return {std::string(found->title), std::string(found->text), picture()};
}

SetupEditor::Cover missingPage(std::string_view caption) {
  return {
      std::string(caption),
      "This page is not a part of this version yet. What the setup's file holds of it is not edited here, "
      "and a save leaves it out.",
      picture()};
}

}  // namespace gridbay
