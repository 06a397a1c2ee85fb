#pragma once

#include <string>

#include "core/shared_array.h"
#include "pages/host.h"
#include "platform/units/edit_style.h"
#include "structures/dike.h"

namespace gridbay {

// A value in a file times the factor and plus the offset is the value in the base unit.
struct UnitScale {
  double factor = 1;
  double offset = 0;

  double operator()(double value) const { return value * factor + offset; }
};

// What makes a file's values those of a dike: eastings and northings, and levels.
struct XyzScales {
  UnitScale xy;
  UnitScale z;
};
// From the units of a file, by their codes, to the base units of coordinates and elevations.
XyzScales xyzScales(int xyUnit, int zUnit);

enum class XyzOutcome { success, illegal, stopped };

// Appends the points of a text file: on each line easting, northing and, where there is one, level, and
// behind them any text, which is passed over. The numbers are as those of scanf, whatever the language: also
// "1e3", "0x1p4", "inf" and "nan". A line with fewer than two numbers makes the file an illegal one, and so
// does one whose numbers go on beyond its first LineReader::kLongestLine bytes. A file that can't be opened
// is a success with no points. The points are changed on success alone.
XyzOutcome importXyz(const std::string& path, const XyzScales& scales, SharedArray<DikePoint>& points,
                     const Progress& progress = {});

// The panel of the dialog in which an XYZ file is chosen: what units its numbers have.
class CXyzGeoConvertDlg {
 public:
  // The units that the user sees are the chosen ones.
  explicit CXyzGeoConvertDlg(const UnitChoices& units);

  // Lets the user choose file and units; 1 for OK.
  int DoModal(SetupHost& host);
  const std::string& fileName() const { return fileName_; }
  XyzScales scales() const { return xyzScales(xyUnit_, zUnit_); }

 private:
  std::int32_t xyUnit_;
  std::int32_t zUnit_;
  std::string fileName_;
  Form form_;
};

}  // namespace gridbay
