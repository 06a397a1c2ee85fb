// Cells of the kinds that the other shapes have none of, and what becomes of a text.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_cells_test {

struct Dike {
  std::string name = "Dike 1";
  bool include = true;
  std::string projection = "UTM-33";
  std::int32_t number = 1;
  GridPoint point;
  UResultFileName file;
};

class DikeGrid final : public ColumnGrid {
 public:
  Dike dike;
  Dike* held = &dike;
  int follows = 0;

 private:
  void LayOut() override {
    Rows([] { return 1; });
    const auto it = [this](GridRow) { return held; };
    Text("Name", 90, it, &Dike::name).Then([this](GridRow) { ++follows; });
    Check("Include", 60, it, &Dike::include);
    Projection("Projection", 100, it, &Dike::projection);
    Integer("No", 60, it, &Dike::number);
    PlainInteger("Area", 60, it, &Dike::number).Static();
    Point("Point", 60, it, &Dike::point).Tip([](GridRow) { return "J and K"; });
    ResultFile("File", 60, resultFileOf(it, &Dike::file, FileKind{"tsb2", "Maps (*.tsb2)|*.tsb2||"}));
    Add({.header = "Halves", .set = [this](GridRow, std::string_view text) {
           dike.number = 50;
           return text == "all" ? Stored::taken : Stored::partly;
         }});
    Integer("By row", 60, it, &Dike::number).Look([this](GridRow, CellStyle& style) {
      style.kind = dike.include ? CellKind::plain : CellKind::label;
    });
  }
};

class CellKinds : public test::ShapeTest {
 protected:
  CellKinds() {
    open([this](test::OwnPage&, Form& form) { form.Grid("Dikes", cells); });
  }
  DikeGrid cells;
};

TEST_F(CellKinds, EachShowsAndTakesItsValue) {
  EXPECT_EQ(rowOf(cells, 1), (Labels{"Dike 1", "1", "UTM-33", "1", "1", "(0,0)", "", "", "1"}));
  EXPECT_EQ(store(1, 1, " \f North\v\r\n"), 1);
  EXPECT_EQ(cells.dike.name, "North");
  EXPECT_EQ(cells.follows, 1);
  EXPECT_EQ(style(1, 2).kind, CellKind::checkBox);
  EXPECT_EQ(store(1, 2, "0"), 1);
  EXPECT_FALSE(cells.dike.include);
  EXPECT_EQ(store(1, 2, "yes"), 0);
  EXPECT_EQ(style(1, 9).kind, CellKind::label);
  EXPECT_EQ(store(1, 4, "12x"), 1);
  EXPECT_EQ(cells.dike.number, 12);
  EXPECT_EQ(store(1, 4, "x"), 0);
  EXPECT_TRUE(style(1, 5).isGrey);
  EXPECT_FALSE(style(1, 5).editable());
  EXPECT_EQ(store(1, 6, "3,4x"), 1);
  EXPECT_EQ(store(1, 6, "3;4"), 0);
  EXPECT_EQ(cell(1, 6), "(3,4)");
  EXPECT_EQ(style(1, 6).toolTip, "J and K");
}

TEST_F(CellKinds, AProjectionIsPickedFromItsList) {
  EXPECT_FALSE(cells.OnStartEditing(1, 3).empty());
  cells.OnModifyCell("UTM-40");
  EXPECT_EQ(cells.OnEndEditing(1, 3), 1);
  EXPECT_EQ(cells.dike.projection, "UTM-40");
}

TEST_F(CellKinds, ATextMayBeRefusedWithAPartOfItStored) {
  document.SetModifiedFlag(false);
  EXPECT_EQ(store(1, 8, "half"), 0);
  EXPECT_EQ(cells.dike.number, 50);
  EXPECT_TRUE(document.IsModified());
  document.SetModifiedFlag(false);
  EXPECT_EQ(store(1, 4, "x"), 0);
  EXPECT_FALSE(document.IsModified());
  EXPECT_EQ(store(1, 8, "all"), 1);
}

TEST_F(CellKinds, CellsOfNoObjectAreBlankAndTakeNothing) {
  cells.held = nullptr;
  EXPECT_EQ((Labels{cell(1, 1), cell(1, 2), cell(1, 3), cell(1, 4), cell(1, 6), cell(1, 7)}),
            (Labels{"", "0", "", "", "", ""}));
  EXPECT_EQ(usableOf(cells, 1).substr(0, 7), ".......");
  for (int col = 1; col <= 7; ++col) EXPECT_EQ(store(1, col, "1"), 0) << col;
}

}  // namespace pages_cells_test
}  // namespace gridbay
