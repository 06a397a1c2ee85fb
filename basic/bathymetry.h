#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "basic/texts.h"
#include "core/array2d.h"
#include "core/file_name.h"
#include "core/file_selector.h"
#include "core/list_kvs.h"

namespace gridbay {

// One area: a grid file, and where it lies in the area that encloses it. The file alone gives the dimensions,
// the spacing and the land value; before it has been read they are 0 and the grid is empty.
class CBathymetryObjectKvs final : public TableKvs<CBathymetryObjectKvs> {
 public:
  static constexpr bool kReadsOtherFiles = true;

  using TableKvs::TableKvs;

  GridPoint origin{3, 3};          // the point of the enclosing grid that holds this area's first point
  std::int32_t enclosingArea = 0;  // from 1; 0 for Area 1
  std::int32_t noJ = 0;            // grid points along x
  std::int32_t noK = 0;            // and along y
  float dx = 0;                    // metres
  float dy = 0;
  float landValue = 0;     // a point at or above it is land
  CVdArray2D<float> grid;  // elevations in metres, upwards: a depth is minus the value
  UFileName fileName;
  std::string gridFile;  // that the grid was read from, as an absolute name

  static constexpr auto table() {
    using Self = CBathymetryObjectKvs;
    return keywords(section("DATA_FILE", keyword("FILE_NAME", &Self::fileName)),
                    keyword("Origin", &Self::origin), keyword("Enclosing_Area", &Self::enclosingArea),
                    fromOtherFiles(&Self::noJ, &Self::noK, &Self::dx, &Self::dy, &Self::landValue,
                                   &Self::grid, &Self::gridFile));
  }

  // Reads the area's file into the object; areaNumber from 1. Returns the number of errors, with a message
  // for each; then the grid is empty and its dimensions are 0. A hot start file also sets where the area lies
  // and, for area 1, start and time step of the simulation.
  unsigned ReadGrid(ValidationList& messages, int areaNumber);
  // Origin, enclosing area and file name, and what was read from the file.
  void copyWhole(const CBathymetryObjectKvs& other);

  bool isLand(int j, int k) const { return grid(j, k) >= landValue; }
  // Whether the grid is that of the file which is named now.
  bool isRead() const { return noJ > 0 && gridFile == fileName.absolute(); }
  // False for every point of a grid that has not been read.
  bool contains(int j, int k) const { return grid.contains(j, k); }
};

// The list of areas, Area 1 outermost. Everything with a value per area follows its count.
class CBathymetryKvs final : public ListKvs<CBathymetryKvs, CBathymetryObjectKvs> {
 public:
  static constexpr int kMostAreas = 9;

  using ListKvs::ListKvs;

  std::int32_t hotStart = 0;  // 1: the area files are hot start files
  bool coriolis = false;
  bool landSlides = false;
  std::string projection;
  UFileName overlandFile;
  bool overlandSolver = false;
  bool projectionStale = false;  // Area 1's file was picked anew: the next GetProjection asks the file

  // A file of before the overland solver has neither of its keywords.
  struct OverlandFileRow {
    void save(const CBathymetryKvs& areas, KvsFile& file, const std::string& documentPath) const;
    void load(CBathymetryKvs& areas, KvsSection from, const std::string& documentPath) const;
    void copy(CBathymetryKvs&, const CBathymetryKvs&) const {}
    static constexpr std::string_view name = "Overland_Filename";
    void set(CBathymetryKvs& areas, KvsSection from, const std::string& documentPath) const;
    static constexpr auto members() { return std::tuple(&CBathymetryKvs::overlandFile); }
  };

  static constexpr auto table() {
    return section("BATHYMETRY_SELECTION", notCopied(keyword("Projection", &CBathymetryKvs::projection)),
                   notCopied(pinned(keyword("CoriolisForce", &CBathymetryKvs::coriolis), false)),
                   notCopied(pinned(keyword("Land_Slides", &CBathymetryKvs::landSlides), false)),
                   notCopied(keyword("Overland_Solver", &CBathymetryKvs::overlandSolver)), OverlandFileRow{},
                   pinnedCount("No_Of_Areas", 1), keyword("Hot_Start", &CBathymetryKvs::hotStart),
                   items("AREA_%d", texts::bathymetrySectionMissing),
                   fromOtherFiles(&CBathymetryKvs::projectionStale));
  }

  void initialise(CBathymetryObjectKvs& area, int number) { area.enclosingArea = number - 1; }

  unsigned Validate(ValidationList& messages, int deep) override;

  // Area n from 1, or null.
  CBathymetryObjectKvs* GetArea(int n) { return GetItem(n); }
  void SetNoAreas(int n) { SetCount(n); }

  // Whether the point lies inside an area embedded in the area `enclosingNumber`.
  bool IsCoveredByEmbeddedArea(int enclosingNumber, int j, int k) const;
  // The greatest Courant number, timeStep x sqrt(g x depth) / dx, and the area it is in; both 0 where no grid
  // has been read. Time step in seconds.
  void GetMaxCourant(double timeStep, double* maxCourant, int* areaNumber) const;
  // The projection that holds, from Area 1's file where it is stale or missing, and the Coriolis flag.
  // Returns 1 when Area 1's file has a place on a map; else the projection becomes that of local coordinates.
  int GetProjection(std::string* text, int* flag);
  // The projection of Area 1's file and the place of its first point (metres). Returns 1 when it has one.
  int GetGeoReference(std::string* projectionName, double* easting, double* northing) const;
  // Area 1 has another file: the projection that this gives a place by counts from now on.
  void OnArea1FileChanged();
  // Area 1 as its file has it, beside the model, which a look does not change; null when it can't be read.
  std::unique_ptr<CBathymetryObjectKvs> ReadArea1Aside();
  // The numbers of the areas whose grids have not been read.
  std::vector<int> UnreadAreas() const;
  // Megabytes of `factor` 4-byte values for each point of all areas.
  double EstimateSizeMB(double factor) const;
};

// Requires of a map that it fits an area. The request is a CVdRqTsbItem or a CVdFileSelectorDlg. Of an area
// whose grid has not been read only the number of dimensions is known.
void RequestMatchesArea(const CBathymetryObjectKvs& area, auto& request) {
  request.SetDimensions(2);
  if (area.noJ == 0) return;
  request.SetNoPoints(1, area.noJ);
  request.SetInterval(1, area.dx);
  request.SetNoPoints(2, area.noK);
  request.SetInterval(2, area.dy);
}

}  // namespace gridbay
