#include <array>
#include <cmath>
#include <cstdio>
#include <limits>
#include <utility>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/bathymetry_requests.h"
#include "basic/grid_file.h"
#include "basic/simulation_period.h"
#include "core/land_value.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

constexpr int kLeastPoints = 3;

// What a grid file says of an area, before any of it counts.
struct GridFile {
  int noJ = 0;
  int noK = 0;
  float dx = 0;
  float dy = 0;
  float landValue = kNoLandValue;
  CVdArray2D<float> grid;
  CVdArray2D<float> placement;  // of a hot start file
  DateTime start;
  float timeStep = 0;
};

std::int32_t truncated(float number) {
  constexpr float kLimit = 2147483520.0F;  // the greatest float below 2^31
  return std::isfinite(number) ? static_cast<std::int32_t>(std::min(std::max(number, -kLimit), kLimit)) : 0;
}

DateTime dateTimeOf(const std::string& date, const std::string& time) {
  std::array<std::int32_t, 6> parts{};
  const bool whole = std::sscanf(date.c_str(), "%d-%d-%d", &parts[0], &parts[1], &parts[2]) == 3 &&
                     std::sscanf(time.c_str(), "%d:%d:%d", &parts[3], &parts[4], &parts[5]) == 3;
  return whole ? DateTime::of(parts) : DateTime::invalid();
}

// The values of an item at the first time step; the library's status.
int readItem(TsbHeader& header, int item, CVdArray2D<float>& grid) {
  int status = tsbFindBlockDynamic(&header);
  if (status == 0 && item > 1) status = tsbFindItemDynamic(&header, 0, item);
  return status != 0 ? status : tsbReadItemTimeStep(header, grid.values());
}

}  // namespace

unsigned CBathymetryObjectKvs::ReadGrid(ValidationList& messages, int areaNumber) {
  auto* basic = parts<BasicParts>();
  const bool hotStart = basic != nullptr && basic->bathymetry->hotStart == 1;
  const auto notValid = [&] {
    return report(messages, PageId::bathymetry, Severity::dependedUpon, texts::dataFileNotValid,
                  fileName.text());
  };
  unsigned faults = 0;
  GridFile file;

  // Steps 1 and 2: a valid file, opened.
  CVdFileSelectorDlg selector;
  RequestBathymetry(selector, hotStart);
  std::string errorText;
  TsbHeader header;
  if (tsbFileRead(fileName.absolute(), &header, &errorText) != 0 ||
      !selector.IsTsbFileValid(header, &errorText)) {
    grid = {};
    noJ = noK = 0;
    dx = dy = 0;
    return notValid();
  }

  const auto readContents = [&] {
    const int axis = tsbGetItemAxisEqD2(header, 1, &file.noJ, &file.noK, &file.dx, &file.dy);
    if (axis != 0 || file.noJ < kLeastPoints || file.noK < kLeastPoints || !(file.dx > 0) || !(file.dy > 0)) {
      notValid();
      return 1U;
    }
    file.grid = CVdArray2D<float>(file.noJ, file.noK);
    int status = readItem(header, elevationItem(hotStart), file.grid);
    if (status == 0 && hotStart) {
      file.placement = CVdArray2D<float>(file.noJ, file.noK);
      status = readItem(header, 1, file.placement);
    }
    if (status != 0) {
      notValid();
      return static_cast<unsigned>(status) + 1;
    }
    if (hotStart && areaNumber == 1) {
      std::string date;
      std::string time;
      double step = 0;
      tsbGetEqCalendarAxis(header, &date, &time, &step);
      file.start = dateTimeOf(date, time);
      file.timeStep = static_cast<float>(step);
    }
    const Result<std::optional<float>> land = landValueOf(header.file->definition());
    if (!land) {
      notValid();
    } else if (*land) {
      file.landValue = **land;
    }
    return 0U;
  };
  faults += readContents();
  tsbFileClose(&header);
  tsbHeaderDestroy(&header);
  if (file.landValue < 0) {
    faults += report(messages, PageId::bathymetry, Severity::dependedUpon, texts::landBelowZero);
  }

  if (faults > 0) {
    grid = {};
    noJ = noK = 0;
    dx = dy = 0;
    return faults;
  }
  noJ = file.noJ;
  noK = file.noK;
  dx = file.dx;
  dy = file.dy;
  landValue = file.landValue;
  grid = std::move(file.grid);
  gridFile = fileName.absolute();
  if (!hotStart) return 0;
  enclosingArea = truncated(file.placement(kEnclosingPlace, 0));
  origin = {truncated(file.placement(kOriginJPlace, 0)), truncated(file.placement(kOriginKPlace, 0))};
  if (areaNumber == 1) {
    basic->simulationPeriod->start = file.start;
    basic->simulationPeriod->timeStepInterval = file.timeStep;
  }
  return 0;
}

void CBathymetryObjectKvs::copyWhole(const CBathymetryObjectKvs& other) {
  CopyFrom(other);
  noJ = other.noJ;
  noK = other.noK;
  dx = other.dx;
  dy = other.dy;
  landValue = other.landValue;
  grid = other.grid;
  gridFile = other.gridFile;
}

}  // namespace gridbay
