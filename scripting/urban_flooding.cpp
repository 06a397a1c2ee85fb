#include <algorithm>
#include <array>
#include <cstdint>
#include <limits>
#include <string_view>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "gridbay_setup/flood_models.h"
#include "hydrodynamic/boundary.h"
#include "scripting/flood_outputs.h"
#include "scripting/scripted_model.h"

namespace gridbay::scripting {
namespace {

struct FileKind {
  std::string_view extension;
  CNhdBoundaryObjectKvs::DataFormat format;
};

constexpr std::array<FileKind, 4> kFileKinds{{{".tsb0", CNhdBoundaryObjectKvs::kType0File},
                                              {".tb0", CNhdBoundaryObjectKvs::kType0File},
                                              {".tsb1", CNhdBoundaryObjectKvs::kType1File},
                                              {".tb1", CNhdBoundaryObjectKvs::kType1File}}};

// From the last dot of the last part of a path; folders may be parted as on another system.
std::string_view extensionOf(std::string_view fileName) {
  const std::size_t folder = fileName.find_last_of("/\\");
  if (folder != std::string_view::npos) fileName.remove_prefix(folder + 1);
  const std::size_t dot = fileName.rfind('.');
  return dot == std::string_view::npos ? std::string_view() : fileName.substr(dot);
}

}  // namespace

void UrbanFlooding_V27Flowmodel::setBndCondition_Value(int index, int firstJ, int firstK, int lastJ,
                                                       int lastK, int formulation, double value) {
  setHDBndCondition_Value(index, firstJ, firstK, lastJ, lastK, formulation, value);
}

void UrbanFlooding_V27Flowmodel::setBndCondition_File(int index, int firstJ, int firstK, int lastJ, int lastK,
                                                      int formulation, std::string fileName, int item) {
  const auto guard = model_->lock();
  const std::string_view extension = extensionOf(fileName);
  for (const FileKind& kind : kFileKinds) {
    if (kind.extension != extension) continue;
    setHDBndCondition_File(index, firstJ, firstK, lastJ, lastK, formulation, kind.format, fileName, item);
    return;
  }
  CBoundaryObjectKvs* line = model_->root.boundary->GetItem(index);
  if (line == nullptr) return;
  line->Set(firstJ, firstK, lastJ, lastK);
  model_->root.nhdBoundary->at(index).formulation = formulation;
}

void UrbanFlooding_V27Flowmodel::AddOutput_MapsAndTimeSeries(
    int type, int useSubArea, double firstX, double firstY, double lastX, double lastY, int usePeriod,
    DateTime firstDate, DateTime lastDate, double numberOfSteps, std::string fileName, std::string title,
    bool waterDepth, bool surfaceElevation, bool velocities, bool fluxes) {
  const auto guard = model_->lock();
  constexpr int kPoints = 1;
  double east = 0;
  double north = 0;
  {
    const auto dataFiles = ScriptedModel::lockDataFiles();
    std::string projection;
    model_->root.bathymetry->GetGeoReference(&projection, &east, &north);
  }
  const CBathymetryObjectKvs* area = model_->root.bathymetry->GetItem(1);
  const bool hasGrid = area != nullptr && !area->fileName.empty();
  const double dx = hasGrid ? double{area->dx} : 1.0;
  const double dy = hasGrid ? double{area->dy} : 1.0;

  FloodOutput output;
  output.type = type;
  output.useSubArea = useSubArea;
  output.firstJ = wholePart((firstX - east) / dx);
  output.firstK = wholePart((firstY - north) / dy);
  output.lastJ = wholePart((lastX - east) / dx);
  output.lastK = wholePart((lastY - north) / dy);
  if (waterDepth) output.items.push_back(1);
  if (fluxes) output.items.insert(output.items.end(), {2, 3});
  if (surfaceElevation) output.items.push_back(4);
  if (velocities) output.items.insert(output.items.end(), {5, 6});
  // One list alone, which is no point: callers rely on point outputs being of point (0, 0).
  if (type == kPoints) output.pointsJ = {static_cast<double>(output.firstK)};
  output.usePeriod = usePeriod;
  output.firstDate = firstDate;
  output.lastDate = lastDate;
  output.fileName = std::move(fileName);
  output.title = std::move(title);
  USubLine& steps = appendOutput(*model_, output).steps;
  const double span = double{static_cast<double>(steps.last)} - steps.first;
  const double interval = span / numberOfSteps;
  // No number of steps gives an interval that no integer holds.
  constexpr double kMost = std::numeric_limits<std::int32_t>::max();
  steps.interval = interval <= kMost ? std::max(wholePart(interval), 1) : 1;
  tellUnsupported(*model_, type);
}

void UrbanFlooding_V27Flowmodel::GetNextOutputs_MapsJKAndTS(
    OutputPosition& position, int /*ignored*/, int& useSubArea, int& firstJ, int& firstK, int& lastJ,
    int& lastK, std::vector<double>& pointsJ, std::vector<double>& pointsK, int& usePeriod,
    DateTime& firstDate, DateTime& lastDate, int& timeStepFrequency, std::string& fileName,
    std::string& title, std::vector<int>& items) {
  int type = 0;
  FloodModel::GetNextOutputs_MapsJKAndTS(position, type, useSubArea, firstJ, firstK, lastJ, lastK, pointsJ,
                                         pointsK, usePeriod, firstDate, lastDate, timeStepFrequency, fileName,
                                         title, items);
}

}  // namespace gridbay::scripting
