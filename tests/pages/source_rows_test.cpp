// A row for each source, with a column for each component between the format and the file; the columns are
// laid out anew when a component comes, goes or gets another name.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_source_rows_test {

struct Source {
  std::int32_t format = 0;
  bool isSink = false;
  std::vector<float> constants = std::vector<float>(5);
  UTsbSelection file{1};
};

class SourceGrid final : public ColumnGrid {
 public:
  std::vector<std::string> components{"Salt", "Heat"};
  std::vector<Source> sources{2};

 private:
  int LayoutKey() override { return static_cast<int>(components.size()); }
  std::string CornerHeader() override { return "Source Sink"; }
  std::string RowHeader(GridRow row) override { return std::to_string(row.item) + ": (1,2)->"; }
  void LayOut() override {
    Rows([this] { return static_cast<int>(sources.size()); });
    const auto source = [this](GridRow row) -> Source& {
      return sources[static_cast<std::size_t>(row.item) - 1];
    };
    const auto is = [source](std::int32_t format) {
      return [source, format](GridRow row) { return !source(row).isSink && source(row).format == format; };
    };
    List("Given as", 100, source, &Source::format, Choices::numbered({"Constant", "Type 0"}))
        .EnabledIf([source](GridRow row) { return !source(row).isSink; });
    for (std::size_t c = 0; c < components.size(); ++c) {
      Number(components[c], 80, [source, c](GridRow row) -> float& {
        return source(row).constants[c];
      }).EnabledIf(is(0));
    }
    File({.file = fileOf(source, &Source::file, FileKind{"tsb0", ""}, [](CVdFileSelectorDlg&, GridRow) {}),
          .enabled = is(1)});
  }
};

class SourceRows : public test::ShapeTest {
 protected:
  SourceRows() {
    open([this](test::OwnPage&, Form& form) { form.Grid("Sources", cells); });
  }
  SourceGrid cells;
};

TEST_F(SourceRows, AColumnForEachComponent) {
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "Salt", "Heat", "File Name", "", ""}));
  EXPECT_EQ(store(2, 3, "4"), 1);
  EXPECT_EQ(cells.sources[1].constants[1], 4.0F);
  EXPECT_EQ(usableOf(cells, 1), "xxx...");
  store(1, 1, "Type 0");
  EXPECT_EQ(usableOf(cells, 1), "x..xx.");
  cells.sources[1].isSink = true;
  EXPECT_EQ(usableOf(cells, 2), "......");
  EXPECT_EQ(cells.GetRowHeader(2), "2: (1,2)->");
}

TEST_F(SourceRows, ColumnsFollowTheComponents) {
  cells.components.push_back("Oil");
  EXPECT_EQ(cells.GetColCount(), 7);
  EXPECT_EQ(cells.GetColHeader(4), "Oil");
  cells.components[0] = "Brine";
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(cells.GetColHeader(2), "Brine");
  cells.components.clear();
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Given as", "File Name", "", ""}));
}

}  // namespace pages_source_rows_test
}  // namespace gridbay
