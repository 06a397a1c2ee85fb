// Two grids with the same rows, a numbered second row of headers, and a header over several columns.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_second_header_test {

struct Weir {
  std::string name = "W";
  std::vector<float> losses = std::vector<float>(3, 0.5F);
};

class WeirGrid final : public ColumnGrid {
 public:
  std::vector<Weir> weirs{2};

 private:
  std::string RowHeader(GridRow row) override { return "No " + std::to_string(row.item); }
  void LayOut() override {
    Rows([this] { return static_cast<int>(weirs.size()); });
    const auto weir = [this](GridRow row) { return &weirs[static_cast<std::size_t>(row.item) - 1]; };
    Text("Name", 90, weir, &Weir::name).SubHeader("1");
    for (std::size_t n = 0; n < 3; ++n) {
      Number(n == 0 ? "Head loss factors" : "", 65, [weir, n](GridRow row) { return &weir(row)->losses[n]; })
          .SubHeader(std::to_string(n + 2))
          .HeaderSpan(n == 0 ? 3 : 1);
    }
  }
};

class SecondHeader : public test::ShapeTest {
 protected:
  SecondHeader() {
    open([this](test::OwnPage&, Form& form) {
      form.Count("Number",
                 {.get = [this] { return static_cast<std::int32_t>(cells.weirs.size()); },
                  .set = [this](std::int32_t n) { cells.weirs.resize(static_cast<std::size_t>(n)); }},
                 1000);
      form.Grid("Weirs", cells);
    });
  }
  WeirGrid cells;
};

TEST_F(SecondHeader, RowsBeginBelowIt) {
  EXPECT_EQ(cells.GetRowCount(), 3);
  EXPECT_EQ(rowOf(cells, 1), (Labels{"1", "2", "3", "4"}));
  EXPECT_TRUE(style(1, 2).isHeader);
  EXPECT_EQ(cells.GetRowHeader(1), "");
  EXPECT_EQ(cells.GetRowHeader(2), "No 1");
  EXPECT_EQ(store(1, 1, "x"), 0);
  EXPECT_EQ(store(3, 3, "0.75"), 1);
  EXPECT_EQ(cells.weirs[1].losses[1], 0.75F);
}

TEST_F(SecondHeader, AHeaderCoversItsColumns) {
  EXPECT_EQ((std::vector{cells.GetHeaderSpan(1), cells.GetHeaderSpan(2), cells.GetHeaderSpan(3),
                         cells.GetHeaderSpan(4)}),
            (std::vector{1, 3, 0, 0}));
}

TEST_F(SecondHeader, ACountOfNoneLeavesTheHeaders) {
  edit("Number", "0");
  EXPECT_EQ(cells.GetRowCount(), 1);
  EXPECT_EQ(cell(1, 1), "1");
  CellStyle none;
  EXPECT_EQ(cells.GetStyleRowCol(2, 1, none), 0);
  EXPECT_EQ(store(2, 1, "x"), 0);
}

}  // namespace pages_second_header_test
}  // namespace gridbay
