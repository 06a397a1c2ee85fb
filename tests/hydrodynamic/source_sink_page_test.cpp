#include "hydrodynamic/source_sink_page.h"

#include <gmock/gmock.h>

#include "basic/source_sink.h"
#include "hydrodynamic/source_sink.h"
#include "tests/support/grids.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_source_sink_page_test {

constexpr std::string_view kSeries = "Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||";

class HdSourceSinkPage : public test::ShapeTest {
 protected:
  HdSourceSinkPage() {
    CSourceSinkKvs& locations = *root().sourceSink;
    locations.SetNoSources(3);
    for (int number = 1; number <= 3; ++number) locations.GetItem(number)->type = number - 1;
    locations.GetItem(1)->source = {3, 4};
    locations.GetItem(2)->sink = {5, 6};
    PageTest::open("CNhdSourceSinkDlg");
  }
  CNhdSourceSinkKvs& flows() { return *root().nhdSourceSink; }
  CNhdSourceSinkObjectKvs& entry(int number) { return *flows().GetItem(number); }
  void pick(std::string_view label, int n, int index) {
    Control& list = control(label, n);
    EXPECT_TRUE(list.usable());
    list.index = index;
    page->form().act(list);
  }
  // Which of list, value, name, "..." and "View..." of evaporation (1) or precipitation (2) can be used.
  std::string usable(int n) {
    std::string all;
    for (const char* label : {"Given as", "Value", "File name", "...", "View..."})
      all += control(label, n).usable() ? 'x' : '.';
    return all;
  }
  std::string usableRow(int row) { return usableOf(PageTest::grid(), row); }

  test::TemporaryFolder folder;
};

TEST_F(HdSourceSinkPage, ItsControls) {
  EXPECT_EQ(labels(),
            (Labels{"Evaporation", "Given as", "Value", "File name", "...", "View...", "Precipitation",
                    "Given as", "Value", "File name", "...", "View...", "Included as net-precipitation",
                    "Precipitation on dry land", "Sources and sinks"}));
  EXPECT_EQ(page->pageId(), PageId::hdSourceAndSink);
  EXPECT_EQ(page->templateId(), 18930);
  EXPECT_TRUE(control("Precipitation").beside);
  for (const int n : {1, 2}) {
    EXPECT_EQ(control("Given as", n).choices, (Labels{"Constant", "Type 0", "Type 2"}));
    EXPECT_EQ(control("Value", n).itemCode, 100088);
    EXPECT_EQ(control("Value", n).unit, "mm/d");
    EXPECT_EQ(usable(n), "xx...");
  }
  EXPECT_EQ(control("Included as net-precipitation").index, 0);
  EXPECT_EQ(control("Precipitation on dry land").index, 1);
}

TEST_F(HdSourceSinkPage, TheKindDecides) {
  edit("Value", "2.5", 1);
  edit("Value", "4", 2);
  EXPECT_EQ(flows().evaporation, 2.5F);
  EXPECT_EQ(flows().precipitation, 4.0F);
  for (const int n : {1, 2}) {
    for (const int kind : {1, 2}) {
      pick("Given as", n, kind);
      EXPECT_EQ(n == 1 ? flows().evaporationKind : flows().precipitationKind, kind);
      EXPECT_EQ(usable(n), "x.xx.");
    }
  }
  edit("File name", folder.write("there.tsb2", ""), 1);
  EXPECT_EQ(usable(1), "x.xxx");
  EXPECT_EQ(usable(2), "x.xx.");
  page->form().act(control("View...", 1));
  EXPECT_EQ(host.opened, Labels{folder.file("there.tsb2")});
  pick("Given as", 1, 0);
  EXPECT_EQ(usable(1), "xx...");
}

TEST_F(HdSourceSinkPage, ValuesAreInTheUsersUnit) {
  document.units().setSystem(UnitSystem::us);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(control("Value", 2).unit, "in/d");
  edit("Value", "2", 2);
  EXPECT_EQ(flows().precipitation, 50.8F);
}

TEST_F(HdSourceSinkPage, FiltersFollowTheKind) {
  for (const int n : {1, 2}) {
    for (const int kind : {1, 2}) {
      pick("Given as", n, kind);
      page->form().act(control("...", n));
    }
  }
  EXPECT_EQ(host.filters,
            (Labels{std::string(kSeries),
                    "Evaporation Map Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||",
                    std::string(kSeries),
                    "Precipitation Map Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"}));
  host.chosenFile = folder.write("rain.tsb2", "");
  host.chosenItems = {3};
  page->form().act(control("...", 2));
  EXPECT_EQ(flows().precipitationFile.fileName.text(), *host.chosenFile);
  EXPECT_EQ(flows().precipitationFile.items, std::vector<std::uint32_t>{3});
  EXPECT_EQ(text("File name", 2), *host.chosenFile);
  EXPECT_TRUE(flows().evaporationFile.fileName.empty());
}

TEST_F(HdSourceSinkPage, NetPrecipitationTakesTheEvaporationOut) {
  const auto net = [this]() -> Control& { return control("Included as net-precipitation"); };
  EXPECT_FALSE(net().usable());
  edit("Value", "1", 2);
  EXPECT_TRUE(net().usable());
  EXPECT_EQ(usable(1), "xx...");
  choose("Included as net-precipitation", 1);
  EXPECT_TRUE(flows().netPrecipitation);
  EXPECT_EQ(usable(1), ".....");
  EXPECT_EQ(usable(2), "xx...");
  // On, but with no precipitation out of use: evaporation is back.
  edit("Value", "0", 2);
  EXPECT_FALSE(net().usable());
  EXPECT_EQ(usable(1), "xx...");
  EXPECT_TRUE(flows().netPrecipitation);
  pick("Given as", 2, 1);
  EXPECT_TRUE(net().usable());
  EXPECT_EQ(usable(1), ".....");
  choose("Included as net-precipitation", 0);
  EXPECT_EQ(usable(1), "xx...");
  edit("Value", "1", 1);
  pick("Given as", 2, 0);
  edit("Value", "-1", 2);
  EXPECT_TRUE(net().usable());
  choose("Precipitation on dry land", 0);
  EXPECT_FALSE(flows().rainOnDryLand);
}

