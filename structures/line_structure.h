#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "core/keyword_rows.h"
#include "core/list_kvs.h"

// What weirs and culverts have in common.

namespace gridbay {

// A named polyline in map coordinates, with a table of levels and widths. It has no place on the grid here:
// the engine finds that. Values in base units.
struct LineStructure {
  static constexpr int kMost = 1000;          // structures in a list
  static constexpr int kMostPoints = 1000;    // of one polyline, on the page
  static constexpr int kMostMeasures = 1000;  // of one table, on the page

  std::string name;
  std::string coordinateType;  // the projection of the points, as a full text
  std::int32_t valve = 0;      // 0 none, 1 only negative flow, 2 only positive flow, 3 no flow
  double alphaZero = 0.01;     // smallest difference of levels with a flow of its own (m)
  double horizontalOffset = 0;
  std::vector<double> x;  // metres in the projection
  std::vector<double> y;
  std::vector<float> level;
  std::vector<float> width;
};

// The name, with three constants of the format around it. A path leads to the name alone.
struct LocationRow {
  std::string_view name;

  void save(const LineStructure& structure, KvsFile& file, const std::string& documentPath) const;
  void load(LineStructure& structure, KvsSection from, const std::string& documentPath) const;
  void copy(LineStructure& structure, const LineStructure& other) const { structure.name = other.name; }
  static constexpr auto members() { return std::tuple(&LineStructure::name); }
  bool access(LineStructure& structure, std::string_view path, PathAccess& access) const;
};

// The number of points, then all x and all y. A load takes as many of either as the number says and as there
// are; by its path the number gives points at (0, 0) or takes points from the tail.
struct PointsRow {
  std::string_view count;
  std::string_view xName;
  std::string_view yName;

  void save(const LineStructure& structure, KvsFile& file, const std::string& documentPath) const;
  void load(LineStructure& structure, KvsSection from, const std::string& documentPath) const;
  void copy(LineStructure& structure, const LineStructure& other) const;
  static constexpr auto members() { return std::tuple(&LineStructure::x, &LineStructure::y); }
  bool access(LineStructure& structure, std::string_view path, PathAccess& access) const;
};

// The table of levels and widths: a section with one keyword "Data" for each pair.
struct LevelWidthRow {
  std::string_view sectionName;

  void save(const LineStructure& structure, KvsFile& file, const std::string& documentPath) const;
  void load(LineStructure& structure, KvsSection from, const std::string& documentPath) const;
  void copy(LineStructure& structure, const LineStructure& other) const;
  static constexpr auto members() { return std::tuple(&LineStructure::level, &LineStructure::width); }
  bool access(LineStructure& structure, std::string_view path, PathAccess& access) const;
};

inline constexpr std::string_view kCoordinateType = "coordinate_type";

// The rows that begin the table of each structure, with the rows that follow them.
template <class... Rows>
constexpr auto lineStructureTable(Rows... rows) {
  return keywords(LocationRow{"Location"}, keyword("delhs", &LineStructure::alphaZero),
                  keyword(kCoordinateType, &LineStructure::coordinateType),
                  PointsRow{"number_of_points", "x", "y"},
                  keyword("HorizOffset", &LineStructure::horizontalOffset), rows...);
}

// The full text of the projection in which a new structure stands: that of the model, which asks the file of
// Area 1 where it has none; UTM-32 where there is none at all.
std::string projectionOfNewStructure(CKvsBase& object);

// A list of structures. They are not checked.
template <class Derived, class Item>
class LineStructureList : public ListKvs<Derived, Item> {
 public:
  using ListKvs<Derived, Item>::ListKvs;

  // New structures have the projection of the model, which is asked for once.
  void SetCount(int count) {
    const int before = this->GetCount();
    ListKvs<Derived, Item>::SetCount(count);
    if (count <= before) return;
    const std::string projection = projectionOfNewStructure(*this);
    for (int number = before + 1; number <= count; ++number)
      this->GetItem(number)->coordinateType = projection;
  }

  // The list is what the file has, also where it has no section of it.
  void Load(KvsSection section, const std::string& documentPath) override {
    this->itemList().SetCount(0);
    ListKvs<Derived, Item>::Load(section, documentPath);
    newProjection_.reset();
  }

  // The model is asked only for a structure whose projection the file lacks.
  void completeLoaded(Item& item, KvsSection section) {
    if (section != nullptr && kvsKeywordByNameNum(section, kCoordinateType, 1) != nullptr) return;
    if (!newProjection_) newProjection_ = projectionOfNewStructure(*this);
    item.coordinateType = *newProjection_;
  }

 private:
  std::optional<std::string> newProjection_;  // while a file is loaded
};

}  // namespace gridbay
