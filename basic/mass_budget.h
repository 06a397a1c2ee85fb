#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "basic/texts.h"
#include "core/list_kvs.h"

namespace gridbay {

// A polygon on the grid of an area.
class CMassBudgetItemKvs final : public TableKvs<CMassBudgetItemKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t associatedArea = 1;  // from 1
  std::vector<GridPoint> corners;

  // The number of corners, then each as a numbered keyword. A load takes only those that the file gives.
  struct CornersRow {
    std::string_view count;
    Text corner;

    void save(const CMassBudgetItemKvs& polygon, KvsFile& file, const std::string& documentPath) const;
    void load(CMassBudgetItemKvs& polygon, KvsSection from, const std::string& documentPath) const;
    void copy(CMassBudgetItemKvs& polygon, const CMassBudgetItemKvs& other) const {
      polygon.corners = other.corners;
    }
    static constexpr auto members() { return std::tuple(&CMassBudgetItemKvs::corners); }
    bool access(CMassBudgetItemKvs& polygon, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    return keywords(keyword("AssociatedArea", &CMassBudgetItemKvs::associatedArea),
                    CornersRow{"NoOfCornerPoints", {"CornerPoint_%d"}});
  }

  unsigned Validate(ValidationList& messages, int deep) override;
};

class CMassBudgetKvs final : public ListKvs<CMassBudgetKvs, CMassBudgetItemKvs> {
 public:
  static constexpr int kMostOnPage = 300;

  using ListKvs::ListKvs;

  static constexpr auto table() {
    return section("MASS_BUDGET", pinnedCount("NoOfPolygons", 0), flowModelOnly(items("POLYGON_%d")));
  }

  // A new polygon goes once around the inside of Area 1.
  void initialise(CMassBudgetItemKvs& polygon, int number);

  void SetNoPolygons(int n) { SetCount(n); }
  // The highest corner count of any polygon.
  int GetMaxCorners() const;
};

}  // namespace gridbay
