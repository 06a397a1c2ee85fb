#include "core/file_selector.h"

#include <gmock/gmock.h>

#include "tests/support/grids.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace core_file_selector_test {

using ::testing::HasSubstr;

class FileSelector : public ::testing::Test {
 protected:
  // Asks the selector of a grid of 10 x 8 points, 30 x 30 m apart, with as many items.
  std::string grid(test::GridSpec spec = {}) {
    test::writeGrid(path, spec);
    return ask();
  }
  std::string ask() {
    std::string error;
    const bool valid = selector.IsTsbFileValid(path, &error);
    EXPECT_EQ(valid, error.empty());
    return error;
  }
  std::string ask(const std::vector<std::uint32_t>& items) {
    std::string error;
    const bool valid = selector.IsTsbFileValid(path, items, &error);
    EXPECT_EQ(valid, error.empty());
    return error;
  }

  test::TemporaryFolder folder;
  std::string path = folder.file("f.tsb2");
  CVdFileSelectorDlg selector;
};

TEST_F(FileSelector, WithoutRequestsAnyDataFileWillDo) {
  EXPECT_EQ(grid(), "");
  path = folder.file("none.tsb2");
  EXPECT_EQ(ask(), "cannot read \"" + path + "\": there is no such file");
  path = "";
  EXPECT_EQ(ask(), "no data file is named");
}

TEST_F(FileSelector, NumberOfItems) {
  selector.SetNoItems(2);
  EXPECT_EQ(grid({.items = 3}), "The file has 3 items; 2 are expected");
  EXPECT_EQ(ask({1, 3}), "");
  EXPECT_EQ(ask({1}), "The selection has 1 items; 2 are expected");
  CVdFileSelectorDlg atLeast;
  atLeast.SetMinNoItems(2);
  selector = std::move(atLeast);
  EXPECT_EQ(ask(), "");
  EXPECT_EQ(ask({2}), "The selection has 1 items; at least 2 are expected");
}

TEST_F(FileSelector, QuantityOfTheItem) {
  selector.AddRequestItemType(100078);
  EXPECT_EQ(grid(),
            "Item 1 \"Item 1\" is Bathymetry (type 100079); Surface elevation (type 100078) is expected");
  EXPECT_EQ(grid({.itemType = 100078}), "");
  CVdRqTsbItem& second = selector.AddRequest();
  second.SetSelectionDescr("Wind speed");
  second.SetMultiQunType({100002, 100274});
  EXPECT_EQ(ask(), "Wind speed: no item is chosen");
  EXPECT_EQ(grid({.itemType = 100078, .items = 2}),
            "Wind speed: Item 2 \"Item 2\" is Surface elevation (type 100078); Wind velocity (type 100002) "
            "or Wind speed "
            "(type 100274) is expected");
  EXPECT_THAT(ask({1, 7}), HasSubstr("Wind speed: the file has no item 7"));
}

TEST_F(FileSelector, RequestsGoWithTheChosenItemsInOrder) {
  selector.AddRequest().SetQunType(100000, 0);
  EXPECT_THAT(grid({.items = 2}), HasSubstr("Item 1"));
  EXPECT_THAT(ask({2}), HasSubstr("Item 2"));
}

TEST_F(FileSelector, ShapeOfAllItems) {
  selector.SetItemNoPoints(1, 10);
  selector.SetItemNoPoints(2, 9);
  EXPECT_EQ(grid(), "Item 1 \"Item 1\" has 8 points along axis 2; 9 are expected");
  CVdFileSelectorDlg spacing;
  spacing.SetItemInterval(1, 30);
  spacing.SetItemInterval(2, 31);
  selector = std::move(spacing);
  EXPECT_EQ(grid(), "Item 1 \"Item 1\" has a spacing of 30 along axis 2; 31 is expected");
  CVdFileSelectorDlg dimension;
  dimension.SetItemDim(1, 0);
  selector = std::move(dimension);
  EXPECT_EQ(grid(), "Item 1 \"Item 1\" has 2 dimensions; 0 are expected");
}

TEST_F(FileSelector, SpacingsAreComparedAsSinglePrecisionHoldsThem) {
  selector.SetItemInterval(1, 0.99993681000029F);
  EXPECT_EQ(grid({.dx = 0.99993681000029}), "");
}

TEST_F(FileSelector, ShapeOfOneItem) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr("Map");
  request.SetDimensions(2);
  request.SetNoPoints(1, 11);
  request.SetInterval(2, 30);
  EXPECT_EQ(grid(), "Map: Item 1 \"Item 1\" has 10 points along axis 1; 11 are expected");
  EXPECT_EQ(grid({.noJ = 11}), "");
}

