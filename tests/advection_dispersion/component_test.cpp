#include "advection_dispersion/component.h"

#include <gmock/gmock.h>

#include "advection_dispersion/starting_conditions.h"
#include "core/edition.h"
#include "tests/support/model.h"

namespace gridbay {
namespace advection_dispersion_component_test {

using test::Model;
using test::savedText;
using ::testing::HasSubstr;

constexpr const char* kSectionMissing =
    "Error in the KVS-FILE\nThe number of CNadComponentObjectKvs sections does not correspond to the number "
    "of Components";

class Components : public ::testing::Test {
 protected:
  CNadComponentKvs& list() { return *model.root.nadComponent; }
  CNadComponentObjectKvs& item(int number) { return list().at(number); }
  std::vector<std::string> faults(int deep = 1) {
    const ValidationList messages = test::messagesOf(list(), deep);
    ValidationList counted;
    EXPECT_EQ(list().Validate(counted, deep), messages.size());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::adComponent);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  void load(const std::string& text) { test::load(list(), text); }
  Model model;
};
using Texts = std::vector<std::string>;

TEST_F(Components, ANewModelHasOneConservativeOne) {
  EXPECT_EQ(savedText(list()),
            "COMPONENT_SPECIFICATIONS {\n"
            "    No_Of_Components 1\n"
            "    COMPONENT_1 {\n"
            "        Component_Name \"Component 1\"\n"
            "        Component_Description 0\n"
            "    }\n"
            "}\n");
}

TEST_F(Components, AreReadBack) {
  const std::string text =
      "COMPONENT_SPECIFICATIONS {\n"
      "    No_Of_Components 4\n"
      "    COMPONENT_1 {\n"
      "        Component_Name \"Salt\"\n"
      "        Component_Description 0\n"
      "    }\n"
      "    COMPONENT_2 {\n"
      "        Component_Name \"E. coli\"\n"
      "        Component_Description 1\n"
      "    }\n"
      "    COMPONENT_3 {\n"
      "        Component_Name \"\"\n"
      "        Component_Description 2\n"
      "    }\n"
      "    COMPONENT_4 {\n"
      "        Component_Name \"Heat\"\n"
      "        Component_Description -2\n"
      "    }\n"
      "}\n";
  load(text);
  EXPECT_EQ(item(2).type, CNadComponentObjectKvs::kDecaying);
  EXPECT_EQ(item(4).type, CNadComponentObjectKvs::kHeatExchange);
  EXPECT_EQ(savedText(list()), text);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(Components, MissingKeywordsKeepTheirDefaultsAndSectionsBeyondTheCountAreLeft) {
  load(
      "COMPONENT_SPECIFICATIONS { No_Of_Components 2\n COMPONENT_1 { Component_Description 2 }\n"
      " COMPONENT_2 {}\n COMPONENT_3 { Component_Name \"No\" } }");
  ASSERT_EQ(list().GetCount(), 2);
  EXPECT_EQ(item(1).name, "Component 1");
  EXPECT_EQ(item(1).type, 2);
  EXPECT_EQ(item(2).name, "Component 2");
  EXPECT_EQ(item(2).type, 0);
}

TEST_F(Components, AMissingSectionIsToldAndReadingGoesOn) {
  load("COMPONENT_SPECIFICATIONS { No_Of_Components 3\n COMPONENT_3 { Component_Name \"Third\" } }");
  EXPECT_EQ(model.host.texts, (Texts{kSectionMissing, kSectionMissing}));
  ASSERT_EQ(list().GetCount(), 3);
  EXPECT_EQ(item(1).name, "Component 1");
  EXPECT_EQ(item(3).name, "Third");
}

TEST_F(Components, ALoadBeginsWithAnEmptyList) {
  item(1).name = "Old";
  item(1).type = 2;
  load("COMPONENT_SPECIFICATIONS { No_Of_Components 1\n COMPONENT_1 {} }");
  EXPECT_EQ(item(1).name, "Component 1");
  EXPECT_EQ(item(1).type, 0);
  for (const char* text :
       {"OTHER {}", "", "COMPONENT_SPECIFICATIONS {}", "COMPONENT_SPECIFICATIONS { No_Of_Components 0 }",
        "COMPONENT_SPECIFICATIONS { No_Of_Components -1 }",
        "COMPONENT_SPECIFICATIONS { No_Of_Components \"three\" }"}) {
    list().SetCount(2);
    load(text);
    EXPECT_EQ(list().GetCount(), 0) << text;
  }
}

TEST_F(Components, CountsInAFile) {
  load("COMPONENT_SPECIFICATIONS { No_Of_Components 17 }");
  EXPECT_EQ(list().GetCount(), 17);
  EXPECT_EQ(model.host.texts.size(), 17U);
  model.host.texts.clear();
  load("COMPONENT_SPECIFICATIONS { No_Of_Components 2147483647; COMPONENT_1 { Component_Name \"A\" } }");
  EXPECT_EQ(list().GetCount(), 2049);
  EXPECT_EQ(item(1).name, "A");
  EXPECT_THAT(model.host.texts.at(0),
              HasSubstr("Section COMPONENT_SPECIFICATIONS says 2147483647, which is far more than the 1"));
  load("COMPONENT_SPECIFICATIONS { No_Of_Components 99999999999 }");
  EXPECT_LE(list().GetCount(), 2048);
}

TEST_F(Components, GrowAndShrinkAtTheTail) {
  list().SetCount(2);
  item(1).name = "Salt";
  item(2).name = "Coli";
  item(2).type = 1;
  list().SetCount(4);
  EXPECT_EQ(item(1).name, "Salt");
  EXPECT_EQ(item(2).name, "Coli");
  EXPECT_EQ(item(2).type, 1);
  EXPECT_EQ(item(4).name, "Component 4");
  list().SetCount(1);
  list().SetCount(2);
  EXPECT_EQ(item(2).name, "Component 2");
  EXPECT_EQ(item(2).type, 0);
  list().SetCount(-1);
  EXPECT_EQ(list().GetCount(), 2);
  list().SetCount(0);
  EXPECT_EQ(list().GetCount(), 0);
  EXPECT_EQ(list().GetItem(0), nullptr);
  EXPECT_EQ(list().GetItem(1), nullptr);
}

TEST_F(Components, ByType) {
  list().SetCount(5);
  for (const auto& [number, type] : {std::pair{2, 1}, {4, 1}, {5, -2}}) item(number).type = type;
  EXPECT_EQ(list().CountOfType(1), 2);
  EXPECT_EQ(list().CountOfType(2), 0);
  EXPECT_EQ(list().NumberOfType(1, 1), 2);
  EXPECT_EQ(list().NumberOfType(1, 2), 4);
  EXPECT_EQ(list().NumberOfType(-2, 1), 5);
  EXPECT_EQ(list().NumberOfType(1, 0), -1);
  EXPECT_EQ(list().NumberOfType(1, -1), -1);
  EXPECT_EQ(list().NumberOfType(1, 3), -1);
  EXPECT_EQ(list().NumberOfType(2, 1), -1);
}

TEST_F(Components, NamesOfAllKindsComeBack) {
  const Texts names{"\"quoted\" \\ and { } ;", "two\r\nlines\tand a tab", "  blanks  ",
                    std::string(10000, 'x'), "Ångstrøm °C"};
  list().SetCount(static_cast<int>(names.size()));
  for (std::size_t i = 0; i < names.size(); ++i) item(static_cast<int>(i) + 1).name = names[i];
  const std::string text = savedText(list());
  Model other;
  test::load(*other.root.nadComponent, text);
  ASSERT_EQ(other.root.nadComponent->GetCount(), static_cast<int>(names.size()));
  for (std::size_t i = 0; i < names.size(); ++i)
    EXPECT_EQ(other.root.nadComponent->at(static_cast<int>(i) + 1).name, names[i]);
}

TEST_F(Components, AValueOfAWrongKindIsPassedOver) {
  load(
      "COMPONENT_SPECIFICATIONS { No_Of_Components 1; COMPONENT_1 { Component_Name 7; Component_Description "
      "\"one\" } }");
  EXPECT_EQ(item(1).name, "Component 1");
  EXPECT_EQ(item(1).type, 0);
}

TEST_F(Components, TheCountIsChecked) {
  const Texts illegal{"Illegal number of Components, should be between 1 and 16"};
  for (const auto& [count, expected] : {std::pair{0, illegal}, {1, Texts{}}, {16, Texts{}}, {17, illegal}}) {
    list().SetCount(count);
    EXPECT_EQ(faults(), expected) << count;
    EXPECT_EQ(faults(0), expected) << count;
  }
}

TEST_F(Components, TypesAreChecked) {
  const std::string wrong = "Component description : Wrong component type";
  for (const int type : {2, 1, 0, -1, -2, -3, -2147483647}) {
    item(1).type = type;
    EXPECT_TRUE(faults().empty()) << type;
  }
  list().SetCount(3);
  item(1).type = 3;
  item(3).type = 9;
  EXPECT_EQ(faults(), (Texts{wrong, wrong}));
  EXPECT_TRUE(faults(0).empty());
}

TEST_F(Components, OnlyOneExchangesHeat) {
  list().SetCount(3);
  item(2).type = -2;
  EXPECT_TRUE(faults().empty());
  item(3).type = -2;
  EXPECT_EQ(faults(), Texts{"Only 1 component can have the type 'Heat Exhange'"});
  item(1).type = -2;
  EXPECT_EQ(faults().size(), 1U);
  EXPECT_EQ(faults(0).size(), 1U);
}

TEST_F(Components, AllFaultsInTheirOrder) {
  list().SetCount(17);
  item(1).type = 5;
  item(2).type = item(3).type = -2;
  EXPECT_EQ(faults(), (Texts{"Illegal number of Components, should be between 1 and 16",
                             "Component description : Wrong component type",
                             "Only 1 component can have the type 'Heat Exhange'"}));
}

TEST_F(Components, CopyingTakesTheListAlone) {
  list().SetCount(2);
  item(2).name = "Coli";
  item(2).type = 1;
  Model other;
  other.root.nadComponent->SetCount(4);
  other.root.nadComponent->CopyFrom(list());
  EXPECT_EQ(savedText(*other.root.nadComponent), savedText(list()));
}

TEST_F(Components, StandInTheSetupOfTheirModuleOnly) {
  model.root.moduleSelection->simulationType = module::kAdvectionDispersion;
  EXPECT_THAT(savedText(model.root), HasSubstr("            No_of_Sediment_Fractions 0\n"
                                               "        }\n"
                                               "        STARTING_CONDITIONS {\n"));
  EXPECT_THAT(savedText(model.root), HasSubstr("        COMPONENT_SPECIFICATIONS {\n"));
  list().SetCount(0);
  const auto isTold = [this](int code) {
    model.root.moduleSelection->simulationType = code;
    const Texts told = test::textsOf(test::messagesOf(model.root));
    return std::ranges::find(told, "Illegal number of Components, should be between 1 and 16") != told.end();
  };
  EXPECT_TRUE(isTold(2));
  EXPECT_FALSE(isTold(0));
  EXPECT_FALSE(isTold(8));
}

TEST_F(Components, AreReadWithTheirModuleOnly) {
  const auto countFor = [](const std::string& code) {
    Model read;
    test::load(read.root,
               "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { MODULE_SELECTION { Simulation_Type " + code +
                   " } }\n ADVECTION_DISPERSION_MODULE { COMPONENT_SPECIFICATIONS { No_Of_Components 2\n"
                   " COMPONENT_1 {}\n COMPONENT_2 {} } } }");
    return read.root.nadComponent->GetCount();
  };
  EXPECT_EQ(countFor("2"), theEdition.wetlandSweepKit ? 1 : 2);
  EXPECT_EQ(countFor("0"), 1);
}

}  // namespace advection_dispersion_component_test
}  // namespace gridbay
