// A row for each boundary above, and below a matrix of components by boundaries, whose columns follow their
// count.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_boundary_pair_test {

struct Boundary {
  std::int32_t format = 0;
  UTsbSelection file{1};
  std::vector<float> constants = {1, 2};
};
using Boundaries = std::vector<Boundary>;

Boundary& nth(Boundaries& boundaries, int n) {
  return boundaries[static_cast<std::size_t>(n) - 1];
}

class UpperGrid final : public ColumnGrid {
 public:
  explicit UpperGrid(Boundaries& boundaries) : boundaries_(boundaries) {}

 private:
  std::string CornerHeader() override { return "Boundary"; }
  void LayOut() override {
    Rows([this] { return static_cast<int>(boundaries_.size()); });
    const auto boundary = [this](GridRow row) -> Boundary& { return nth(boundaries_, row.item); };
    const auto kind = [boundary](GridRow row) {
      return boundary(row).format == 2 ? FileKind{"tsb1", "Profile (*.tsb1)|*.tsb1||"}
                                       : FileKind{"tsb0", "Time series (*.tsb0)|*.tsb0||"};
    };
    List("Given as", 90, boundary, &Boundary::format, Choices::numbered({"Constant", "Type 0", "Type 1"}));
    File({.file = fileOf(boundary, &Boundary::file, kind,
                         [](CVdFileSelectorDlg& selector, GridRow row) { selector.SetNoItems(row.item); }),
          .enabled = [boundary](GridRow row) { return boundary(row).format != 0; }});
  }
  Boundaries& boundaries_;
};

class LowerGrid final : public ColumnGrid {
 public:
  explicit LowerGrid(Boundaries& boundaries) : boundaries_(boundaries) {}

 private:
  int LayoutKey() override { return static_cast<int>(boundaries_.size()); }
  std::string RowHeader(GridRow row) override { return row == 1 ? "Salt" : "Heat"; }
  void LayOut() override {
    Rows([this] { return boundaries_.empty() ? 0 : 2; });
    for (int n = 1; n <= LayoutKey(); ++n) {
      const auto constant = [this, n](GridRow row) -> float& {
        return nth(boundaries_, n).constants[static_cast<std::size_t>(row.item) - 1];
      };
      Number("Boundary " + std::to_string(n), 90, constant).EnabledIf([this, n](GridRow) {
        return nth(boundaries_, n).format == 0;
      });
    }
  }
  Boundaries& boundaries_;
};

class BoundaryPair : public test::ShapeTest {
 protected:
  BoundaryPair() {
    open([this](test::OwnPage&, Form& form) {
      form.Grid("Boundaries", upper);
      form.Grid("Constants", lower);
    });
  }
  Boundaries boundaries{2};
  UpperGrid upper{boundaries};
  LowerGrid lower{boundaries};
};

TEST_F(BoundaryPair, TheLowerGridHasAColumnForEachBoundary) {
  EXPECT_EQ(lower.GetColCount(), 2);
  EXPECT_EQ(lower.GetColHeader(2), "Boundary 2");
  EXPECT_EQ(rowOf(lower, 2), (Labels{"2.000000", "2.000000"}));
  EXPECT_EQ(lower.StoreStyleRowCol(2, 1, "7"), 1);
  EXPECT_EQ(boundaries[0].constants[1], 7.0F);
  boundaries.resize(3);
  EXPECT_EQ(lower.GetColCount(), 3);
  EXPECT_EQ(rowOf(lower, 1), (Labels{"1.000000", "1.000000", "1.000000"}));
  boundaries.clear();
  EXPECT_EQ(lower.GetColCount(), 0);
  EXPECT_EQ(lower.GetRowCount(), 0);
}

TEST_F(BoundaryPair, AFormatAboveDecidesBelow) {
  EXPECT_EQ(usableOf(lower, 1), "xx");
  EXPECT_EQ(upper.StoreStyleRowCol(2, 1, "Type 1"), 1);
  EXPECT_EQ(usableOf(lower, 1), "x.");
  EXPECT_EQ(lower.StoreStyleRowCol(1, 2, "7"), 0);
  EXPECT_EQ(usableOf(upper, 2), "xxx.");
  upper.OnClickedButtonRowCol(2, 3);
  EXPECT_EQ(host.filters, Labels{"Profile (*.tsb1)|*.tsb1||"});
}

}  // namespace pages_boundary_pair_test
}  // namespace gridbay
