#pragma once

#include <memory>
#include <string>
#include <vector>

#include "gridbay_setup/types.h"

// Classes by which a program builds or changes the setup of a flood simulation, with no editor: one area, the
// flow alone, an overland solver on a finer grid, boundaries, sources, rain, and what is to be written.
//
// Units: metres, m³/s, seconds and the other base units of the setup; rain in mm/day; numbers that are stored
// in single precision are rounded to it. Grid points are J and K from 0, along x and along y; boundaries,
// sources and items of data files are numbered from 1. A file name that is not absolute starts from the
// folder of the setup that was loaded, and from the current folder in a model of which none was.
//
// A member returns no status. What validation finds is shown by SaveFile, through the message box (see
// ShowMessagesWith), which is standard error until another is set. Only these throw std::invalid_argument,
// and say what was given and what is there:
//   setCoarseBathymetryFile, getCoarseBathymetryFile   the model has no area
//   setHDBndCondition_File, setBndCondition_File       the format has no item to take the number
//   setNoOfBndCondition, setNoOfSourceSink             a count above kMostObjects; nothing is changed
//   GetNextOutputs_MapsJKAndTS                         no output is at the position
//   SaveFile                                           the items of an output can't be saved (saturation
//   last)
//
// Threads: objects in different threads know nothing of each other; of the members that read data files one
// runs at a time in a process. Members that are called on one object, or on objects that share a model, from
// several threads run one after the other, each as a whole, in the order in which they come; only while a
// message is shown others may go on. What two threads set is then a mixture that nobody decides; a position
// found before outputs were cleared finds none. A message box that throws does so through the member, which
// has done its work.

namespace gridbay {
class ScriptedModel;
}

namespace gridbay::scripting {

// The one body of the classes below, which offer parts of it. A copy shares the model of the object that it
// was made from, and what is set in one is seen in the other; the model goes with the last of them.
class [[gnu::visibility("default")]] FloodModel {
 public:
  FloodModel(const FloodModel&) = default;
  FloodModel& operator=(const FloodModel&) = default;

  // Shows what this model has to say, from now on; an empty function is standard error again.
  friend void ShowMessagesWith(FloodModel & model, MessageBox show);

 protected:
  // A default model with one area, without high precision, of inland flooding.
  FloodModel();
  ~FloodModel() = default;

  // Reads a setup; a second one begins with a default model again. A syntax error is shown and leaves the
  // model as it was; any other fault, as a file that is not there, does so silently. The grids are read then,
  // whatever happened.
  void LoadFile(std::string fileName);
  // Shows what validation finds, if anything, and writes the setup all the same. Why a file can't be written
  // is shown too; it is then as it was. Options of the engine and sections of another version, which a loaded
  // file may have, are not written.
  void SaveFile(std::string fileName);
  // ".v27", in both editions.
  std::string GetFileExtension();

  // Time step in seconds. The number of steps is that of whole steps from start to end.
  void SetSimulationPeriod(DateTime start, DateTime end, float timeStep);
  // Metres of water.
  void setDryingFloodingDepth(float dryingDepth, float floodingDepth);

  // The grid of the area: reads it, and takes over the projection of its file where none is set yet; that of
  // a file that can't be read, or has no place on a map, is local coordinates. No Coriolis force from now on.
  void setCoarseBathymetryFile(std::string fileName);
  std::string getCoarseBathymetryFile();
  // The grid of the overland solver, which is not looked at.
  void setFineBathymetryFile(std::string fileName);
  std::string getFineBathymetryFile();
  // 1 turns the solver on; every other number turns it off.
  void setOverlandSolverOption(int option);

  // The Manning number (m^⅓/s) of the whole area, or its map.
  void setResistance_Value(double value);
  void setResistance_File(std::string fileName, int item);
  // The water level at the start (metres), or its map.
  void setInitialCondition_Value(double value);
  void setInitialCondition_File(std::string fileName, int item);

  // Boundaries are user specified from now on. A negative count leaves them as many as they are; else they
  // are taken from the end, or empty ones appended.
  void setNoOfBndCondition(int count);
  int getNoOfBndConditions();
  // A boundary that is not there (index from 1) is passed over. Formulation 1 is a level (metres), 2 a flux
  // (m³/s).
  void setHDBndCondition_Value(int index, int firstJ, int firstK, int lastJ, int lastK, int formulation,
                               double value);
  // Data format: 3 a series in time, 4 a series along the line, 5 transfer data, 7 a rating curve. With
  // format 5 there is no item: std::invalid_argument, when all else has been set.
  void setHDBndCondition_File(int index, int firstJ, int firstK, int lastJ, int lastK, int formulation,
                              int dataFormat, std::string fileName, int item);
  // Of a boundary that is not there nothing is given. With data format 1 there is a value and no file; with
  // any other a file, its first item if it has one, and no value.
  void getHDBndCondition(int index, int& firstJ, int& firstK, int& lastJ, int& lastK, int& formulation,
                         int& dataFormat, double& value, std::string& fileName, int& item);

