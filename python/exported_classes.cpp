#include <fmt/format.h>
#include <pybind11/functional.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include "basic/bathymetry.h"
#include "core/date_time.h"
#include "gridbay_setup/climate_change.h"
#include "gridbay_setup/flood_models.h"
#include "hydrodynamic/result.h"
#include "platform/tsb/tsb_file.h"
#include "python/arguments.h"
#include "scripting/scripted_model.h"

namespace pybind11::detail {

// A moment is a datetime, and None where there is none.
template <>
struct type_caster<gridbay::scripting::DateTime> {
  PYBIND11_TYPE_CASTER(gridbay::scripting::DateTime, const_name("datetime.datetime | None"));

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

template <>
struct Taken<scripting::DateTime> {
  static constexpr const char* kName = "datetime.datetime | None";
  static scripting::DateTime from(const Given& given) {
    if (given.value.is_none()) return {0, 1};
    const auto [year, month, day, hour, minute, second] = momentOf(given.value, given.path);
    const gridbay::DateTime moment = gridbay::DateTime::of({year, month, day, hour, minute, second});
    return {moment.day, moment.status};
  }
};
template <>
struct Taken<OutputPosition> {
  static constexpr const char* kName = "OutputPosition";
  static OutputPosition from(const Given& given) {
    if (!py::isinstance<OutputPosition>(given.value))
      throw refusal(kWrongType, given.path, shown(given.value), "an OutputPosition");
    const auto position = py::cast<OutputPosition>(given.value);
    checkEnds(given, position.number);
    return position;
  }
};
template <>
struct Taken<MessageBox> {
  static constexpr const char* kName = "Callable[[str], None] | None";
  static MessageBox from(const Given& given) {
    if (given.value.is_none()) return {};
    if (PyCallable_Check(given.value.ptr()) == 0)
      throw refusal(kWrongType, given.path, shown(given.value), "a function of a text, or None");
    return py::cast<MessageBox>(given.value);
  }
};

namespace {

constexpr const char* kTexts = "What validation and faults of a load have to say goes to this function.";
constexpr int kMostObjects = 100000;

// The model behind an object of a class.
template <class Model>
ScriptedModel& modelOf(Model& object) {
  struct Reach : Model {
    static auto member() { return &Reach::model_; }
  };
  return *(object.*Reach::member());
}

// Arguments of several members.
Argument fileName() {
  return {.name = "file_name", .form = Argument::Form::file};
}
Argument flag(const char* name) {
  return {.name = name, .form = Argument::Form::flag};
}
// The number of an item of a data file.
Argument item(const char* name = "item") {
  return {.name = name, .least = 1};
}
// The number of a thing in a list, and how many there are.
template <class Model, class Count>
Argument indexIn(Count count) {
  return {.name = "index", .least = 1, .most = [count](py::handle self) {
            return std::invoke(count, py::cast<Model&>(self));
          }};
}
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

// A file that is to be read must be there, whatever else the class passes over.
template <class Model>
void load(Model& model, const std::string& file) {
  const ScriptedModel::Loaded loaded = [&] {
    const auto guard = modelOf(model).lock();
    return modelOf(model).load(file);
  }();
  if (!loaded.fault.empty()) throw Refusal{kFileError, loaded.fault, file};
}

void refuseUnwritten(const Outcome& written, const std::string& file) {
  if (!written) throw Refusal{kFileError, written.error(), file};
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
    if (!grid) throw Refusal{kFileError, grid.error(), name.absolute()};
    if (grid->definition().axes.size() != 2)
      throw refusal(kFileError, name.absolute(),
                    fmt::format("a file of {} axes", grid->definition().axes.size()), "a grid, which has 2");
  }
  object.setCoarseBathymetryFile(file);
}

// A Get member of an index as a function of the index alone: 1 with its outputs, or 0 and nothing.
template <class... Outputs>
py::tuple found(int result, const Outputs&... outputs) {
  if (result == 0) return py::make_tuple(0, (static_cast<void>(outputs), py::none())...);
  return tupleOf(result, outputs...);
}
template <class Model, class... Outputs>
auto getter(int (Model::*member)(int, Outputs&...)) {
  return [member](Model& model, int index) {
    std::tuple<Outputs...> outputs{};
    return std::apply([&](auto&... output) { return found((model.*member)(index, output...), output...); },
                      outputs);
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
    return tupleOf(useSubArea, firstJ, firstK, lastJ, lastK, pointsJ, pointsK, usePeriod, firstDate, lastDate,
                   frequency, fileName, title, items);
  }
};

// The members that the two open classes share.
template <class Model>
Members<Model> addFloodModel(py::module_& module, const char* name, const char* doc) {
  Members<Model> flood(py::class_<Model>(module, name, py::module_local(), doc).def(py::init<>()));
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
      .add(
          "getHDBndCondition",
          [](Flood& model, int index) {
            std::array<int, 6> numbers{};
            double value = 0;
            std::string file;
            int item = 0;
            auto& [j1, k1, j2, k2, formulation, format] = numbers;
            model.getHDBndCondition(index, j1, k1, j2, k2, formulation, format, value, file, item);
            return tupleOf(j1, k1, j2, k2, formulation, format, value, file, item);
          },
          {boundary<Flood>()}, "Points, formulation, data format, value, file and item; 0 or \"\" for none.")
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
      .add(
          "getHDSourceSink",
          [](Flood& model, int index) {
            std::array<int, 6> numbers{};
            auto& [type, format, sourceJ, sourceK, sinkJ, sinkK] = numbers;
            double magnitude = 0;
            double velocity = 0;
            double direction = 0;
            std::array<int, 3> items{};
            std::string file;
            model.getHDSourceSink(index, type, format, sourceJ, sourceK, sinkJ, sinkK, magnitude, velocity,
                                  direction, file, items[0], items[1], items[2]);
            return tupleOf(type, format, sourceJ, sourceK, sinkJ, sinkK, magnitude, velocity, direction, file,
                           items[0], items[1], items[2]);
          },
          {source()},
          "Type, data format, points, magnitude, velocity, direction, file, which is never told, and items.")
      .add("AddOutput_MapsAndTimeSeriesJK", &Flood::AddOutput_MapsAndTimeSeriesJK,
           with(with(with({{"type"}, flag("use_sub_area")},
                          {"first_j", "first_k", "last_j", "last_k", "points_j", "points_k"}, period),
                     {"time_step_frequency"}, {fileName()}),
                {"title"}, {item("items")}),
           "Type: 0 a map, 1 points, which need both lists. Frequency in time steps. Items: 1 water depth, 2 "
           "and 3 fluxes, 4 surface elevation, 5 and 6 velocities.")
      .add(
          "GetNextOutputs_MapsJKAndTS",
          [](Flood& model, OutputPosition position) {
            Output it;
            model.GetNextOutputs_MapsJKAndTS(position, it.type, it.useSubArea, it.firstJ, it.firstK, it.lastJ,
                                             it.lastK, it.pointsJ, it.pointsK, it.usePeriod, it.firstDate,
                                             it.lastDate, it.frequency, it.fileName, it.title, it.items);
            return it.tuple(position);
          },
          {position<Flood>()}, "The next position and the output at this one.");

  Members<Flooding_V27WSKFlowModel>(
      py::class_<Flooding_V27WSKFlowModel>(module, "Flooding_V27WSKFlowModel", py::module_local(),
                                           "A model of the Wetland Sweep Kit; it has no members of its own.")
          .def(py::init<>()))
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
      .add(
          "GetNextOutputs_MapsJKAndTS",
          [](Urban& model, OutputPosition position, int ignored) {
            Output it;
            model.GetNextOutputs_MapsJKAndTS(position, ignored, it.useSubArea, it.firstJ, it.firstK, it.lastJ,
                                             it.lastK, it.pointsJ, it.pointsK, it.usePeriod, it.firstDate,
                                             it.lastDate, it.frequency, it.fileName, it.title, it.items);
            return py::tuple(py::make_tuple(position) + it.withoutType());
          },
          {position<Urban>(), {.name = "ignored", .fallback = 0}},
          "The next position and the output at this one, whose type is not given.");
}

using Climate = CClimateChange_V27;

Argument nth(int (Climate::*count)()) {
  return indexIn<Climate>(count);
}

// The members over the value, the time series and the maps of one forcing.
template <class No, class GetValue, class SetValue, class GetFile, class SetFile>
void addForcing(Members<Climate>& climate, const std::string& name, const std::string& what,
                const std::string& howMany, No countValues, GetValue getValue, SetValue setValue,
                No countSeries, GetFile getSeries, SetFile setSeries, No countMaps, GetFile getMaps,
                SetFile setMaps) {
  const Argument file = fileName();
  const auto add = [&](const std::string& member, auto function, std::vector<Argument> arguments,
                       const std::string& doc) {
    climate.add(member.c_str(), function, std::move(arguments), doc.c_str());
  };
  add("GetNo" + name + "Values", countValues, {},
      "How many constants there are of " + what + "; 0 counts as none." + howMany);
  add("Get" + name + "Values", getter(getValue), {nth(countValues)}, "The constant: " + what + ".");
  add("Set" + name + "Values", setValue, {nth(countValues), {"value"}},
      "Gives the constant another value: " + what + ".");
  add("GetNo" + name + "TimeSeries", countSeries, {},
      "How many time series there are of " + what + "." + howMany);
  add("Get" + name + "FileItem", getter(getSeries), {nth(countSeries)},
      "The file of the time series, and 1 for its item: " + what + ".");
  add("Set" + name + "File", setSeries, {nth(countSeries), file},
      "Gives the time series another file: " + what + ".");
  add("GetNo" + name + "GridSeries", countMaps, {},
      "How many maps in time there are of " + what + "." + howMany);
  add("Get" + name + "GridFileItem", getter(getMaps), {nth(countMaps)},
      "The file of the maps, and 1 for its item: " + what + ".");
  add("Set" + name + "GridFile", setMaps, {nth(countMaps), file},
      "Gives the maps another file: " + what + ".");
}

void addClimateChange(py::module_& module) {
  const Argument value{"value"};
  const Argument file = fileName();
  Members<Climate> climate(
      py::class_<Climate>(module, "CClimateChange_V27", py::module_local(),
                          "The forcings of a setup, to be looked at and replaced. Indices count, "
                          "from 1, what is of the kind. Members give 1, and what was asked for.")
          .def(py::init<>()));
  climate
      .add(
          "ShowMessagesWith",
          [](Climate& model, MessageBox show) { ShowMessagesWith(model, std::move(show)); }, {{"show"}},
          kTexts)
      .add(
          "OpenFile",
          [](Climate& model, std::string name) {
            load(model, name);
            return 1;
          },
          {file}, "1. FileError where the file can't be read or is no setup.")
      .add(
          "SaveFile",
          [](Climate& object, std::string name) {
            const Outcome written = [&] {
              const auto guard = modelOf(object).lock();
              return modelOf(object).write(name);
            }();
            refuseUnwritten(written, name);
            return 1;
          },
          {file}, "1; nothing is checked. FileError where the file can't be written.",
          "outputs whose items can be saved")
      .add(
          "GetSimulationPeriod",
          [](Climate& model) {
            scripting::DateTime start;
            scripting::DateTime end;
            const int result = model.GetSimulationPeriod(start, end);
            return tupleOf(result, start, end);
          },
          {}, "Always 0, with start and end.")
      .add(
          "GetLongLat",
          [](Climate& model) {
            double longitude = 0;
            double latitude = 0;
            const int result = model.GetLongLat(longitude, latitude);
            return tupleOf(result, longitude, latitude);
          },
          {}, "1 and degrees; 0 in local coordinates.")
      .add("ResultOutputsHasAbsolutePath", &Climate::ResultOutputsHasAbsolutePath, {},
           "1 where the name of an output has a folder.");
  using C = Climate;
  const std::string once = " There is one at most.";
  addForcing(climate, "Prec", "precipitation, mm per day", once, &C::GetNoPrecValues, &C::GetPrecValues,
             &C::SetPrecValues, &C::GetNoPrecTimeSeries, &C::GetPrecFileItem, &C::SetPrecFile,
             &C::GetNoPrecGridSeries, &C::GetPrecGridFileItem, &C::SetPrecGridFile);
  addForcing(climate, "Evap", "evaporation, mm per day", once, &C::GetNoEvapValues, &C::GetEvapValues,
             &C::SetEvapValues, &C::GetNoEvapTimeSeries, &C::GetEvapFileItem, &C::SetEvapFile,
             &C::GetNoEvapGridSeries, &C::GetEvapGridFileItem, &C::SetEvapGridFile);
  addForcing(climate, "Temp", "air temperature, degrees Celsius",
             " There is one where just one component is the temperature.", &C::GetNoTempValues,
             &C::GetTempValues, &C::SetTempValues, &C::GetNoTempTimeSeries, &C::GetTempFileItem,
             &C::SetTempFile, &C::GetNoTempGridSeries, &C::GetTempGridFileItem, &C::SetTempGridFile);
  const Argument level = nth(&C::GetNoWLValue);
  const Argument series = nth(&C::GetNoWLTimeSeries);
  const Argument line = nth(&C::GetNoWLLineSeries);
  constexpr const char* kPlace =
      "The number of the boundary among all of them, from 1, and its first and last point as \"(0,0) - "
      "(0,243)\".";
  climate
      .add("GetNoWLValue", &C::GetNoWLValue, {},
           "How many boundaries have a constant water level or a sine series, which counts by its mean.")
      .add("GetNoWLTimeSeries", &C::GetNoWLTimeSeries, {},
           "How many boundaries have water levels from a time series.")
      .add("GetNoWLLineSeries", &C::GetNoWLLineSeries, {},
           "How many boundaries have water levels from a series along the line.")
      .add("GetWLvalueIDLocation", getter(&C::GetWLvalueIDLocation), {level}, kPlace)
      .add("GetWLTSIDLocation", getter(&C::GetWLTSIDLocation), {series}, kPlace)
      .add("GetWLLineIDLocation", getter(&C::GetWLLineIDLocation), {line}, kPlace)
      .add("GetWLValue", getter(&C::GetWLValue), {level}, "The water level, or the mean of a sine series, m.")
      .add("SetWLValue", &C::SetWLValue, {level, value},
           "Gives the boundary another water level, or a sine series another mean, m.")
      .add("GetWLFileItem", getter(&C::GetWLFileItem), {series},
           "The file of water levels and its item, from 1.")
      .add("SetWLFile", &C::SetWLFile, {series, file},
           "Gives the boundary another time series; of the file item 1.")
      .add("GetWLLineFileItem", getter(&C::GetWLLineFileItem), {line},
           "The file of water levels along the line and its item, from 1.")
      .add("SetWLLineFile", &C::SetWLLineFile, {line, file, item()},
           "Gives the boundary another series along the line; an item below 1 is refused.");
}

}  // namespace

void addExportedClasses(py::module_& module) {
  addFloodModels(module);
  addClimateChange(module);
}

}  // namespace gridbay::python
