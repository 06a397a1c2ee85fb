#include "advection_dispersion/component_page.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/starting_conditions.h"
#include "tests/support/pages.h"

namespace gridbay {
namespace advection_dispersion_component_page_test {

class ComponentPage : public test::PageTest {
 protected:
  ComponentPage() { open("CNadComponentDlg"); }
  CNadComponentKvs& list() { return *root().nadComponent; }
};

TEST_F(ComponentPage, ControlsAndColumns) {
  EXPECT_EQ(labels(), (Labels{"Number of Components", "Components"}));
  EXPECT_EQ(page->templateId(), 18720);
  EXPECT_EQ(page->pageId(), PageId::adComponent);
  EXPECT_EQ(static_cast<int>(PageId::adComponent), 11);
  EXPECT_EQ(headers(), (Labels{"", "Component Name", "Type"}));
  EXPECT_EQ(widths(), (std::vector<int>{30, 120, 100}));
  EXPECT_EQ(grid().GetRowCount(), 1);
  EXPECT_EQ(grid().GetRowHeader(1), "1");
  EXPECT_EQ(cell(1, 1), "Component 1");
  EXPECT_EQ(cell(1, 2), "Conservative");
  EXPECT_EQ(style(1, 2).choices, (Labels{"Conservative", "Decaying", "Heat dissipating", "Heat Exchange"}));
}

TEST_F(ComponentPage, TheCount) {
  EXPECT_EQ(control("Number of Components").spinLowest, 0);
  EXPECT_EQ(control("Number of Components").spinHighest, 16);
  edit("Number of Components", "3");
  EXPECT_EQ(list().GetCount(), 3);
  EXPECT_EQ(grid().GetRowCount(), 3);
  EXPECT_EQ(cell(3, 1), "Component 3");
  spin("Number of Components", 1);
  EXPECT_EQ(grid().GetRowCount(), 4);
  spin("Number of Components", -5);
  EXPECT_EQ(list().GetCount(), 4);
  for (const char* refused : {"-1", "17", "2147483647", "9999999999", "two", ""}) {
    edit("Number of Components", refused);
    EXPECT_EQ(list().GetCount(), 4) << refused;
    page->SetData();
  }
  edit("Number of Components", "0");
  EXPECT_EQ(list().GetCount(), 0);
  EXPECT_EQ(grid().GetRowCount(), 0);
  spin("Number of Components", -1);
  EXPECT_EQ(list().GetCount(), 0);
  edit("Number of Components", "16");
  spin("Number of Components", 1);
  EXPECT_EQ(list().GetCount(), 16);
}

TEST_F(ComponentPage, ALongerListOfAFileCanBeShortened) {
  list().SetCount(20);
  page->SetData();
  edit("Number of Components", "19");
  EXPECT_EQ(list().GetCount(), 19);
  edit("Number of Components", "21");
  EXPECT_EQ(list().GetCount(), 19);
}

TEST_F(ComponentPage, NamesAreTrimmedAndTakeAnything) {
  EXPECT_EQ(store(1, 1, "  Faecal \"coli\"\t"), 1);
  EXPECT_EQ(list().at(1).name, "Faecal \"coli\"");
  EXPECT_EQ(document.UndoStep()->page, PageId::adComponent);
  EXPECT_EQ(store(1, 1, ""), 1);
  EXPECT_EQ(list().at(1).name, "");
  EXPECT_EQ(store(1, 1, "two\nlines"), 1);
  EXPECT_EQ(cell(1, 1), "two\nlines");
  const std::string longName(10000, 'n');
  EXPECT_EQ(store(1, 1, longName), 1);
  EXPECT_EQ(cell(1, 1), longName);
}

TEST_F(ComponentPage, TypesAndTheirNumbers) {
  for (const auto& [text, type] :
       {std::pair{"Decaying", 1}, {"Heat dissipating", 2}, {"Heat Exchange", -2}, {"Conservative", 0}}) {
    EXPECT_EQ(store(1, 2, text), 1);
    EXPECT_EQ(list().at(1).type, type);
    EXPECT_EQ(cell(1, 2), text);
  }
  EXPECT_EQ(store(1, 2, "Other"), 0);
  for (const int unknown : {3, 7, -1}) {
    list().at(1).type = unknown;
    EXPECT_EQ(cell(1, 2), "Heat Exchange");
    page->UpdateDoc();
    EXPECT_EQ(list().at(1).type, unknown);
  }
  EXPECT_EQ(store(1, 2, "Heat Exchange"), 1);
  EXPECT_EQ(list().at(1).type, -2);
}

TEST_F(ComponentPage, WithAHotStartTheFileDecides) {
  EXPECT_TRUE(control("Number of Components").enabled);
  root().nadStartingConditions->hotStart = true;
  page->SetData();
  EXPECT_FALSE(control("Number of Components").enabled);
  spin("Number of Components", 1);
  EXPECT_EQ(list().GetCount(), 1);
  EXPECT_TRUE(style(1, 1).readOnly);
  EXPECT_TRUE(style(1, 2).readOnly);
  EXPECT_EQ(store(1, 1, "Salt"), 0);
  EXPECT_EQ(store(1, 2, "Decaying"), 0);
  EXPECT_EQ(list().at(1).name, "Component 1");
  root().nadStartingConditions->hotStart = false;
  page->SetData();
  EXPECT_TRUE(control("Number of Components").enabled);
  EXPECT_FALSE(style(1, 1).readOnly);
}

TEST_F(ComponentPage, AnotherCountForgetsTheMassBudget) {
  document.Touch(PageId::adMassBudget);
  page->UpdateDoc();
  store(1, 1, "Salt");
  edit("Number of Components", "1");
  EXPECT_TRUE(document.HasBeenTouched(PageId::adMassBudget));
  root().nadMassBudget->SetCount(1);
  EntryFlags& chosen = root().nadMassBudget->GetItem(1)->entries;
  chosen = {0, 1, 1};
  edit("Number of Components", "2");
  EXPECT_FALSE(document.HasBeenTouched(PageId::adMassBudget));
  EXPECT_EQ(chosen, EntryFlags{1});
  document.Touch(PageId::adMassBudget);
  spin("Number of Components", 1);
  EXPECT_FALSE(document.HasBeenTouched(PageId::adMassBudget));
}

TEST_F(ComponentPage, AnEditCanBeTakenBack) {
  store(1, 1, "Salt");
  edit("Number of Components", "2");
  store(2, 2, "Decaying");
  document.Undo();
  EXPECT_EQ(cell(2, 2), "Conservative");
  document.Undo();
  EXPECT_EQ(list().GetCount(), 1);
  EXPECT_EQ(text("Number of Components"), "1");
  EXPECT_EQ(cell(1, 1), "Salt");
  document.Redo();
  EXPECT_EQ(cell(2, 1), "Component 2");
}

}  // namespace advection_dispersion_component_page_test
}  // namespace gridbay