TEST_F(HdSourceSinkPage, ARowForEachLocation) {
  EXPECT_EQ(headers(), (Labels{"Source Sink", "Type", "Magnitude", "Velocity", "Outlet Dir.", "File name",
                               "Item Name Magnitude", " Item Name Velocity", " ... ", "View..."}));
  CV27SetupGridWnd& rows = PageTest::grid();
  EXPECT_EQ(rows.GetRowCount(), 3);
  EXPECT_EQ(rows.GetRowHeader(1), "1: (3,4)->");
  EXPECT_EQ(rows.GetRowHeader(2), "2: ->(5,6)");
  EXPECT_EQ(rows.GetRowHeader(3), "3: (0,0)->(0,0) ");
  EXPECT_EQ(style(1, 1).choices, (Labels{"Constant value", "From file"}));
  EXPECT_EQ(cell(1, 1), "Constant value");
  EXPECT_EQ(cell(1, 2), "0.000000");
  EXPECT_EQ(style(1, 2).toolTip, "Discharge [m³/s]");
  EXPECT_EQ(style(1, 3).toolTip, "Flow velocity [m/s]");
  EXPECT_EQ(style(1, 4).toolTip, "Flow direction [°]");
  EXPECT_EQ(cell(1, 8), "...");
  EXPECT_EQ(cell(1, 9), "View...");
  root().sourceSink->SetNoSources(1);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(rows.GetRowCount(), 1);
}

TEST_F(HdSourceSinkPage, WhatARowOffers) {
  EXPECT_EQ(usableRow(1), "xxxx.....");
  EXPECT_EQ(usableRow(2), "xx.......");
  EXPECT_EQ(usableRow(3), "xxxx.....");
  for (const int row : {1, 2, 3}) EXPECT_EQ(store(row, 1, "From file"), 1);
  EXPECT_EQ(usableRow(1), "x..xxxxx.");
  EXPECT_EQ(usableRow(2), "x...xx.x.");
  store(1, 5, folder.write("there.tsb0", ""));
  EXPECT_EQ(usableRow(1), "x..xxxxxx");
  PageTest::grid().OnClickedButtonRowCol(1, 9);
  EXPECT_EQ(host.opened, Labels{folder.file("there.tsb0")});
  store(1, 1, "Constant value");
  EXPECT_EQ(usableRow(1), "xxxx.....");
}

TEST_F(HdSourceSinkPage, WhatIsTypedIsStored) {
  EXPECT_EQ(store(3, 2, "-2.5"), 1);
  EXPECT_EQ(store(3, 3, "1.25"), 1);
  EXPECT_EQ(store(3, 4, "270"), 1);
  EXPECT_EQ(entry(3).constantMagnitude, -2.5F);
  EXPECT_EQ(entry(3).constantVelocity, 1.25F);
  EXPECT_EQ(entry(3).outletDirection, 270.0F);
  EXPECT_EQ(store(3, 2, "much"), 0);
  EXPECT_EQ(entry(3).constantMagnitude, -2.5F);
  EXPECT_EQ(store(3, 1, "Neither"), 0);
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(store(3, 3, "10"), 1);
  EXPECT_EQ(entry(3).constantVelocity, 3.048F);
  store(3, 1, "From file");
  EXPECT_EQ(store(3, 6, "Discharge at the gate"), 1);
  EXPECT_EQ(store(3, 7, "Speed"), 1);
  EXPECT_EQ(entry(3).itemMagnitude, "Discharge at the gate");
  EXPECT_EQ(style(3, 6).toolTip, "Discharge at the gate");
  EXPECT_EQ(style(3, 7).toolTip, "Speed");
}

TEST_F(HdSourceSinkPage, AFileThatIsPickedNamesItsItems) {
  const std::string path = folder.file("q.tsb0");
  test::writeSeries(path, {}, 100001, "m3 s-1", 3);
  host.chosenFile = path;
  for (const int row : {1, 2}) {
    store(row, 1, "From file");
    host.chosenItems = row == 1 ? std::vector<std::uint32_t>{3, 1} : std::vector<std::uint32_t>{2};
    PageTest::grid().OnClickedButtonRowCol(row, 8);
  }
  EXPECT_EQ(host.filters, Labels(2, "Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"));
  EXPECT_EQ(entry(1).dataFile.fileName.text(), path);
  EXPECT_EQ(entry(1).dataFile.items, (std::vector<std::uint32_t>{3, 1}));
  EXPECT_EQ(entry(1).itemMagnitude, "Series 3");
  EXPECT_EQ(entry(1).itemVelocity, "Series 1");
  EXPECT_EQ(entry(2).dataFile.items, std::vector<std::uint32_t>{2});
  EXPECT_EQ(entry(2).itemMagnitude, "Series 2");
  EXPECT_EQ(entry(2).itemVelocity, "");
}

TEST_F(HdSourceSinkPage, ADialogThatIsLeftChangesNothing) {
  store(2, 1, "From file");
  PageTest::grid().OnClickedButtonRowCol(2, 8);
  EXPECT_EQ(host.filters.size(), 1U);
  EXPECT_EQ(entry(2).dataFile.items, (std::vector<std::uint32_t>{1, 2}));
}

}  // namespace hydrodynamic_source_sink_page_test
}  // namespace gridbay
