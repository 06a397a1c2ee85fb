// Rows that take a value or a file: the type, the value, the file's name and its two buttons.

#include <gmock/gmock.h>

#include "platform/units/units.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace pages_file_columns_test {

struct Decay {
  std::int32_t format = 0;
  float value = 0.5F;
  UTsbSelection file{1};

  void Request(CVdFileSelectorDlg& selector, int number) {
    selector.SetNoItems(1);
    asked = number;
  }
  int asked = 0;
};

class DecayGrid final : public ColumnGrid {
 public:
  std::vector<Decay> rows{2};
  int hiddenWidth = 0;

 private:
  int RowHeaderWidth() override { return 100; }
  void LayOut() override {
    Rows([this] { return static_cast<int>(rows.size()); });
    const auto decay = [this](GridRow row) { return &rows[static_cast<std::size_t>(row.item) - 1]; };
    const auto isFile = [decay](GridRow row) { return decay(row)->format == 1; };
    List("Given as", 95, decay, &Decay::format, Choices::numbered({"Constant", "Type 0"}));
    Number("Value", 75, decay, &Decay::value, item::kWaterLevel).EnabledIf([isFile](GridRow row) {
      return !isFile(row);
    });
    File({.file = fileOf(decay, &Decay::file, FileKind{"tsb0", "Decay (*.tsb0)|*.tsb0||"}, &Decay::Request),
          .header = "FileName",
          .width = 160,
          .browseWidth = 20,
          .enabled = isFile});
    Shown("Hidden", 60, [](GridRow) { return "x"; }).WidthBy([this] { return hiddenWidth; });
  }
};

class FileRows : public test::ShapeTest {
 protected:
  FileRows() {
    open([this](test::OwnPage&, Form& form) { form.Grid("Decay", cells); });
  }
  DecayGrid cells;
  test::TemporaryFolder folder;
};

TEST_F(FileRows, TheTypeDecidesBetweenValueAndFile) {
  EXPECT_EQ(widths(), (std::vector<int>{100, 95, 75, 160, 20, 45, 0}));
  EXPECT_EQ(usableOf(cells, 1), "xx....");
  store(1, 1, "Type 0");
  EXPECT_EQ(usableOf(cells, 1), "x.xx..");
  EXPECT_EQ(usableOf(cells, 2), "xx....");
}

TEST_F(FileRows, AFileIsChosenByItsRequestAndLookedAt) {
  store(2, 1, "Type 0");
  host.chosenFile = folder.write("d.tsb0", "");
  host.chosenItems = {3};
  cells.OnClickedButtonRowCol(2, 4);
  EXPECT_EQ(host.filters, Labels{"Decay (*.tsb0)|*.tsb0||"});
  EXPECT_EQ(cells.rows[1].asked, 2);
  EXPECT_EQ(cells.rows[1].file.fileName.text(), *host.chosenFile);
  EXPECT_EQ(cells.rows[1].file.items, std::vector<std::uint32_t>{3});
  EXPECT_EQ(usableOf(cells, 2), "x.xxx.");
  cells.OnClickedButtonRowCol(2, 5);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(FileRows, LeavingTheDialogChangesNothing) {
  store(1, 1, "Type 0");
  store(1, 3, "kept.tsb0");
  document.SetModifiedFlag(false);
  cells.OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(host.filters.size(), 1U);
  EXPECT_EQ(cells.rows[0].file.fileName.text(), "kept.tsb0");
  EXPECT_FALSE(document.IsModified());
}

TEST_F(FileRows, ANumberIsShownInTheUsersUnit) {
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(cell(1, 2), "1.640420");
  EXPECT_EQ(style(1, 2).toolTip, "Water level [ft]");
  EXPECT_EQ(store(1, 2, "1.640420"), 1);  // as it stands: keeps all digits
  EXPECT_EQ(cells.rows[0].value, 0.5F);
  EXPECT_EQ(store(1, 2, " 10 \r\n"), 1);
  EXPECT_EQ(cells.rows[0].value, 3.048F);
  for (const char* bad : {"", "x", "nan", "1e60"}) EXPECT_EQ(store(1, 2, bad), 0) << bad;
  EXPECT_EQ(cells.rows[0].value, 3.048F);
}

TEST_F(FileRows, AColumnIsHiddenOrAsWideAsItsFunctionSays) {
  EXPECT_FALSE(cells.OnTrackColWidth(6));
  cells.hiddenWidth = 70;
  EXPECT_EQ(cells.GetColWidth(6), 70);
  EXPECT_TRUE(cells.OnTrackColWidth(6));
}

TEST_F(FileRows, AGridThatDoesNotApplyIsGreyAsAWhole) {
  control("Decay").EnabledIf([this] { return cells.rows[0].value < 1; });
  store(1, 2, "2");
  EXPECT_FALSE(cells.IsEnabled());
  EXPECT_EQ(usableOf(cells, 1), "......");
  EXPECT_EQ(store(1, 2, "0"), 0);
  cells.rows[0].value = 0;
  page->SetData();
  EXPECT_EQ(usableOf(cells, 1), "xx....");
}

}  // namespace pages_file_columns_test
}  // namespace gridbay
