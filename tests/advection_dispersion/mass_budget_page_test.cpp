#include "advection_dispersion/mass_budget_page.h"

#include <gtest/gtest.h>

#include "advection_dispersion/component.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_mass_budget_page_test {

class AdMassBudgetPage : public test::ShapeTest {
 protected:
  AdMassBudgetPage() {
    root().nadComponent->SetCount(3);
    list.SetCount(1);
    PageTest::open("CNadMassBudgetDlg");
  }
  MassFile& item() { return *list.GetItem(1); }
  CNadMassBudgetKvs& list = *root().nadMassBudget;
  test::TemporaryFolder folder;
};

TEST_F(AdMassBudgetPage, ARowForEachFile) {
  EXPECT_EQ(labels(), (Labels{"&Number of files:", "Files"}));
  EXPECT_EQ(headers(), (Labels{"File", "Associated polygon", "TRange", "Filename", "...", "", "Title", ""}));
  EXPECT_EQ(rowOf(grid("Files"), 1), (Labels{"1", "0-100,1", "", "...", "View", "", "Items..."}));
  EXPECT_EQ(usableOf(grid("Files"), 1), "xxxx.xx");
  EXPECT_EQ(page->pageId(), PageId::adMassBudget);
  EXPECT_EQ(page->templateId(), 18733);
}

TEST_F(AdMassBudgetPage, TheCount) {
  edit("&Number of files:", "300");
  spin("&Number of files:", 1);
  EXPECT_EQ(list.GetCount(), 300);
  edit("&Number of files:", "0");
  spin("&Number of files:", -1);
  EXPECT_EQ(list.GetCount(), 0);
}

TEST_F(AdMassBudgetPage, EditsReachTheModel) {
  EXPECT_EQ(store(1, 1, "2"), 1);
  EXPECT_EQ(item().polygon, 2);
  EXPECT_EQ(store(1, 2, "5-50,5"), 1);
  EXPECT_EQ(item().steps, (USubLine{5, 50, 5}));
  EXPECT_EQ(store(1, 2, "5"), 0);
  EXPECT_EQ(store(1, 3, "m.tsb0"), 1);
  EXPECT_EQ(item().file.text(), "m.tsb0");
  EXPECT_EQ(store(1, 6, "basin"), 1);
  EXPECT_EQ(item().title, "basin");
}

TEST_F(AdMassBudgetPage, TheFile) {
  host.chosenFile = folder.write("m.tsb0", "");
  grid("Files").OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(item().file.text(), *host.chosenFile);
  EXPECT_EQ(host.extensions, Labels{"tsb0"});
  EXPECT_EQ(host.filters, Labels{"Time series files (*.tsb0;*.tb0) |*.tsb0;*.tb0|All Files (*.*) |*.*||"});
  grid("Files").OnClickedButtonRowCol(1, 5);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(AdMassBudgetPage, ItemsInADialog) {
  host.fillForm = [this](Form& form) {
    EXPECT_EQ(form.find("Items for:")->text, "File 1");
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    EXPECT_EQ(items.GetRowCount(), 3);
    EXPECT_EQ(textIn(items, 1, 2) + textIn(items, 2, 2) + textIn(items, 3, 2), "100");
    return items.StoreStyleRowCol(3, 2, "1") == 1;
  };
  grid("Files").OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(item().entries, (EntryFlags{1, 0, 1}));
}

}  // namespace advection_dispersion_mass_budget_page_test
}  // namespace gridbay
