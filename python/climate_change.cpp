#include "gridbay_setup/climate_change.h"

#include "python/scripted_members.h"

namespace gridbay::python {
namespace py = pybind11;
using namespace scripting;

namespace {

using Climate = CClimateChange_V27;

Argument nth(int (Climate::*count)()) {
  return indexIn<Climate>(count);
}

// A Get member of an index: 1 with its outputs, or 0 and nothing.
template <class... Outputs>
auto getter(int (Climate::*member)(int, Outputs&...)) {
  return [read = reader<Climate>(member)](Climate& model, int index) {
    py::tuple found = read(model, index);
    if (py::cast<int>(found[0]) != 0) return found;
    for (std::size_t i = 1; i < found.size(); ++i) found[i] = py::none();
    return found;
  };
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

}  // namespace

void addClimateChange(py::module_& module) {
  const Argument value{"value"};
  const Argument file = fileName();
  Members<Climate> climate(
      scriptingClass<Climate>(module, "CClimateChange_V27",
                              "The forcings of a setup, to be looked at and replaced. Indices count, "
                              "from 1, what is of the kind. Members give 1, and what was asked for."));
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
      .add("GetSimulationPeriod", reader<Climate>(&Climate::GetSimulationPeriod), {},
           "Always 0, with start and end.")
      .add("GetLongLat", reader<Climate>(&Climate::GetLongLat), {}, "1 and degrees; 0 in local coordinates.")
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

}  // namespace gridbay::python