  // A negative count does nothing.
  void setNoOfSourceSink(int count);
  int getNoOfSourceSink();
  // A source that is not there (index from 1) is passed over. Type: 0 isolated source, 1 isolated sink, 2 a
  // pair. Magnitude in m³/s, velocity in m/s, direction in degrees.
  void setHDSourceSink_Value(int index, int type, int sourceJ, int sourceK, int sinkJ, int sinkK,
                             double magnitude, double velocity, double outletDirection);
  // From a file, of which only the items are stored: its name stays what it was.
  void setHDSourceSink_File(int index, int type, int sourceJ, int sourceK, int sinkJ, int sinkK,
                            std::string fileName, double outletDirection, int magnitudeItem,
                            int velocityItem);
  // With three items, in data format 2; the file's name is not stored here either.
  void setHDSourceSink_FileEx(int index, int type, int sourceJ, int sourceK, int sinkJ, int sinkK,
                              std::string fileName, int item1, int item2, int item3);
  // Gives all but the file's name. Of two items the first two are given, three of three, else none.
  void getHDSourceSink(int index, int& type, int& dataFormat, int& sourceJ, int& sourceK, int& sinkJ,
                       int& sinkK, double& magnitude, double& velocity, double& outletDirection,
                       std::string& fileName, int& item1, int& item2, int& item3);

  // A flux based eddy viscosity of 0.02 dx dy / dt (m²/s): to be called when grid and period are set.
  void setEddyViscosity_IncludedWithDefaultValue();
  void setEddyViscosity_NotIncluded();
  // Formulation: 0 flux based, 1 velocity based.
  void setEddyViscosity_Value(double value, int formulation);

  // Rain on dry land too. As a constant (mm/day), or from a file as net precipitation; the type is 0 for a
  // constant, 1 for a time series, 2 for maps in time.
  void setRain_Value(double value);
  void setRain_File(std::string fileName, int precipitationType, int item);

  // The store step is in time steps.
  void setOutput_MaximumFloodDepthAndExtend(std::string fileName, int storeStep);
  // Another output. Type 0 is a map, of a part of the grid if that is used; 1 is of points, which need both
  // lists; another type is told and taken for a map. Frequency in time steps, 1 at least. Items are those of
  // the results of the flow: 1 water depth, 2 and 3 fluxes, 4 surface elevation, 5 and 6 velocities.
  void AddOutput_MapsAndTimeSeriesJK(int type, int useSubArea, int firstJ, int firstK, int lastJ, int lastK,
                                     std::vector<double> pointsJ, std::vector<double> pointsK, int usePeriod,
                                     DateTime firstDate, DateTime lastDate, int timeStepFrequency,
                                     std::string fileName, std::string title, std::vector<int> items);
  // Null when there is none.
  OutputPosition GetOutputsListHeadPos();
  // Gives the output at the position, which steps on. What an output does not have stays: limits of a map of
  // all the grid, points of a map, dates and frequency of an output of all time steps.
  void GetNextOutputs_MapsJKAndTS(OutputPosition & position, int& type, int& useSubArea, int& firstJ,
                                  int& firstK, int& lastJ, int& lastK, std::vector<double>& pointsJ,
                                  std::vector<double>& pointsK, int& usePeriod, DateTime& firstDate,
                                  DateTime& lastDate, int& timeStepFrequency, std::string& fileName,
                                  std::string& title, std::vector<int>& items);
  void ClearHDResultOutputs();

  std::shared_ptr<ScriptedModel> model_;

 private:
  std::string _GetErrorTexts();
};

[[gnu::visibility("default")]] void ShowMessagesWith(FloodModel& model, MessageBox show);

// What the two interfaces below have alike.
class [[gnu::visibility("default")]] FloodMembers : public FloodModel {
 public:
  FloodMembers(const FloodMembers&) = default;
  FloodMembers& operator=(const FloodMembers&) = default;

  using FloodModel::GetFileExtension;
  using FloodModel::LoadFile;
  using FloodModel::SaveFile;

