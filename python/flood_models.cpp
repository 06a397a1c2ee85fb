#include "gridbay_setup/flood_models.h"

#include <fmt/format.h>

#include "basic/bathymetry.h"
#include "hydrodynamic/result.h"
#include "platform/tsb/tsb_file.h"
#include "python/scripted_members.h"

namespace gridbay::python {
namespace py = pybind11;
using namespace scripting;

namespace {

template <class Model>
Argument boundary() {
  return indexIn<Model>([](Model& model) { return Flooding_V27FlowModel(model).getNoOfBndConditions(); });
}
Argument source() {
  return indexIn<Flooding_V27FlowModel>(&Flooding_V27FlowModel::getNoOfSourceSink);
}
Argument count(std::optional<int> least) {
  return {
      .name = "count", .least = least, .most = [](py::handle) { return kMostObjects; }, .kind = kWrongValue};
}
template <class Model>
Argument position() {
  return {.name = "position", .least = 1, .most = [](py::handle self) {
            ScriptedModel& model = modelOf(py::cast<Model&>(self));
            const auto guard = model.lock();
            return model.root.nhdResult->outputs.GetCount();
          }};
}
// Of the points of a boundary, a source or a part of the map.
std::vector<Argument> with(std::vector<Argument> first, const std::vector<const char*>& names,
                           std::vector<Argument> last = {}) {
  for (const char* name : names) first.push_back({.name = name});
  for (Argument& argument : last) first.push_back(std::move(argument));
  return first;
}

// An output, as a member takes it; others give the same in the same order.
std::vector<Argument> outputArguments() {
  return {{"type"},           flag("use_sub_area"),
          {"first_j"},        {"first_k"},
          {"last_j"},         {"last_k"},
          {"points_j"},       {"points_k"},
          flag("use_period"), {"first_date"},
          {"last_date"},      {"time_step_frequency"},
          fileName(),         {"title"},
          item("items")};
}
std::string outputText(std::size_t without) {
  std::string text = "The next position and the output at this one: ";
  const std::vector<Argument> all = outputArguments();
  for (std::size_t i = without; i < all.size(); ++i) text += (i == without ? "" : ", ") + all[i].name;
  return text + ". What it does not have is 0, empty or None.";
}

// A member that steps through the outputs as a function of the position, which it gives with what it finds.
template <class Model, class Class, class... Outputs>
auto stepper(void (Class::*member)(OutputPosition&, Outputs&...)) {
  return [member](Model& model, OutputPosition position) {
    const py::tuple found =
        outputsOf<Outputs...>([&](Outputs&... outputs) { (model.*member)(position, outputs...); });
    return py::tuple(py::make_tuple(position) + found);
  };
}
template <class Model, class Class, class... Outputs>
auto stepper(void (Class::*member)(OutputPosition&, int, Outputs&...)) {
  return [member](Model& model, OutputPosition position, int ignored) {
    const py::tuple found =
        outputsOf<Outputs...>([&](Outputs&... outputs) { (model.*member)(position, ignored, outputs...); });
    return py::tuple(py::make_tuple(position) + found);
  };
}

template <class Model>
void setCoarseGrid(Model& object, const std::string& file) {
  ScriptedModel& model = modelOf(object);
  UFileName name;
  {
    const auto guard = model.lock();
    const auto dataFiles = ScriptedModel::lockDataFiles();
    model.setFileName(name, file);
    const Result<TsbFile> grid = TsbFile::open(name.absolute());
    if (!grid) throw fileRefusal(name.absolute(), grid.error(), kReadableGrid);
    if (grid->definition().axes.size() != 2)
      throw refusal(kFileError, name.absolute(),
                    fmt::format("a file of {} axes", grid->definition().axes.size()), "a grid, which has 2");
  }
  object.setCoarseBathymetryFile(file);
}

// The members that the two open classes share.
template <class Model>
Members<Model> addFloodModel(py::module_& module, const char* name, const char* doc) {
  Members<Model> flood(scriptingClass<Model>(module, name, doc));
  flood
      .add(
          "ShowMessagesWith",
          [](Model& model, MessageBox show) {
            ShowMessagesWith(static_cast<FloodModel&>(model), std::move(show));
          },
          {{"show"}}, kTexts)
      .add(
          "LoadFile", [](Model& model, std::string file) { load(model, file); }, {fileName()},
          "Reads a setup. FileError where it can't be read or is none; it leaves the model as it was.")
      .add(
          "SaveFile",
          [](Model& object, std::string file) {
            const Outcome written = [&] {
              ScriptedModel& model = modelOf(object);
              const auto guard = model.lock();
              return model.save(file, model.errorTexts());
            }();
            refuseUnwritten(written, file);
          },
          {fileName()},
          "Shows what validation finds, if anything, and writes the setup all the same. FileError where that "
          "can't be.",
          "outputs whose items can be saved")
      .add("GetFileExtension", &Model::GetFileExtension, {}, "\".v27\", in both editions.")
      .add("SetSimulationPeriod", &Model::SetSimulationPeriod, {{"start"}, {"end"}, {"time_step"}},
           "Time step in s. Moments are of whole seconds and no time zone.")
      .add("setDryingFloodingDepth", &Model::setDryingFloodingDepth, {{"drying_depth"}, {"flooding_depth"}},
           "Metres of water.")
      .add(
          "setCoarseBathymetryFile", [](Model& model, std::string file) { setCoarseGrid(model, file); },
          {fileName()},
          "The grid of the area, with its projection where none is set yet. FileError where it can't be "
          "read.",
          "a model with an area")
      .add("getCoarseBathymetryFile", &Model::getCoarseBathymetryFile, {}, "The grid of the area.",
           "a model with an area")
      .add("setFineBathymetryFile", &Model::setFineBathymetryFile, {fileName()},
           "The grid of the overland solver, which is not looked at.")
      .add("getFineBathymetryFile", &Model::getFineBathymetryFile, {}, "The grid of the overland solver.")
      .add("setOverlandSolverOption", &Model::setOverlandSolverOption, {flag("option")},
           "1 turns the solver on, any other number off.")
      .add("setResistance_Value", &Model::setResistance_Value, {{"value"}}, "Manning number.")
      .add("setResistance_File", &Model::setResistance_File, {fileName(), item()},
           "A map of Manning numbers; items count from 1.")
      .add("setInitialCondition_Value", &Model::setInitialCondition_Value, {{"value"}}, "Metres.")
      .add("setInitialCondition_File", &Model::setInitialCondition_File, {fileName(), item()},
           "A map of water levels; items count from 1.")
      .add("setNoOfBndCondition", &Model::setNoOfBndCondition, {count({})},
           "Boundaries are user specified from now on; a negative count leaves them as many as they are.")
      .add("setEddyViscosity_IncludedWithDefaultValue", &Model::setEddyViscosity_IncludedWithDefaultValue, {},
           "Flux based, 0.02 dx dy / dt: when grid and period are set.")
      .add("setEddyViscosity_NotIncluded", &Model::setEddyViscosity_NotIncluded, {}, "No eddy viscosity.")
      .add("setEddyViscosity_Value", &Model::setEddyViscosity_Value, {{"value"}, {"formulation"}},
           "Square metres per second.")
      .add("setRain_Value", &Model::setRain_Value, {{"value"}}, "Millimetres per day.")
      .add("setRain_File", &Model::setRain_File, {fileName(), {"precipitation_type"}, item()},
           "Net precipitation from a file. Type: 1 a time series, 2 maps in time.")
      .add("setOutput_MaximumFloodDepthAndExtend", &Model::setOutput_MaximumFloodDepthAndExtend,
           {fileName(), {"store_step"}}, "The store step is in time steps.")
      .add("GetOutputsListHeadPos", &Model::GetOutputsListHeadPos, {},
           "Where a walk through the outputs begins.")
      .add("ClearHDResultOutputs", &Model::ClearHDResultOutputs, {}, "Takes all outputs out.");
  return flood;
}

}  // namespace

void addFloodModels(py::module_& module) {
  py::class_<OutputPosition>(module, "OutputPosition", py::module_local(),
                             "At which output a walk through them is; false behind the last one.")
      .def_readonly("number", &OutputPosition::number, "Of the output, from 1; 0 behind the last one.")
      .def("__bool__", &OutputPosition::operator bool, "Whether there is an output.");

  using Flood = Flooding_V27FlowModel;
  using Urban = UrbanFlooding_V27Flowmodel;
  const std::vector line{"first_j", "first_k", "last_j", "last_k", "formulation"};
  const std::vector points{"type", "source_j", "source_k", "sink_j", "sink_k"};
  const std::vector<Argument> period{flag("use_period"), {"first_date"}, {"last_date"}};
  constexpr const char* kBoundaryValue = "Formulation 1 is a level in m, 2 a flux in m3/s.";

  addFloodModel<Flood>(module, "Flooding_V27FlowModel",
                       "A flood model by grid points and numbers of data formats.")
      .add("setHDBndCondition_Value", &Flood::setHDBndCondition_Value,
           with({boundary<Flood>()}, line, {{"value"}}), kBoundaryValue)
      .add("setHDBndCondition_File", &Flood::setHDBndCondition_File,
           with({boundary<Flood>()}, line, {{"data_format"}, fileName(), item()}),
           "Data format: 3 a series in time, 4 one along the line, 5 transfer data (which has no item: "
           "WrongValue, when all else has been set), 7 a rating curve.",
           "a data format that has an item")
      .add("getNoOfBndConditions", &Flood::getNoOfBndConditions, {}, "How many boundaries there are.")
      .add("getHDBndCondition", reader<Flood>(&Flood::getHDBndCondition), {boundary<Flood>()},
           "Points, formulation, data format, value, file and item; 0 or \"\" for none.")
      .add("setNoOfSourceSink", &Flood::setNoOfSourceSink, {count(0)}, "How many sources there are to be.")
      .add("getNoOfSourceSink", &Flood::getNoOfSourceSink, {}, "How many sources there are.")
      .add("setHDSourceSink_Value", &Flood::setHDSourceSink_Value,
           with({source()}, points, {{"magnitude"}, {"velocity"}, {"outlet_direction"}}),
           "Type: 0 source, 1 sink, 2 a pair. Magnitude in m3/s, velocity in m/s, direction in degrees.")
      .add("setHDSourceSink_File", &Flood::setHDSourceSink_File,
           with({source()}, points,
                {fileName(), {"outlet_direction"}, item("magnitude_item"), item("velocity_item")}),
           "Only the items are stored: the file of the source stays what it was.")
      .add("setHDSourceSink_FileEx", &Flood::setHDSourceSink_FileEx,
           with({source()}, points, {fileName(), item("item_1"), item("item_2"), item("item_3")}),
           "With three items, in data format 2; only the items are stored.")
      .add("getHDSourceSink", reader<Flood>(&Flood::getHDSourceSink), {source()},
           "Type, data format, points, magnitude, velocity, direction, file, which is never told, and items.")
      .add("AddOutput_MapsAndTimeSeriesJK", &Flood::AddOutput_MapsAndTimeSeriesJK, outputArguments(),
           "Type: 0 a map, 1 points, which need both lists. Frequency in time steps. Items: 1 water depth, 2 "
           "and 3 fluxes, 4 surface elevation, 5 and 6 velocities.")
      .add("GetNextOutputs_MapsJKAndTS", stepper<Flood>(&Flood::GetNextOutputs_MapsJKAndTS),
           {position<Flood>()}, outputText(0).c_str());

  Members<Flooding_V27WSKFlowModel>(scriptingClass<Flooding_V27WSKFlowModel>(
                                        module, "Flooding_V27WSKFlowModel",
                                        "A model of the Wetland Sweep Kit; it has no members of its own."))
      .add(
          "as_flow_model", [](Flooding_V27WSKFlowModel& model) { return Flood(model); }, {},
          "An object with members that drives the same model.");

  addFloodModel<Urban>(module, "UrbanFlooding_V27Flowmodel",
                       "A flood model by map coordinates and extensions of files.")
      .add("setBndCondition_Value", &Urban::setBndCondition_Value,
           with({boundary<Urban>()}, line, {{"value"}}), kBoundaryValue)
      .add("setBndCondition_File", &Urban::setBndCondition_File,
           with({boundary<Urban>()}, line, {fileName(), item()}),
           "The extension says what the file is: .tsb0 or .tb0 a series in time, .tsb1 or .tb1 one along the "
           "line; of others nothing is stored.",
           "a boundary whose selection has an item")
      .add(
          "as_flow_model", [](Urban& model) { return Flood(model); }, {},
          "An object of the other interface that drives the same model.")
      .add("AddOutput_MapsAndTimeSeries", &Urban::AddOutput_MapsAndTimeSeries,
           with(with(with({{"type"}, flag("use_sub_area")}, {"first_x", "first_y", "last_x", "last_y"},
                          period),
                     {"number_of_steps"}, {fileName()}),
                {"title", "water_depth", "surface_elevation", "velocities", "fluxes"}),
           "A part of the map between two corners in m. Coordinates of a point output have no effect.")
      .add("GetNextOutputs_MapsJKAndTS", stepper<Urban>(&Urban::GetNextOutputs_MapsJKAndTS),
           {position<Urban>(), {.name = "ignored", .fallback = 0}}, outputText(1).c_str());
}

}  // namespace gridbay::python
