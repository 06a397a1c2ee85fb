#include <fmt/format.h>
#include <pybind11/functional.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include "core/date_time.h"
#include "gridbay_setup/climate_change.h"
#include "gridbay_setup/flood_models.h"
#include "python/refusal.h"

namespace pybind11::detail {

// A moment is a datetime, and None where there is none.
template <>
struct type_caster<gridbay::scripting::DateTime> {
  PYBIND11_TYPE_CASTER(gridbay::scripting::DateTime, const_name("datetime.datetime | None"));

  bool load(handle given, bool) {
    if (given.is_none()) {
      value = {0, 1};
      return true;
    }
    if (!isinstance(given, module_::import("datetime").attr("datetime"))) return false;
    const auto part = [given](const char* what) { return pybind11::cast<std::int32_t>(given.attr(what)); };
    const gridbay::DateTime moment = gridbay::DateTime::of(
        {part("year"), part("month"), part("day"), part("hour"), part("minute"), part("second")});
    value = {moment.day, moment.status};
    return true;
  }
  static handle cast(const gridbay::scripting::DateTime& moment, return_value_policy, handle) {
    const auto parts = gridbay::DateTime{moment.day, moment.status}.parts();
    if (!parts) return none().release();
    const auto& [year, month, day, hour, minute, second] = *parts;
    return module_::import("datetime").attr("datetime")(year, month, day, hour, minute, second).release();
  }
};

}  // namespace pybind11::detail

namespace gridbay::python {
namespace py = pybind11;
using namespace scripting;

namespace {

constexpr const char* kTexts = "What validation and faults of a load have to say goes to this function.";

// The outputs of a member that gives 1 and them, or 0 and nothing.
template <class... Outputs>
py::tuple given(int found, const Outputs&... outputs) {
  if (found == 0) return py::make_tuple(0, (static_cast<void>(outputs), py::none())...);
  return py::make_tuple(found, outputs...);
}

// A Get member of an index as a function of the index alone.
template <class Model, class First>
auto getter(int (Model::*member)(int, First&)) {
  return [member](Model& model, int index) {
    First first{};
    const int found = (model.*member)(index, first);
    return given(found, first);
  };
}
template <class Model, class First, class Second>
auto getter(int (Model::*member)(int, First&, Second&)) {
  return [member](Model& model, int index) {
    First first{};
    Second second{};
    const int found = (model.*member)(index, first, second);
    return given(found, first, second);
  };
}

// What the reader of an output gives. What an output does not have is as the call began: 0, or nothing.
struct Output {
  int type = 0;
  int useSubArea = 0;
  int firstJ = 0;
  int firstK = 0;
  int lastJ = 0;
  int lastK = 0;
  std::vector<double> pointsJ;
  std::vector<double> pointsK;
  int usePeriod = 0;
  scripting::DateTime firstDate{0, 1};
  scripting::DateTime lastDate{0, 1};
  int frequency = 0;
  std::string fileName;
  std::string title;
  std::vector<int> items;

