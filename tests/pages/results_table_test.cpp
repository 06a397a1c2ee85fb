// Outputs: ranges, a file to be written whose kind follows the extent, a choice of several items.

#include <gmock/gmock.h>

#include "pages/result_subset.h"
#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_results_table_test {

struct Output {
  std::int32_t type = 2;
  USubLine j{0, 100, 1};
  USubLine time{0, 10, 2};
  UResultFileName file;
  std::string title;
  std::int64_t items = 1;
};

class ResultGrid final : public ColumnGrid {
 public:
  std::vector<Output> outputs{1};

 private:
  void LayOut() override {
    Rows([this] { return static_cast<int>(outputs.size()); });
    const auto output = [this](GridRow row) { return &outputs[static_cast<std::size_t>(row.item) - 1]; };
    const auto kind = [output](GridRow row) {
      return output(row)->type == 2 ? FileKind{"tsb2", "Maps (*.tsb2)|*.tsb2||"}
                                    : FileKind{"tsb0", "Time series (*.tsb0)|*.tsb0||"};
    };
    List("Type", 45, output, &Output::type, Choices::numbered({"0", "1", "2"}));
    Range("J", 60, [output](GridRow row) { return &output(row)->j; });
    Range(
        "Period", 60, [output](GridRow row) { return &output(row)->time; }, false);
    Button("...", 20, [this, output](GridRow row) {
      USubArea area{output(row)->j, {}};
      CV27SetupResultSubsetDialog dialog(CV27SetupResultSubsetDialog::rangeOf(area, output(row)->time), 120,
                                         90, 999);
      if (dialog.DoModal(document().host()) != 1) return;
      CV27SetupResultSubsetDialog::copyBack(dialog.range(), area, output(row)->time);
      output(row)->j = area.x;
      UpdateDoc();
    });
    File({.file = resultFileOf(output, &Output::file, kind), .header = "Data File", .width = 160});
    Text("Title", 120, output, &Output::title);
    MultiChoice(
        "Output Items", 140, [output](GridRow row) { return output(row)->items; },
        [output](GridRow row, std::int64_t bits) { output(row)->items = bits; },
        Choices::numbered({"Water depth", "P flux", "Q flux"}));
  }
};

class ResultsTable : public test::ShapeTest {
 protected:
  ResultsTable() {
    open([this](test::OwnPage&, Form& form) {
      form.Number("Output size:", Binding<double>{.get = [this] { return 1.5 * cells.outputs[0].j.last; }});
      form.Grid("Results", cells);
    });
  }
  ResultGrid cells;
};

TEST_F(ResultsTable, Ranges) {
  EXPECT_EQ(rowOf(cells, 1), (Labels{"2", "0-100,1", "0-10", "...", "", "  ...  ", "View...", "", "1"}));
  EXPECT_EQ(store(1, 2, "5-50,5"), 1);
  EXPECT_EQ(cells.outputs[0].j, (USubLine{5, 50, 5}));
  EXPECT_EQ(text("Output size:"), "75");  // worked out anew with each edit
  EXPECT_TRUE(control("Output size:").readOnly);
  EXPECT_EQ(store(1, 2, "5-60"), 1);
  EXPECT_EQ(cells.outputs[0].j.interval, 1);
  EXPECT_EQ(store(1, 2, "60"), 0);
  EXPECT_EQ(store(1, 3, "1-9,5"), 1);
  EXPECT_EQ(cells.outputs[0].time, (USubLine{1, 9, 2}));
}

TEST_F(ResultsTable, ASubsetIsOneEdit) {
  host.fillForm = [](Form& form) {
    form.controls()[1].text = "7";
    return true;
  };
  cells.OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(cells.outputs[0].j.first, 7);
  EXPECT_EQ(cell(1, 2), "7-100,1");
}

TEST_F(ResultsTable, TheKindOfTheFileFollowsTheExtent) {
  host.chosenFile = "out.tsb2";
  cells.OnClickedButtonRowCol(1, 6);
  store(1, 1, "0");
  cells.OnClickedButtonRowCol(1, 6);
  EXPECT_EQ(host.extensions, (Labels{"tsb2", "tsb0"}));
  EXPECT_EQ(host.filters, (Labels{"Maps (*.tsb2)|*.tsb2||", "Time series (*.tsb0)|*.tsb0||"}));
  EXPECT_EQ(cell(1, 5), "out.tsb2");
}

TEST_F(ResultsTable, SeveralItemsAreTheSumOfTheirBits) {
  EXPECT_EQ(style(1, 9).kind, CellKind::multiChoice);
  EXPECT_EQ(style(1, 9).choices, (Labels{"Water depth", "P flux", "Q flux"}));
  EXPECT_EQ(store(1, 9, "5"), 1);
  EXPECT_EQ(cells.outputs[0].items, 5);
  for (const char* bad : {"8", "-1", "x", "1x", ""}) EXPECT_EQ(store(1, 9, bad), 0) << bad;
  EXPECT_EQ(cells.outputs[0].items, 5);
}

}  // namespace pages_results_table_test
}  // namespace gridbay
