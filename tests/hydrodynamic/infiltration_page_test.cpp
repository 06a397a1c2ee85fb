#include "hydrodynamic/infiltration_page.h"

#include <gmock/gmock.h>

#include "hydrodynamic/infiltration.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_infiltration_page_test {

class InfiltrationPage : public test::PageTest {
 protected:
  InfiltrationPage() { open("CHDInfiltrationDlg"); }
  CNhdInfiltrationKvs& object() { return *root().nhdInfiltration; }
  // The controls in their order: '-' for one that is not shown, '.' for one that can't be used.
  std::string state() {
    std::string all;
    for (const Control& it : page->form().controls()) all += !it.visible ? '-' : it.usable() ? 'x' : '.';
    return all;
  }
  test::TemporaryFolder folder;
};

TEST_F(InfiltrationPage, ItsControls) {
  EXPECT_EQ(labels(), (Labels{"Infiltration type:", "Infiltration format:", "Infiltration format:",
                              "Groundwater depth:", "Initial volume:", "Data file:", "...", "View...",
                              "Data file:", "...", "View..."}));
  EXPECT_EQ(page->pageId(), PageId::infiltration);
  EXPECT_EQ(page->templateId(), 19656);
  EXPECT_EQ(control("Infiltration type:").choices,
            (Labels{"No Infiltration", "Net Infiltration Rate", "Constant Infiltration with Capacity"}));
  EXPECT_EQ(control("Infiltration format:", 1).choices,
            (Labels{"Constant in Time, Varying in Space", "Varying in Time and Space"}));
  EXPECT_EQ(control("Infiltration format:", 2).choices, Labels{"Constant in Time, Varying in Space"});
  EXPECT_EQ(control("Groundwater depth:").choices, (Labels{"Depth", "Level"}));
  EXPECT_EQ(control("Initial volume:").choices, (Labels{"Percentage of the Capacity", "Water Content"}));
  EXPECT_EQ(control("Infiltration format:", 1).index, 0);
  EXPECT_EQ(control("Groundwater depth:").index, 0);
  EXPECT_EQ(control("Initial volume:").index, 0);
}

TEST_F(InfiltrationPage, TheTypeDecides) {
  EXPECT_EQ(state(), "x.-.....---");
  choose("Infiltration type:", 1);
  EXPECT_EQ(object().infiltrationType, 1);
  EXPECT_EQ(state(), "xx-..xx.---");
  edit("Data file:", folder.write("rate.tsb2", ""), 1);
  EXPECT_EQ(state(), "xx-..xxx---");
  choose("Infiltration type:", 2);
  EXPECT_EQ(state(), "x-xxx---xx.");
  choose("Infiltration type:", 0);
  EXPECT_EQ(state(), "x.-.....---");
}

TEST_F(InfiltrationPage, ANetRate) {
  choose("Infiltration type:", 1);
  choose("Infiltration format:", 1);
  EXPECT_EQ(object().infiltrationFormat, 3);
  host.chosenFile = folder.write("rate.tsb2", "");
  host.chosenItems = {4};
  press("...");
  EXPECT_EQ(host.filters, Labels{"Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(object().netRateFile.fileName.text(), *host.chosenFile);
  EXPECT_EQ(object().netRateFile.items, std::vector<std::uint32_t>{4});
  EXPECT_TRUE(object().capacityFile.fileName.empty());
  press("View...");
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(InfiltrationPage, ACapacity) {
  choose("Infiltration type:", 1);
  choose("Infiltration format:", 1);
  choose("Infiltration type:", 2);
  EXPECT_EQ(control("Infiltration format:", 2).index, 0);
  choose("Groundwater depth:", 1);
  choose("Initial volume:", 1);
  EXPECT_EQ(object().groundwaterDepthType, 2);
  EXPECT_EQ(object().initialVolumeType, 2);
  Control& format = control("Infiltration format:", 2);
  page->form().act(format);
  EXPECT_EQ(object().infiltrationFormat, 3);  // that of a net rate is kept
  host.chosenFile = folder.write("soil.tsb2", "");
  host.chosenItems = {5, 4, 3, 2, 1};
  page->form().act(control("...", 2));
  EXPECT_EQ(object().capacityFile.fileName.text(), *host.chosenFile);
  EXPECT_EQ(object().capacityFile.items, host.chosenItems);
  EXPECT_TRUE(object().netRateFile.fileName.empty());
  EXPECT_EQ(text("Data file:", 2), *host.chosenFile);
  page->form().act(control("View...", 2));
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(InfiltrationPage, ATypeThatIsNone) {
  object().infiltrationType = 9;
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(control("Infiltration type:").index, -1);
  EXPECT_EQ(state(), "x.-.....---");
}

}  // namespace hydrodynamic_infiltration_page_test
}  // namespace gridbay
