// A list of formats, the file that goes with two of them, and a column of constants that goes with the third.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_format_list_test {

struct Rain {
  std::int32_t format = -1;
  UTsbSelection file{1};
  std::vector<float> constants{1, 2};
};

class ConstantGrid final : public ColumnGrid {
 public:
  explicit ConstantGrid(Rain& rain) : rain_(rain) {}

 private:
  int RowHeaderWidth() override { return 140; }
  std::string RowHeader(GridRow row) override { return row == 1 ? "Salt" : "Heat"; }
  void LayOut() override {
    Rows([this] { return rain_.format == -1 ? static_cast<int>(rain_.constants.size()) : 0; });
    Number("Value", 120,
           [this](GridRow row) -> float& { return rain_.constants[static_cast<std::size_t>(row.item) - 1]; });
  }
  Rain& rain_;
};

class FormatList : public test::ShapeTest {
 protected:
  FormatList() {
    open([this](test::OwnPage& own, Form& form) {
      const auto it = [this]() -> Rain& { return rain; };
      form.List("Given as:", Choices{{-1, "Constant"}, {0, "Time series"}, {2, "Grid series"}}, it,
                &Rain::format);
      own.AddFile(form, "Data File:",
                  fileOf([this](GridRow) { return &rain; }, &Rain::file,
                         [this](GridRow) {
                           return rain.format == 2 ? FileKind{"tsb2", "Grid Series (*.tsb2)|*.tsb2||"}
                                                   : FileKind{"tsb0", "Time Series (*.tsb0)|*.tsb0||"};
                         },
                         [](CVdFileSelectorDlg&, GridRow) {}))
          .EnabledIf([this] { return rain.format != -1; });
      form.Grid("Constants", constants);
    });
  }
  Rain rain;
  ConstantGrid constants{rain};
};

TEST_F(FormatList, TheFormatDecides) {
  EXPECT_EQ(constants.GetRowCount(), 2);
  EXPECT_FALSE(control("Data File:").enabled);
  EXPECT_FALSE(control("...").enabled);
  EXPECT_EQ(store(2, 1, "5"), 1);
  EXPECT_EQ(rain.constants[1], 5.0F);
  choose("Given as:", 2);
  EXPECT_EQ(rain.format, 2);
  EXPECT_EQ(constants.GetRowCount(), 0);
  EXPECT_TRUE(control("Data File:").enabled);
  EXPECT_FALSE(control("View...").enabled);
  press("...");
  choose("Given as:", 1);
  press("...");
  EXPECT_EQ(host.filters, (Labels{"Grid Series (*.tsb2)|*.tsb2||", "Time Series (*.tsb0)|*.tsb0||"}));
  choose("Given as:", 0);
  EXPECT_EQ(textIn(constants, 2, 1), "5.000000");
}

}  // namespace pages_format_list_test
}  // namespace gridbay