  using FloodModel::setDryingFloodingDepth;
  using FloodModel::SetSimulationPeriod;

  using FloodModel::getCoarseBathymetryFile;
  using FloodModel::getFineBathymetryFile;
  using FloodModel::setCoarseBathymetryFile;
  using FloodModel::setFineBathymetryFile;
  using FloodModel::setOverlandSolverOption;

  using FloodModel::setInitialCondition_File;
  using FloodModel::setInitialCondition_Value;
  using FloodModel::setNoOfBndCondition;
  using FloodModel::setResistance_File;
  using FloodModel::setResistance_Value;

  using FloodModel::setEddyViscosity_IncludedWithDefaultValue;
  using FloodModel::setEddyViscosity_NotIncluded;
  using FloodModel::setEddyViscosity_Value;
  using FloodModel::setRain_File;
  using FloodModel::setRain_Value;

  using FloodModel::ClearHDResultOutputs;
  using FloodModel::GetOutputsListHeadPos;
  using FloodModel::setOutput_MaximumFloodDepthAndExtend;

 protected:
  FloodMembers() = default;
  explicit FloodMembers(const FloodModel& other) : FloodModel(other) {}
  ~FloodMembers() = default;
};

// The whole interface, by grid points and numbers of data formats.
class [[gnu::visibility("default")]] Flooding_V27FlowModel : public FloodMembers {
 public:
  Flooding_V27FlowModel() = default;
  // Drives the model of an object of another class.
  explicit Flooding_V27FlowModel(const FloodModel& other) : FloodMembers(other) {}

  using FloodModel::getHDBndCondition;
  using FloodModel::getNoOfBndConditions;
  using FloodModel::setHDBndCondition_File;
  using FloodModel::setHDBndCondition_Value;

  using FloodModel::getHDSourceSink;
  using FloodModel::getNoOfSourceSink;
  using FloodModel::setHDSourceSink_File;
  using FloodModel::setHDSourceSink_FileEx;
  using FloodModel::setHDSourceSink_Value;
  using FloodModel::setNoOfSourceSink;

  using FloodModel::AddOutput_MapsAndTimeSeriesJK;
  using FloodModel::GetNextOutputs_MapsJKAndTS;
};

// A model of the Wetland Sweep Kit; it has no members of its own.
class [[gnu::visibility("default")]] Flooding_V27WSKFlowModel : public FloodModel {
 public:
  Flooding_V27WSKFlowModel() = default;
  explicit Flooding_V27WSKFlowModel(const FloodModel& other) : FloodModel(other) {}
};

// The interface for who thinks in map coordinates and extensions of files.
class [[gnu::visibility("default")]] UrbanFlooding_V27Flowmodel : public FloodMembers {
 public:
  UrbanFlooding_V27Flowmodel() = default;
  explicit UrbanFlooding_V27Flowmodel(const FloodModel& other) : FloodMembers(other) {}

  // As setHDBndCondition_Value.
  void setBndCondition_Value(int index, int firstJ, int firstK, int lastJ, int lastK, int formulation,
                             double value);
  // The extension of the file, letter by letter, says what it is: ".tsb0" or ".tb0" a series in time, ".tsb1"
  // or ".tb1" one along the line. With any other one points and formulation are set, file and item are not.
  void setBndCondition_File(int index, int firstJ, int firstK, int lastJ, int lastK, int formulation,
                            std::string fileName, int item);

  // Another output, of the part of the map between two corners (metres in the projection of the area's file;
  // grid points where it has none). The number of steps is how many intervals the period is written in.
  // Coordinates of a point output have no effect: it is of point (0, 0).
  void AddOutput_MapsAndTimeSeries(int type, int useSubArea, double firstX, double firstY, double lastX,
                                   double lastY, int usePeriod, DateTime firstDate, DateTime lastDate,
                                   double numberOfSteps, std::string fileName, std::string title,
                                   bool waterDepth, bool surfaceElevation, bool velocities, bool fluxes);
  // As in Flooding_V27FlowModel, but that the type is not given: the second argument is ignored.
  void GetNextOutputs_MapsJKAndTS(OutputPosition & position, int ignored, int& useSubArea, int& firstJ,
                                  int& firstK, int& lastJ, int& lastK, std::vector<double>& pointsJ,
                                  std::vector<double>& pointsK, int& usePeriod, DateTime& firstDate,
                                  DateTime& lastDate, int& timeStepFrequency, std::string& fileName,
                                  std::string& title, std::vector<int>& items);
};

}  // namespace gridbay::scripting
