#include "advection_dispersion/mass_budget.h"

#include <gtest/gtest.h>

#include "advection_dispersion/component.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "tests/support/model.h"

namespace gridbay {
namespace advection_dispersion_mass_budget_test {

using test::load;
using test::Model;
using test::savedText;

class AdMassBudget : public ::testing::Test {
 protected:
  AdMassBudget() {
    model.root.nadComponent->SetCount(3);
    model.root.massBudget->SetNoPolygons(2);
  }
  Model model;
  CNadMassBudgetKvs& list = *model.root.nadMassBudget;
};

TEST_F(AdMassBudget, ANewFileHasTheFirstPolygonAndComponent) {
  list.SetCount(1);
  const CNadMassBudgetItemKvs& item = *list.GetItem(1);
  EXPECT_EQ(item.polygon, 1);
  EXPECT_EQ(item.steps, (USubLine{0, 100, 1}));
  EXPECT_TRUE(item.file.empty());
  EXPECT_TRUE(item.title.empty());
  EXPECT_EQ(item.entries, EntryFlags{1});
}

TEST_F(AdMassBudget, IsWrittenInFileOrder) {
  EXPECT_EQ(savedText(list), "MASS_BUDGET {\n    NoOfMassFiles 0\n}\n");
  list.SetCount(2);
  list.GetItem(1)->entries = {0, 0, 0};
  MassFile& item = *list.GetItem(2);
  item.polygon = 2;
  item.steps = {5, 60, 4};
  item.file.Set("out/m.tsb0", "/case/setup.v27");
  item.title = "basin";
  item.entries = {1, 0, 1};
  EXPECT_EQ(savedText(list),
            "MASS_BUDGET {\n"
            "    NoOfMassFiles 2\n"
            "    MASS_FILE_1 {\n"
            "        AssociatedPolygon 1\n"
            "        TRange 0 100 1\n"
            "        FILE_NAME (result)\"\"\n"
            "        Title \"\"\n"
            "        SIMPLE_COMPONENTS {\n"
            "            NoOfSimpleComponents 0\n"
            "        }\n"
            "    }\n"
            "    MASS_FILE_2 {\n"
            "        AssociatedPolygon 2\n"
            "        TRange 5 60 4\n"
            "        FILE_NAME (result)\"out/m.tsb0\"\n"
            "        Title \"basin\"\n"
            "        SIMPLE_COMPONENTS {\n"
            "            NoOfSimpleComponents 2\n"
            "            ComponentNumbers 1 3\n"
            "        }\n"
            "    }\n"
            "}\n");
  Model other;
  other.root.nadComponent->SetCount(3);
  load(*other.root.nadMassBudget, savedText(list));
  EXPECT_EQ(savedText(*other.root.nadMassBudget), savedText(list));
  other.root.nadMassBudget->SetCount(0);
  other.root.nadMassBudget->CopyFrom(list);
  EXPECT_EQ(savedText(*other.root.nadMassBudget), savedText(list));
}

TEST_F(AdMassBudget, AMissingFileIsTold) {
  load(list, "MASS_BUDGET { NoOfMassFiles 2; MASS_FILE_2 { AssociatedPolygon 2 } }");
  ASSERT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(2)->polygon, 2);
  EXPECT_EQ(list.GetItem(2)->entries, EntryFlags{1});  // there is no section of components
  EXPECT_EQ(model.host.texts,
            std::vector<std::string>{"Error in the KVS-FILE\nThe number of Mass Budget Polygons does not "
                                     "correspond to the number specified"});
  load(list, "OTHER {}");
  EXPECT_EQ(list.GetCount(), 2);
}

TEST_F(AdMassBudget, NumbersOfNoComponentAreSkipped) {
  const auto read = [this](const std::string& rows) {
    load(list, "MASS_BUDGET { NoOfMassFiles 1; MASS_FILE_1 { SIMPLE_COMPONENTS { " + rows + " } } }");
    return list.GetItem(1)->entries;
  };
  EXPECT_EQ(read("NoOfSimpleComponents 5; ComponentNumbers 4 0 -1 2147483647 2"), (EntryFlags{0, 1, 0}));
  EXPECT_EQ(read("ComponentNumbers 1"), (EntryFlags{0, 1, 0}));
  EXPECT_EQ(read("NoOfSimpleComponents 1; ComponentNumbers 3 1"), (EntryFlags{0, 0, 1}));
  EXPECT_EQ(read("NoOfSimpleComponents 2147483647; ComponentNumbers 1"), (EntryFlags{1, 0, 0}));
  EXPECT_EQ(read("NoOfSimpleComponents -1; ComponentNumbers 1"), (EntryFlags{0, 0, 0}));
}

TEST_F(AdMassBudget, ACountIsBelievedAsFarAsItIsBorneOut) {
  const auto read = [this](const std::string& count) {
    load(list, "MASS_BUDGET { NoOfMassFiles " + count + " }");
    return list.GetCount();
  };
  EXPECT_EQ(read("17"), 17);
  EXPECT_EQ(read("-1"), 17);
  EXPECT_EQ(read("0"), 0);
  EXPECT_EQ(read("2147483647"), kCountSlack);
}

TEST_F(AdMassBudget, FilesDoNotFollowTheComponents) {
  list.SetCount(1);
  list.GetItem(1)->entries = {0, 1, 1};
  model.root.nadComponent->SetCount(1);
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{0, 1, 1}));
  list.ChooseFirstComponent();
  EXPECT_EQ(list.GetItem(1)->entries, EntryFlags{1});
}

