#pragma once

#include <cstdint>
#include <string>

#include "basic/texts.h"
#include "core/list_kvs.h"

namespace gridbay {

// An open boundary: a straight run of grid points of Area 1.
class CBoundaryObjectKvs final : public TableKvs<CBoundaryObjectKvs> {
 public:
  using TableKvs::TableKvs;

  GridPoint first;
  GridPoint last;

  static constexpr auto table() {
    return keywords(keyword("First_Point", &CBoundaryObjectKvs::first),
                    keyword("Last_Point", &CBoundaryObjectKvs::last));
  }

  void Set(int firstX, int firstY, int lastX, int lastY);
  unsigned Validate(ValidationList& messages, int deep) override;

  // "(0,0) - (0,243)"
  std::string Text() const;
  // The spacing of Area 1 along the boundary (metres); -1 for a diagonal, and without an Area 1.
  float CellSpacing();
};

// The list of open boundaries. The boundary conditions of every module follow its count.
class CBoundaryKvs final : public ListKvs<CBoundaryKvs, CBoundaryObjectKvs> {
 public:
  static constexpr int kMostOnPage = 14;

  using ListKvs::ListKvs;

  std::int32_t defaultPosition = 1;  // 0 user specified, 1 program detected

  static constexpr auto table() {
    return section("OPEN_BOUNDARY", count("Number_Of_Boundaries"),
                   keyword("Default_Position", &CBoundaryKvs::defaultPosition),
                   items("BOUNDARY_%d", texts::boundarySectionMissing));
  }

  bool isUserSpecified() const { return defaultPosition == 0; }
  void SetNoBoundaries(int n) { SetCount(n); }
  // Finds the boundaries along the border of Area 1, whose file it reads. All that was set for the old ones
  // is lost, also when the file cannot be read.
  void RecalculateBoundaries();
};

}  // namespace gridbay
