// A table that is only read.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_read_only_table_test {

class StateGrid final : public ColumnGrid {
  void LayOut() override {
    Rows([] { return 2; });
    const auto grey = [](GridRow, CellStyle& style) { style.isGrey = true; };
    Shown("ID", 40, [](GridRow row) { return std::to_string(row.item); }).Look(grey);
    Shown("Symbol", 60, [](GridRow row) { return row == 1 ? "DO" : "BOD"; }).Look(grey).Tip([](GridRow row) {
      return row == 1 ? "DO = sat - use" : "BOD";
    });
  }
};

class ReadOnlyTable : public test::ShapeTest {
 protected:
  ReadOnlyTable() {
    open([this](test::OwnPage&, Form& form) { form.Grid("State variables", cells); });
  }
  StateGrid cells;
};

TEST_F(ReadOnlyTable, ShowsAndTakesNothing) {
  EXPECT_EQ(rowOf(cells, 2), (Labels{"2", "BOD"}));
  EXPECT_EQ(usableOf(cells, 1), "..");
  EXPECT_TRUE(style(1, 1).readOnly);
  EXPECT_TRUE(style(1, 2).isGrey);
  EXPECT_EQ(style(1, 2).toolTip, "DO = sat - use");
  EXPECT_EQ(store(1, 2, "X"), 0);
  EXPECT_FALSE(document.IsModified());
}

}  // namespace pages_read_only_table_test
}  // namespace gridbay
