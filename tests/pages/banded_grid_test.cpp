// A title row for each component, and below it a row for each area, as many as the component has at present.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_banded_grid_test {

struct Value {
  std::int32_t format = 0;  // 0 constant, 1 map
  float value = 0;
  UTsbSelection map{1};
};
struct Component {
  std::string name;
  std::vector<Value> areas;
};
using Components = std::vector<Component>;

class InitialGrid final : public BandedGrid {
 public:
  explicit InitialGrid(Components& components) : components_(components) {}

 private:
  int BandSize(int item) override {
    return static_cast<int>(components_[static_cast<std::size_t>(item) - 1].areas.size());
  }
  std::string BandTitle(int item) override {
    return "Component no. " + std::to_string(item) + " : " +
           components_[static_cast<std::size_t>(item) - 1].name;
  }
  std::string CornerHeader() override { return "Area"; }
  int RowHeaderWidth() override { return 50; }

  void LayOut() override {
    Rows([this] { return static_cast<int>(components_.size()); });
    const auto value = [this](GridRow row) -> Value& {
      return components_[static_cast<std::size_t>(row.item) - 1].areas[static_cast<std::size_t>(row.sub) - 1];
    };
    const auto isConstant = [value](GridRow row) { return value(row).format == 0; };
    const auto isMap = [value](GridRow row) { return value(row).format == 1; };
    List("Type", 100, value, &Value::format, Choices::numbered({"Constant", "Type 2 data file"}));
    Number("Value", 60, value, &Value::value).EnabledIf(isConstant);
    File({.file = fileOf(value, &Value::map, FileKind{"tsb2", "Map (*.tsb2)|*.tsb2||"},
                         [](CVdFileSelectorDlg&, GridRow) {}),
          .enabled = isMap});
  }
  Components& components_;
};

class BandedPage : public test::ShapeTest {
 protected:
  BandedPage() {
    open([this](test::OwnPage&, Form& form) { form.Grid("Initial concentrations", cells); });
  }
  Components components{{"Salt", std::vector<Value>(2)}, {"Heat", std::vector<Value>(1)}};
  InitialGrid cells{components};
};

TEST_F(BandedPage, ATitleAndARowForEachArea) {
  EXPECT_EQ(cells.GetRowCount(), 5);
  EXPECT_EQ(headers(), (Labels{"Area", "Type", "Value", "File Name", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{50, 100, 60, 210, 30, 45}));
  EXPECT_EQ(cell(1, 1), "Component no. 1 : Salt");
  EXPECT_TRUE(style(1, 1).isHeading);
  EXPECT_EQ(style(1, 1).span, 5);
  EXPECT_EQ(cell(1, 2), "");
  EXPECT_EQ(cell(4, 1), "Component no. 2 : Heat");
  EXPECT_EQ(
      (Labels{cells.GetRowHeader(1), cells.GetRowHeader(2), cells.GetRowHeader(3), cells.GetRowHeader(5)}),
      (Labels{"", "1", "2", "1"}));
  EXPECT_TRUE(cells.GetRowLook(3).lineBelow);
  EXPECT_FALSE(cells.GetRowLook(2).lineBelow);
}

TEST_F(BandedPage, ACellIsThatOfItsComponentAndArea) {
  EXPECT_EQ(store(3, 2, "2.5"), 1);
  EXPECT_EQ(components[0].areas[1].value, 2.5F);
  EXPECT_EQ(cell(3, 2), "2.500000");
  EXPECT_EQ(store(4, 1, "Constant"), 0);
  EXPECT_EQ(usableOf(cells, 5), "xx...");
  EXPECT_EQ(store(5, 1, "Type 2 data file"), 1);
  EXPECT_EQ(usableOf(cells, 5), "x.xx.");
  EXPECT_EQ(store(5, 2, "1"), 0);
  EXPECT_EQ(document.UndoStep(), nullptr);  // the object is no part of the model
}

TEST_F(BandedPage, BandsGrowAndShrink) {
  components[0].areas.clear();
  EXPECT_EQ(cells.GetRowCount(), 3);
  EXPECT_EQ(cell(2, 1), "Component no. 2 : Heat");
  components.clear();
  EXPECT_EQ(cells.GetRowCount(), 0);
  CellStyle none;
  EXPECT_EQ(cells.GetStyleRowCol(1, 1, none), 0);
  EXPECT_EQ(store(1, 1, "Constant"), 0);
}

}  // namespace pages_banded_grid_test
}  // namespace gridbay