TEST_F(FileSelector, DataTypeAndTimeAxis) {
  selector.SetDataType(2);
  EXPECT_EQ(grid(), "The file's data type is 0; 2 is expected");
  EXPECT_EQ(grid({.dataType = 2}), "");
  selector.SetNoTimeStep(2);
  EXPECT_EQ(ask(), "The file has 1 time steps; 2 are expected");
  selector.SetNoTimeStep(1);
  selector.SetTimeAxisType(3);
  EXPECT_EQ(ask(), "");
  selector.SetTimeAxisType(2);
  EXPECT_EQ(ask(), "The time axis is an equidistant calendar axis; a relative axis is expected");
}

TEST_F(FileSelector, UnitOfTheTimeAxis) {
  selector.SetTimeAxisQunUnitEquivalentWith(1000);
  TsbTimeAxis levels{.type = TsbTimeAxisType::relative, .unit = "ft", .count = 2, .values = {0, 3}};
  test::writeSeries(path, levels, 100001, "m3 s-1");
  EXPECT_EQ(ask(), "");
  levels.unit = "s";
  test::writeSeries(path, levels, 100001, "m3 s-1");
  EXPECT_EQ(ask(), "The unit of the time axis is \"s\"; one like \"m\" is expected");
}

TEST_F(FileSelector, Period) {
  TsbTimeAxis time;
  time.start = {2000, 1, 1, 0, 0, 0};
  time.unit = "h";
  time.count = 25;
  test::writeSeries(path, time, 100000, "m");
  const DateTime start = DateTime::of({2000, 1, 1, 0, 0, 0});
  selector.SetRequestPeriod(start, start.plusDays(1));
  EXPECT_EQ(ask(), "");
  selector.SetRequestPeriod(start, start.plusDays(1.5));
  EXPECT_EQ(ask(),
            "The file covers 2000-01-01 00:00:00 to 2000-01-02 00:00:00; the simulation needs 2000-01-01 "
            "00:00:00 to "
            "2000-01-02 12:00:00");
  selector.SetRequestPeriod(start.plusDays(-0.1), start);
  EXPECT_NE(ask(), "");
  TsbTimeAxis uneven{.type = TsbTimeAxisType::calendar,
                     .start = {2000, 1, 1, 0, 0, 0},
                     .unit = "d",
                     .count = 3,
                     .values = {0, 0.1, 2}};
  test::writeSeries(path, uneven, 100000, "m");
  selector.SetRequestPeriod(start, start.plusDays(2));
  EXPECT_EQ(ask(), "");
}

TEST_F(FileSelector, Compliance) {
  selector.SetVane27Compliant();
  EXPECT_EQ(grid(), "");
  EXPECT_EQ(grid({.unit = "ft"}), "Item 1 \"Item 1\" is in \"ft\"; \"m\" is expected");
  EXPECT_EQ(grid({.axisUnit = "km"}), "The unit of axis 1 is \"km\"; \"m\" is expected");
}

TEST_F(FileSelector, NamesOfItems) {
  test::writeGrid(path, {.items = 2});
  CVdFileSelectorDlg chosen("tsb2", path, "Maps (*.tsb2)|*.tsb2||", {2}, 1);
  EXPECT_EQ(chosen.kind(), "tsb2");
  EXPECT_EQ(chosen.filter(), "Maps (*.tsb2)|*.tsb2||");
  EXPECT_EQ(chosen.GetSelectedItems(), std::vector<std::uint32_t>{2});
  EXPECT_EQ(chosen.GetNameOfItem(2), "Item 2");
  EXPECT_EQ(chosen.GetNameOfItem(3), "");
  TsbHeader header;
  ASSERT_EQ(tsbFileRead(path, &header), 0);
  CVdRqTsbItem request;
  request.SetQunType(100079, 0);
  std::string name;
  EXPECT_TRUE(request.GetNameOfValidItem(header, 2, &name));
  EXPECT_EQ(name, "Item 2");
  EXPECT_FALSE(request.GetNameOfValidItem(header, 3, &name));
}

class Chooser : public FileChooser {
 public:
  bool choose(CVdFileSelectorDlg& dialog) override {
    dialog.SetFileName("chosen.tsb2");
    dialog.SetSelectedItems({3});
    return true;
  }
};

TEST_F(FileSelector, TheUserChoosesThroughTheHost) {
  EXPECT_EQ(selector.DoModal(), 0);
  Chooser chooser;
  selector.SetChooser(&chooser);
  selector.EnablePlugin(0);
  EXPECT_FALSE(selector.pluginEnabled());
  EXPECT_EQ(selector.DoModal(), 1);
  EXPECT_EQ(selector.fileName(), "chosen.tsb2");
  EXPECT_EQ(selector.GetSelectedItems(), std::vector<std::uint32_t>{3});
}

}  // namespace core_file_selector_test
}  // namespace gridbay
