#include "plugin/cover_pages.h"

#include <algorithm>

namespace gridbay {
namespace {

struct Cover {
  std::int32_t id;
  const char* text;
};

constexpr Cover kCovers[] = {
    {1,
     "A setup is everything that a simulation needs, in one text file.\n\n"
     "1. **Basic Parameters** first: which modules run, the grids and how they nest, the period, the open "
     "boundaries, sources and sinks.\n"
     "2. **Hydrodynamic Parameters** next: how the water starts, what drives it, what slows it, and the "
     "results "
     "to keep.\n"
     "3. Then the group of each further module that is selected.\n"
     "4. **Validate** (F7) lists what is missing or does not fit; a double click on a message opens its "
     "page.\n"
     "5. **Start simulation** (F5) hands the saved setup to the engine.\n\n"
     "Pages that do not apply are out of sight; what they hold is kept. F1 explains the page that is open."},
    {2,
     "What every model has. The order matters here, for each page rests on the one before:\n\n"
     "1. **Module Selection**: what is computed beside the flow.\n"
     "2. **Bathymetry**: the grids, outermost first, and where each finer one lies in its enclosing grid.\n"
     "3. **Simulation Period**: start, time step and number of steps. Watch the Courant number.\n"
     "4. **Boundary**: where water can cross the edge of the outermost grid. Program detected finds these "
     "places by itself.\n"
     "5. **Source and Sink**: points where water enters or leaves.\n"
     "6. **Flood and Dry**: the depths at which a point falls dry and is wet again."},
    {3,
     "What is dissolved or suspended in the water.\n\n"
     "1. **Starting Conditions** and **Component**: the substances, and how each behaves.\n"
     "2. **Initial Concentrations**, **Boundary** and **Source and Sink**: where they are at the start and "
     "where "
     "they come in.\n"
     "3. **Dispersion Coefficients**, decay and heat: what happens to them on the way.\n"
     "4. Rain, evaporation and infiltration, where the flow has them.\n"
     "5. **Result**: what to keep."},
    {4,
     "The flow itself.\n\n"
     "1. **Initial Surface Elevation**: the water level that the simulation starts from.\n"
     "2. **Boundary**: a level or a flux for each open boundary of the basic parameters, constant, as a sine "
     "series or from a file.\n"
     "3. **Source and Sink**: the discharge at each source; rain and evaporation.\n"
     "4. **Resistance** and eddy viscosity: what slows the flow.\n"
     "5. Wind and waves, where they matter.\n"
     "6. **Structures**: weirs, culverts and dikes.\n"
     "7. **Results**: which quantities to keep, where and how often."},
    {5,
     "Mud in several fractions and several layers of the bed.\n\n"
     "1. **Starting Conditions** and **Parameter Selection**: how many fractions and layers there are, which "
     "decides the size of all that follows.\n"
     "2. **Initial Conditions**, **Dispersion**, **Boundary** and **Sources**.\n"
     "3. **Forcings**: waves and dredging.\n"
     "4. **Water Column Parameters**: settling and deposition.\n"
     "5. **Bed Parameters**: erosion, density, sliding, roughness.\n"
     "6. **Results**."},
    {6,
     "Mud in the water and in a layered bed.\n\n"
     "1. **Starting Conditions** and **Task Selection**: what is computed, and with how many layers.\n"
     "2. **Initial Conditions**, **Boundary**, **Source Sink** and **Dispersion**.\n"
     "3. Settling, deposition and erosion.\n"
     "4. What goes on in the bed: sliding, transition and consolidation.\n"
     "5. **Results**."},
    {7,
     "The ecological model.\n\n"
     "1. **Model Definition**: the file that says which state variables, constants and forcings there are. "
     "All "
     "other pages follow it.\n"
     "2. **Starting Conditions**, **State Variables** and **Initial Conditions**.\n"
     "3. **AD Transport Parameters**: how the variables that move are carried and spread.\n"
     "4. **Constants** and **Forcings**.\n"
     "5. **Results**."},
    {8, "Foreign substances that are bound to mud and dissolved in water."},
    {42,
     "Lines across the flow that are smaller than the grid can show. **Weirs** hold the water back up to a "
     "crest, "
     "**Culverts** let it through, and **Dikes** follow a line of points with a crest of its own. Each is "
     "placed "
     "on grid lines of one area, and has a name by which its results are found."},
    {61,
     "What the bed is made of and how it changes. Begin with **Erosion** and **Density of Bed Layer**, then "
     "see "
     "whether **Sliding**, **Morphology** and the transition between layers are wanted."},
    {115,
     "How the state variables are carried and spread by the flow: what comes in at boundaries and sources, "
     "with "
     "rain, and how strongly it disperses. Only variables that move have a row here."},
};

}  // namespace

std::string coverPage(std::int32_t id, std::string_view pageClass) {
  const auto* found = std::ranges::find(kCovers, id, &Cover::id);
  if (found != std::end(kCovers)) return found->text;
  if (pageClass.empty()) return "There is nothing to fill in here.";
  return "This page is not a part of this version yet. What the setup's file holds of it is not edited here, "
         "and a "
         "save leaves it out.";
}

}  // namespace gridbay
