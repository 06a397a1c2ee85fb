#include "basic/bathymetry.h"

#include <cmath>
#include <optional>
#include <string>
#include <vector>

#include "basic/grid_file.h"
#include "basic/nesting.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/utm_zone.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

constexpr double kGravity = 9.82;
constexpr int kLocalCoordinates = 1;

// Where Area 1's file says that it lies; nothing when it cannot be read or has no place on a map.
std::optional<TsbGeography> geographyOf(const CBathymetryObjectKvs* area) {
  TsbHeader header;
  if (area == nullptr || tsbFileRead(area->fileName.absolute(), &header) != 0) return std::nullopt;
  TsbGeography place;
  const int status =
      tsbGetGeoInfoUTMProj(header, &place.projection, &place.longitude, &place.latitude, &place.rotation);
  const bool found = status == 0 && tsbGetGeoInfoType(header) == 1;
  tsbFileClose(&header);
  return found ? std::optional(place) : std::nullopt;
}

}  // namespace

std::string completeProjection(const TsbGeography& place) {
  return withUtmZone(place.projection, place.longitude);
}

void CBathymetryKvs::OverlandFileRow::save(const CBathymetryKvs& areas, KvsFile& file,
                                           const std::string& documentPath) const {
  areas.overlandFile.Save(file, documentPath, name);
}

void CBathymetryKvs::OverlandFileRow::load(CBathymetryKvs& areas, KvsSection from,
                                           const std::string& documentPath) const {
  if (kvsKeywordByNameNum(from, "Overland_Solver", 1) != nullptr) set(areas, from, documentPath);
}

void CBathymetryKvs::OverlandFileRow::set(CBathymetryKvs& areas, KvsSection from,
                                          const std::string& documentPath) const {
  areas.overlandFile.Load(from, documentPath, name);
}

unsigned CBathymetryKvs::Validate(ValidationList& messages, int deep) {
  unsigned faults = 0;
  if (deep != 0) {
    std::vector<std::string> files;
    for (int number = 1; number <= GetCount(); ++number)
      files.push_back(GetArea(number)->fileName.absolute());
    TsbFile::lookAhead(files);
    for (int number = 1; number <= GetCount(); ++number)
      faults += checkedEntry(messages, {number, GetCount()},
                             [&] { return GetArea(number)->ReadGrid(messages, number); });
  }
  if (faults > 0) return faults;

  if (GetCount() < 1 || GetCount() > kMostAreas) {
    faults += report(messages, PageId::bathymetry, Severity::dependedUpon, texts::bathymetryCount);
  }
  for (int number = 2; number <= GetCount(); ++number) {
    const CBathymetryObjectKvs& area = *GetArea(number);
    const CBathymetryObjectKvs* outer = GetArea(area.enclosingArea);
    faults += checkedEntry(messages, {number, GetCount()}, [&] {
      if (outer == nullptr || outer == &area)
        return report(messages, PageId::bathymetry, Severity::dependedUpon, texts::outerNotValid);
      return deep != 0 ? CheckNesting(area, *outer, messages) : 0U;
    });
  }
  for (int a = 1; a <= GetCount(); ++a) {
    for (int b = a + 1; b <= GetCount(); ++b) {
      checkedEntry(messages, {b, GetCount()}, [&] {
        CheckOverlap(*GetArea(a), *GetArea(b), messages);
        return 0U;
      });
    }
  }
  return faults;
}

bool CBathymetryKvs::IsCoveredByEmbeddedArea(int enclosingNumber, int j, int k) const {
  const auto within = [](int point, int origin, int count) {
    return point >= origin && point <= std::int64_t{origin} + count / 3;
  };
  for (int number = 2; number <= GetCount(); ++number) {
    const CBathymetryObjectKvs& area = *GetItem(number);
    if (area.enclosingArea == enclosingNumber && within(j, area.origin.j, area.noJ) &&
        within(k, area.origin.k, area.noK)) {
      return true;
    }
  }
  return false;
}

void CBathymetryKvs::GetMaxCourant(double timeStep, double* maxCourant, int* areaNumber) const {
  *maxCourant = 0;
  *areaNumber = 0;
  for (int number = 1; number <= GetCount(); ++number) {
    const CBathymetryObjectKvs& area = *GetItem(number);
    float deepest = 0;  // as an elevation
    for (int k = area.grid.firstK(); k < area.grid.endK(); ++k) {
      const std::span<const float> row = area.grid.row(k);
      for (std::size_t j = 0; j < row.size(); ++j) {
        if (row[j] < deepest && !IsCoveredByEmbeddedArea(number, static_cast<int>(j), k)) deepest = row[j];
      }
    }
    if (!(deepest < 0)) continue;
    const double dx = area.dx;
    const double courant = timeStep * std::sqrt(-double{deepest} * kGravity / (dx * dx));
    if (courant > *maxCourant) {
      *maxCourant = courant;
      *areaNumber = number;
    }
  }
}

int CBathymetryKvs::GetProjection(std::string* text, int* flag) {
  const std::optional<TsbGeography> place = geographyOf(GetArea(1));
  if (!place) {
    projection = CVdMapProjection::IDtoProjectionString(kLocalCoordinates);
  } else if (projectionStale || projection.empty()) {
    projectionStale = false;
    projection = completeProjection(*place);
    coriolis = true;
  }
  *text = projection;
  *flag = coriolis ? 1 : 0;
  return place ? 1 : 0;
}

int CBathymetryKvs::GetGeoReference(std::string* projectionName, double* easting, double* northing) const {
  const std::optional<TsbGeography> place = geographyOf(GetItem(1));
  if (!place) return 0;
  *projectionName = completeProjection(*place);
  CVdMapProjection(*projectionName).Geo2Proj(place->longitude, place->latitude, easting, northing);
  return 1;
}

void CBathymetryKvs::OnArea1FileChanged() {
  std::string name;
  double easting = 0;
  double northing = 0;
  if (GetGeoReference(&name, &easting, &northing) == 1) projectionStale = true;
}

std::unique_ptr<CBathymetryObjectKvs> CBathymetryKvs::ReadArea1Aside() {
  constexpr int kNotArea1 = 0;  // so that the simulation period is left alone
  const CBathymetryObjectKvs* area = GetArea(1);
  if (area == nullptr) return nullptr;
  auto aside = std::make_unique<CBathymetryObjectKvs>(this);
  aside->CopyFrom(*area);
  ValidationList dropped;
  return aside->ReadGrid(dropped, kNotArea1) == 0 ? std::move(aside) : nullptr;
}

std::vector<int> CBathymetryKvs::UnreadAreas() const {
  std::vector<int> unread;
  for (int number = 1; number <= GetCount(); ++number) {
    if (!GetItem(number)->contains(0, 0)) unread.push_back(number);
  }
  return unread;
}

double CBathymetryKvs::EstimateSizeMB(double factor) const {
  constexpr double kBytes = 4;
  constexpr double kMegabyte = 1024.0 * 1024.0;
  double points = 0;
  for (int number = 1; number <= GetCount(); ++number) {
    const CVdArray2D<float>& grid = GetItem(number)->grid;
    points += (double{static_cast<double>(grid.endJ())} - grid.firstJ() + 1) *
              (double{static_cast<double>(grid.endK())} - grid.firstK() + 1);
  }
  return points * factor * kBytes / kMegabyte;
}

}  // namespace gridbay