TEST_F(AdMassBudget, PathsReachTheComponents) {
  list.SetCount(1);
  const KvsHandle file = test::fileOf("ComponentNumbers 2 3");
  const std::string documentPath;
  PathAccess access{.what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
  ASSERT_TRUE(list.AccessPath("MASS_BUDGET/MASS_FILE_1/SIMPLE_COMPONENTS/ComponentNumbers", access));
  EXPECT_EQ(list.GetItem(1)->entries, (EntryFlags{0, 1, 1}));
}

class AdMassBudgetChecks : public AdMassBudget {
 protected:
  AdMassBudgetChecks() {
    list.SetCount(1);
    item().file = "m.tsb0";
  }
  MassFile& item() { return *list.GetItem(1); }
  std::vector<std::string> faults() {
    const ValidationList messages = test::messagesOf(list);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::adMassBudget);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  using Texts = std::vector<std::string>;
};

TEST_F(AdMassBudgetChecks, Polygons) {
  EXPECT_EQ(faults(), Texts{});
  item().polygon = 2;
  EXPECT_EQ(faults(), Texts{});
  for (const int number : {0, 3, -1}) {
    item().polygon = number;
    EXPECT_EQ(faults(), Texts{"Invalid polygon"}) << number;
  }
}

TEST_F(AdMassBudgetChecks, ARangeIsToldOnce) {
  for (const USubLine& wrong :
       {USubLine{-1, 5, 1}, USubLine{101, 101, 1}, USubLine{0, -1, 1}, USubLine{0, 101, 1}, USubLine{0, 5, 0},
        USubLine{6, 5, 1}, USubLine{-1, 200, -1}}) {
    item().steps = wrong;
    EXPECT_EQ(faults(), Texts{"TRange is out of range"}) << wrong.first << ", " << wrong.last;
  }
  item().steps = {100, 100, 500};
  EXPECT_EQ(faults(), Texts{});
}

TEST_F(AdMassBudgetChecks, InTheirOrder) {
  item().polygon = 0;
  item().steps.interval = 0;
  item().entries = {0, 0};
  item().file = "";
  EXPECT_EQ(faults(), (Texts{"Invalid polygon", "TRange is out of range", "No item selected",
                             "No output file specified"}));
  EXPECT_TRUE(test::messagesOf(list, 0).empty());
}

TEST_F(AdMassBudgetChecks, TheModelAsksForThemWithTwoSchemesOnly) {
  item().polygon = 0;
  const auto isAsked = [this](int code, int scheme) {
    model.root.moduleSelection->simulationType = code;
    model.root.moduleSelection->adScheme = scheme;
    for (const CMessage& message : test::messagesOf(model.root)) {
      if (message.page == PageId::adMassBudget) return true;
    }
    return false;
  };
  EXPECT_TRUE(isAsked(2, 1));
  EXPECT_TRUE(isAsked(2, -1));
  EXPECT_FALSE(isAsked(2, 5));
  EXPECT_FALSE(isAsked(2, -5));
  EXPECT_FALSE(isAsked(0, 1));
}

}  // namespace advection_dispersion_mass_budget_test
}  // namespace gridbay
