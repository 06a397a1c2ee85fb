#pragma once

#include <memory>
#include <string>

#include "gridbay_setup/types.h"

namespace gridbay {
class ScriptedModel;
}

namespace gridbay::scripting {

// By which a program looks at the forcings of a setup, gives them other values or files, and writes it back:
// precipitation and evaporation (mm/day), air temperature (degrees Celsius), and water level at boundaries
// (metres).
//
// Members return 1, or 0 where what they ask for is not there; then their outputs and the model are as they
// were. An index counts, from 1, what is of the kind: of precipitation, evaporation and temperature there is
// one thing at most. Whether a file is there is not looked at. File names that are not absolute start from
// the folder of the setup that was opened.
//
// Only SaveFile throws: std::invalid_argument where the items of an output can't be saved (saturation last).
//
// Threads: as those of gridbay_setup/flood_models.h. Members on one object run one after the other, each as a
// whole. A copy shares the model of the object that it was made from, which goes with the last of them.
class [[gnu::visibility("default")]] CClimateChange_V27 {
 public:
  // A default model with one area.
  CClimateChange_V27();
  CClimateChange_V27(const CClimateChange_V27&) = default;
  CClimateChange_V27& operator=(const CClimateChange_V27&) = default;
  virtual ~CClimateChange_V27();

  // 1 if the file was read; a second one begins with a default model again. A syntax error is shown, through
  // the message box; any other fault is silent. The grids are read then, whatever happened.
  int OpenFile(std::string fileName);
  // Always 1; nothing is checked or shown. Options of the engine, which the file may have, are not written.
  int SaveFile(std::string fileName);
  // Always 0, with the two dates given: the result must not be tested.
  int GetSimulationPeriod(DateTime & start, DateTime & end);
  // The place of the first grid point (degrees); 0, and 0.0 for both, in local coordinates.
  int GetLongLat(double& longitude, double& latitude);
  // Whether the file of an output of the flow is named with a folder.
  int ResultOutputsHasAbsolutePath();

  // A constant of 0 counts as not there. A file's item is told as 1 always.
  int GetNoPrecValues();
  int GetPrecValues(int index, double& value);
  int SetPrecValues(int index, double value);
  int GetNoPrecTimeSeries();
  int GetPrecFileItem(int index, std::string& fileName, int& item);
  int SetPrecFile(int index, std::string fileName);
  int GetNoPrecGridSeries();
  int GetPrecGridFileItem(int index, std::string& fileName, int& item);
  int SetPrecGridFile(int index, std::string fileName);

  int GetNoEvapValues();
  int GetEvapValues(int index, double& value);
  int SetEvapValues(int index, double value);
  int GetNoEvapTimeSeries();
  int GetEvapFileItem(int index, std::string& fileName, int& item);
  int SetEvapFile(int index, std::string fileName);
  int GetNoEvapGridSeries();
  int GetEvapGridFileItem(int index, std::string& fileName, int& item);
  int SetEvapGridFile(int index, std::string fileName);

  // Where just one component is the temperature; a constant of 0 counts. SetTempValues returns 1 wherever
  // there is that one component, whether it stored the value or not.
  int GetNoTempValues();
  int GetTempValues(int index, double& value);
  int SetTempValues(int index, double value);
  int GetNoTempTimeSeries();
  int GetTempFileItem(int index, std::string& fileName, int& item);
  int SetTempFile(int index, std::string fileName);
  int GetNoTempGridSeries();
  int GetTempGridFileItem(int index, std::string& fileName, int& item);
  int SetTempGridFile(int index, std::string fileName);

  // Boundaries of a level. Values are constants and sine series (their mean level), time series and line
  // series are files. The boundary number is its place in the list of all boundaries, from 1, the location
  // its first and last point as "(0,0) - (0,243)".
  int GetNoWLValue();
  int GetNoWLTimeSeries();
  int GetNoWLLineSeries();
  int GetWLvalueIDLocation(int index, int& boundaryNumber, std::string& location);
  int GetWLTSIDLocation(int index, int& boundaryNumber, std::string& location);
  int GetWLLineIDLocation(int index, int& boundaryNumber, std::string& location);
  int GetWLValue(int index, double& value);
  int SetWLValue(int index, double value);
  int GetWLFileItem(int index, std::string& fileName, int& item);
  // Of the file item 1.
  int SetWLFile(int index, std::string fileName);
  int GetWLLineFileItem(int index, std::string& fileName, int& item);
  // An item below 1 is refused.
  int SetWLLineFile(int index, std::string fileName, int item);

  // Shows what this model has to say, from now on; an empty function is standard error again.
  friend void ShowMessagesWith(CClimateChange_V27 & model, MessageBox show);

 protected:
  // The kind is 1 for values, 2 for time series, 3 for line series.
  int GetNoWaterlevel(int kind);
  int GetWaterLevelBoundaryObject(int kind, int index, int& boundaryNumber);
  int GetWaterLevel(int kind, int index, int& boundaryNumber, std::string& location);

  std::shared_ptr<ScriptedModel> model_;
};

[[gnu::visibility("default")]] void ShowMessagesWith(CClimateChange_V27& model, MessageBox show);

}  // namespace gridbay::scripting