  py::tuple tuple(const OutputPosition& next) const { return py::make_tuple(next, type) + withoutType(); }
  py::tuple withoutType() const {
    return py::make_tuple(useSubArea, firstJ, firstK, lastJ, lastK, pointsJ, pointsK, usePeriod, firstDate,
                          lastDate, frequency, fileName, title, items);
  }
};

// The members that the two open classes share.
template <class Model>
py::class_<Model> addFloodModel(py::module_& module, const char* name, const char* doc) {
  py::class_<Model> flood(module, name, py::module_local(), doc);
  flood.def(py::init<>())
      .def(
          "ShowMessagesWith",
          [](Model& model, std::function<void(const std::string&)> show) {
            ShowMessagesWith(static_cast<FloodModel&>(model), std::move(show));
          },
          py::arg("show"), kTexts)
      .def("LoadFile", &Model::LoadFile, py::arg("file_name"),
           "Reads a setup. A syntax error is shown and leaves the model as it was; any other fault does so "
           "silently.")
      .def("SaveFile", &Model::SaveFile, py::arg("file_name"),
           "Shows what validation finds, if anything, and writes the setup all the same.")
      .def("GetFileExtension", &Model::GetFileExtension, "\".v27\", in both editions.")
      .def("SetSimulationPeriod", &Model::SetSimulationPeriod, py::arg("start"), py::arg("end"),
           py::arg("time_step"), "Time step in s.")
      .def("setDryingFloodingDepth", &Model::setDryingFloodingDepth, py::arg("drying_depth"),
           py::arg("flooding_depth"), "Metres of water.")
      .def("setCoarseBathymetryFile", &Model::setCoarseBathymetryFile, py::arg("file_name"),
           "The grid of the area, with its projection where none is set yet.")
      .def("getCoarseBathymetryFile", &Model::getCoarseBathymetryFile, "The grid of the area.")
      .def("setFineBathymetryFile", &Model::setFineBathymetryFile, py::arg("file_name"),
           "The grid of the overland solver, which is not looked at.")
      .def("getFineBathymetryFile", &Model::getFineBathymetryFile, "The grid of the overland solver.")
      .def("setOverlandSolverOption", &Model::setOverlandSolverOption, py::arg("option"),
           "1 turns the solver on, any other number off.")
      .def("setResistance_Value", &Model::setResistance_Value, py::arg("value"), "Manning number.")
      .def("setResistance_File", &Model::setResistance_File, py::arg("file_name"), py::arg("item"),
           "A map of Manning numbers; items count from 1.")
      .def("setInitialCondition_Value", &Model::setInitialCondition_Value, py::arg("value"), "Metres.")
      .def("setInitialCondition_File", &Model::setInitialCondition_File, py::arg("file_name"),
           py::arg("item"), "A map of water levels; items count from 1.")
      .def("setNoOfBndCondition", &Model::setNoOfBndCondition, py::arg("count"),
           "Boundaries are user specified from now on; a negative count leaves them as many as they are.")
      .def("setEddyViscosity_IncludedWithDefaultValue", &Model::setEddyViscosity_IncludedWithDefaultValue,
           "Flux based, 0.02 dx dy / dt: when grid and period are set.")
      .def("setEddyViscosity_NotIncluded", &Model::setEddyViscosity_NotIncluded, "No eddy viscosity.")
      .def("setEddyViscosity_Value", &Model::setEddyViscosity_Value, py::arg("value"), py::arg("formulation"),
           "Square metres per second.")
      .def("setRain_Value", &Model::setRain_Value, py::arg("value"), "Millimetres per day.")
      .def("setRain_File", &Model::setRain_File, py::arg("file_name"), py::arg("precipitation_type"),
           py::arg("item"), "Net precipitation from a file. Type: 1 a time series, 2 maps in time.")
      .def("setOutput_MaximumFloodDepthAndExtend", &Model::setOutput_MaximumFloodDepthAndExtend,
           py::arg("file_name"), py::arg("store_step"), "The store step is in time steps.")
      .def("GetOutputsListHeadPos", &Model::GetOutputsListHeadPos, "Where a walk through the outputs begins.")
      .def("ClearHDResultOutputs", &Model::ClearHDResultOutputs, "Takes all outputs out.");
  return flood;
}

void addFloodModels(py::module_& module) {
  py::class_<OutputPosition>(module, "OutputPosition", py::module_local(),
                             "At which output a walk through them is; false behind the last one.")
      .def_readonly("number", &OutputPosition::number)
      .def("__bool__", &OutputPosition::operator bool);

  using Flood = Flooding_V27FlowModel;
  addFloodModel<Flood>(module, "Flooding_V27FlowModel",
                       "A flood model by grid points and numbers of data formats.")
      .def("setHDBndCondition_Value", &Flood::setHDBndCondition_Value, py::arg("index"), py::arg("first_j"),
           py::arg("first_k"), py::arg("last_j"), py::arg("last_k"), py::arg("formulation"), py::arg("value"),
           "Formulation 1 is a level in m, 2 a flux in m3/s. A boundary that is not there is passed over.")
      .def("setHDBndCondition_File", &Flood::setHDBndCondition_File, py::arg("index"), py::arg("first_j"),
           py::arg("first_k"), py::arg("last_j"), py::arg("last_k"), py::arg("formulation"),
           py::arg("data_format"), py::arg("file_name"), py::arg("item"),
           "Data format: 3 a series in time, 4 one along the line, 5 transfer data (which has no item: "
           "ValueError), 7 a rating curve.")
      .def("getNoOfBndConditions", &Flood::getNoOfBndConditions, "How many boundaries there are.")
      .def(
          "getHDBndCondition",
          [](Flood& model, int index) -> py::object {
            if (index < 1 || index > model.getNoOfBndConditions()) return py::none();
            std::array<int, 6> numbers{};
            double value = 0;
            std::string file;
            int item = 0;
            auto& [j1, k1, j2, k2, formulation, format] = numbers;
            model.getHDBndCondition(index, j1, k1, j2, k2, formulation, format, value, file, item);
            return py::make_tuple(j1, k1, j2, k2, formulation, format, value, file, item);
          },
          py::arg("index"), "None for a boundary that is not there.")
      .def("setNoOfSourceSink", &Flood::setNoOfSourceSink, py::arg("count"), "A negative count does nothing.")
      .def("getNoOfSourceSink", &Flood::getNoOfSourceSink, "How many sources there are.")
      .def("setHDSourceSink_Value", &Flood::setHDSourceSink_Value, py::arg("index"), py::arg("type"),
           py::arg("source_j"), py::arg("source_k"), py::arg("sink_j"), py::arg("sink_k"),
           py::arg("magnitude"), py::arg("velocity"), py::arg("outlet_direction"),
           "Type: 0 source, 1 sink, 2 a pair. Magnitude in m3/s, velocity in m/s, direction in degrees. A "
           "source that is not there is passed over.")
      .def("setHDSourceSink_File", &Flood::setHDSourceSink_File, py::arg("index"), py::arg("type"),
           py::arg("source_j"), py::arg("source_k"), py::arg("sink_j"), py::arg("sink_k"),
           py::arg("file_name"), py::arg("outlet_direction"), py::arg("magnitude_item"),
           py::arg("velocity_item"), "Only the items are stored: the file of the source stays what it was.")
      .def("setHDSourceSink_FileEx", &Flood::setHDSourceSink_FileEx, py::arg("index"), py::arg("type"),
           py::arg("source_j"), py::arg("source_k"), py::arg("sink_j"), py::arg("sink_k"),
           py::arg("file_name"), py::arg("item_1"), py::arg("item_2"), py::arg("item_3"),
           "With three items, in data format 2; only the items are stored.")
      .def(
          "getHDSourceSink",
          [](Flood& model, int index) -> py::object {
            if (index < 1 || index > model.getNoOfSourceSink()) return py::none();
            std::array<int, 6> numbers{};
            auto& [type, format, sourceJ, sourceK, sinkJ, sinkK] = numbers;
            std::array<double, 3> values{};
            std::array<int, 3> items{};
            std::string file;
            model.getHDSourceSink(index, type, format, sourceJ, sourceK, sinkJ, sinkK, values[0], values[1],
                                  values[2], file, items[0], items[1], items[2]);
            return py::make_tuple(type, format, sourceJ, sourceK, sinkJ, sinkK, values[0], values[1],
                                  values[2], file, items[0], items[1], items[2]);
          },
          py::arg("index"), "None for a source that is not there.")
      .def("AddOutput_MapsAndTimeSeriesJK", &Flood::AddOutput_MapsAndTimeSeriesJK, py::arg("type"),
           py::arg("use_sub_area"), py::arg("first_j"), py::arg("first_k"), py::arg("last_j"),
           py::arg("last_k"), py::arg("points_j"), py::arg("points_k"), py::arg("use_period"),
           py::arg("first_date"), py::arg("last_date"), py::arg("time_step_frequency"), py::arg("file_name"),
           py::arg("title"), py::arg("items"),
           "Type: 0 a map, 1 points, which need both lists. Frequency in time steps. Items: 1 water depth, 2 "
           "and 3 fluxes, 4 surface elevation, 5 and 6 velocities.")
      .def(
          "GetNextOutputs_MapsJKAndTS",
          [](Flood& model, OutputPosition position) {
            Output it;
            model.GetNextOutputs_MapsJKAndTS(position, it.type, it.useSubArea, it.firstJ, it.firstK, it.lastJ,
                                             it.lastK, it.pointsJ, it.pointsK, it.usePeriod, it.firstDate,
                                             it.lastDate, it.frequency, it.fileName, it.title, it.items);
            return it.tuple(position);
          },
          py::arg("position"), "The next position and the output at this one.");

  py::class_<Flooding_V27WSKFlowModel>(module, "Flooding_V27WSKFlowModel", py::module_local(),
                                       "A model of the Wetland Sweep Kit; it has no members of its own.")
      .def(py::init<>())
      .def(
          "as_flow_model", [](const Flooding_V27WSKFlowModel& model) { return Flood(model); },
          "An object with members that drives the same model.");

  using Urban = UrbanFlooding_V27Flowmodel;
  addFloodModel<Urban>(module, "UrbanFlooding_V27Flowmodel",
                       "A flood model by map coordinates and extensions of files.")
      .def("setBndCondition_Value", &Urban::setBndCondition_Value, py::arg("index"), py::arg("first_j"),
           py::arg("first_k"), py::arg("last_j"), py::arg("last_k"), py::arg("formulation"), py::arg("value"),
           "Formulation 1 is a level in m, 2 a flux in m3/s. A boundary that is not there is passed over.")
      .def("setBndCondition_File", &Urban::setBndCondition_File, py::arg("index"), py::arg("first_j"),
           py::arg("first_k"), py::arg("last_j"), py::arg("last_k"), py::arg("formulation"),
           py::arg("file_name"), py::arg("item"),
           "The extension says what the file is: .tsb0 or .tb0 a series in time, .tsb1 or .tb1 one along the "
           "line; of others nothing is stored.")
      .def(
          "as_flow_model", [](const Urban& model) { return Flood(model); },
          "An object of the other interface that drives the same model.")
      .def("AddOutput_MapsAndTimeSeries", &Urban::AddOutput_MapsAndTimeSeries, py::arg("type"),
           py::arg("use_sub_area"), py::arg("first_x"), py::arg("first_y"), py::arg("last_x"),
           py::arg("last_y"), py::arg("use_period"), py::arg("first_date"), py::arg("last_date"),
           py::arg("number_of_steps"), py::arg("file_name"), py::arg("title"), py::arg("water_depth"),
           py::arg("surface_elevation"), py::arg("velocities"), py::arg("fluxes"),
           "A part of the map between two corners in m. Coordinates of a point output have no effect.")
      .def(
          "GetNextOutputs_MapsJKAndTS",
          [](Urban& model, OutputPosition position, int ignored) {
            Output it;
            model.GetNextOutputs_MapsJKAndTS(position, ignored, it.useSubArea, it.firstJ, it.firstK, it.lastJ,
                                             it.lastK, it.pointsJ, it.pointsK, it.usePeriod, it.firstDate,
                                             it.lastDate, it.frequency, it.fileName, it.title, it.items);
            return py::tuple(py::make_tuple(position) + it.withoutType());
          },
          py::arg("position"), py::arg("ignored") = 0,
          "The next position and the output at this one, whose type is not given.");
}

void addClimateChange(py::module_& module) {
  using Climate = CClimateChange_V27;
  py::class_<Climate> climate(module, "CClimateChange_V27", py::module_local(),
                              "The forcings of a setup, to be looked at and replaced. Members give 1, and "
                              "what was asked for; or 0, and None.");
  climate.def(py::init<>())
      .def(
          "ShowMessagesWith",
          [](Climate& model, std::function<void(const std::string&)> show) {
            ShowMessagesWith(model, std::move(show));
          },
          py::arg("show"), kTexts)
      .def("OpenFile", &Climate::OpenFile, py::arg("file_name"), "1 where the file was read.")
      .def("SaveFile", &Climate::SaveFile, py::arg("file_name"), "Always 1; nothing is checked.")
      .def("GetSimulationPeriod",
           [](Climate& model) {
             scripting::DateTime start;
             scripting::DateTime end;
             const int result = model.GetSimulationPeriod(start, end);
             return py::make_tuple(result, start, end);
           })
      .def("GetLongLat",
           [](Climate& model) {
             double longitude = 0;
             double latitude = 0;
             const int result = model.GetLongLat(longitude, latitude);
             return py::make_tuple(result, longitude, latitude);
           })
      .def("ResultOutputsHasAbsolutePath", &Climate::ResultOutputsHasAbsolutePath,
           "1 where the name of an output has a folder.");
  const auto index = py::arg("index");
  const auto file = py::arg("file_name");
  const auto number = py::arg("value");
  climate.def("GetNoPrecValues", &Climate::GetNoPrecValues)
      .def("GetPrecValues", getter(&Climate::GetPrecValues), index)
      .def("SetPrecValues", &Climate::SetPrecValues, index, number)
      .def("GetNoPrecTimeSeries", &Climate::GetNoPrecTimeSeries)
      .def("GetPrecFileItem", getter(&Climate::GetPrecFileItem), index)
      .def("SetPrecFile", &Climate::SetPrecFile, index, file)
      .def("GetNoPrecGridSeries", &Climate::GetNoPrecGridSeries)
      .def("GetPrecGridFileItem", getter(&Climate::GetPrecGridFileItem), index)
      .def("SetPrecGridFile", &Climate::SetPrecGridFile, index, file)
      .def("GetNoEvapValues", &Climate::GetNoEvapValues)
      .def("GetEvapValues", getter(&Climate::GetEvapValues), index)
      .def("SetEvapValues", &Climate::SetEvapValues, index, number)
      .def("GetNoEvapTimeSeries", &Climate::GetNoEvapTimeSeries)
      .def("GetEvapFileItem", getter(&Climate::GetEvapFileItem), index)
      .def("SetEvapFile", &Climate::SetEvapFile, index, file)
      .def("GetNoEvapGridSeries", &Climate::GetNoEvapGridSeries)
      .def("GetEvapGridFileItem", getter(&Climate::GetEvapGridFileItem), index)
      .def("SetEvapGridFile", &Climate::SetEvapGridFile, index, file)
      .def("GetNoTempValues", &Climate::GetNoTempValues)
      .def("GetTempValues", getter(&Climate::GetTempValues), index)
      .def("SetTempValues", &Climate::SetTempValues, index, number)
      .def("GetNoTempTimeSeries", &Climate::GetNoTempTimeSeries)
      .def("GetTempFileItem", getter(&Climate::GetTempFileItem), index)
      .def("SetTempFile", &Climate::SetTempFile, index, file)
      .def("GetNoTempGridSeries", &Climate::GetNoTempGridSeries)
      .def("GetTempGridFileItem", getter(&Climate::GetTempGridFileItem), index)
      .def("SetTempGridFile", &Climate::SetTempGridFile, index, file)
      .def("GetNoWLValue", &Climate::GetNoWLValue)
      .def("GetNoWLTimeSeries", &Climate::GetNoWLTimeSeries)
      .def("GetNoWLLineSeries", &Climate::GetNoWLLineSeries)
      .def("GetWLvalueIDLocation", getter(&Climate::GetWLvalueIDLocation), index)
      .def("GetWLTSIDLocation", getter(&Climate::GetWLTSIDLocation), index)
      .def("GetWLLineIDLocation", getter(&Climate::GetWLLineIDLocation), index)
      .def("GetWLValue", getter(&Climate::GetWLValue), index)
      .def("SetWLValue", &Climate::SetWLValue, index, number)
      .def("GetWLFileItem", getter(&Climate::GetWLFileItem), index)
      .def("SetWLFile", &Climate::SetWLFile, index, file)
      .def("GetWLLineFileItem", getter(&Climate::GetWLLineFileItem), index)
      .def("SetWLLineFile", &Climate::SetWLLineFile, index, file, py::arg("item"));
}

}  // namespace

void addExportedClasses(py::module_& module) {
  addFloodModels(module);
  addClimateChange(module);
}

}  // namespace gridbay::python
