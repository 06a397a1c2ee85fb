#pragma once

#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/list_kvs.h"
#include "core/shared_array.h"
#include "structures/texts.h"

namespace gridbay {

// A point of a dike's line: easting, northing and crest level, in metres.
struct DikePoint {
  double x = 0;
  double y = 0;
  double z = 0;
};

// A dike: a line with a crest level that is constant, that of its points, or read from a file of profiles.
// The engine finds the grid cells that the line passes.
class CNhdDikeObjectKvs final : public TableKvs<CNhdDikeObjectKvs> {
 public:
  // How the crest level varies.
  static constexpr std::int32_t kConstant = 1;
  static constexpr std::int32_t kInSpace = 2;
  static constexpr std::int32_t kInSpaceAndTime = 3;

  using TableKvs::TableKvs;

  std::string name;
  std::int32_t include = 1;
  std::string coordinateType = "UTM-32";
  double dischargeCoefficient = 1.838;
  double deltaLevel = 0.01;            // metres
  double crestLevelSpecification = 1;  // one of these, with a fraction where the file has one
  double crestLevel = 0;               // metres
  UFileName crestLevelFile;
  std::int32_t itemNumber = 1;
  SharedArray<DikePoint> points;

  // The number of points, then a section for each. A load finds them by their sections, from 1 until a number
  // has none.
  struct PointsRow {
    std::string_view count;
    Text point;

    void save(const CNhdDikeObjectKvs& dike, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdDikeObjectKvs& dike, KvsSection from, const std::string& documentPath) const;
    void copy(CNhdDikeObjectKvs& dike, const CNhdDikeObjectKvs& other) const { dike.points = other.points; }
    static constexpr auto members() { return std::tuple(&CNhdDikeObjectKvs::points); }
    bool access(CNhdDikeObjectKvs& dike, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    using Self = CNhdDikeObjectKvs;
    return keywords(keyword("name", &Self::name), keyword("include", &Self::include),
                    writtenOnly("formula", [](const Self&) { return kFormula; }),
                    keyword("critical_level_difference", &Self::deltaLevel),
                    keyword("coefficient", &Self::dischargeCoefficient),
                    keyword("specification_of_crest_level", &Self::crestLevelSpecification),
                    keyword("crest_level", &Self::crestLevel),
                    keyword("coordinate_type", &Self::coordinateType),
                    PointsRow{"number_of_points", {"POINT_%d"}},
                    section("CREST_LEVEL_FILE", keyword("file_name", &Self::crestLevelFile),
                            keyword("item_number", &Self::itemNumber)));
  }

  // How the crest level varies, with no fraction; 0 for what is none of the three.
  std::int32_t crest() const;
  void SetNoPoints(int count);
  // What the crest level file must be.
  void RequestCrestLevelFile(CVdFileSelectorDlg& selector);

  unsigned Validate(ValidationList& messages, int deep) override;
  // Memory of the points that another dike, or none, does not share.
  std::size_t bytesBeside(const CNhdDikeObjectKvs* other) const;

 private:
  static constexpr std::int32_t kFormula = 1;
};

class CNhdDikeKvs final : public ListKvs<CNhdDikeKvs, CNhdDikeObjectKvs> {
 public:
  static constexpr bool kChecksItemsAlways = true;

  using ListKvs::ListKvs;

  static constexpr auto table() {
    return section("DIKES", foundCount("number_of_dikes"), foundItems("DIKE_%d"));
  }

  void initialise(CNhdDikeObjectKvs& dike, int number) { dike.name = formatted(texts::dikeName, number); }
};

}  // namespace gridbay
