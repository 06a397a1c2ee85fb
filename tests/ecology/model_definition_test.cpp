// The model definition file: what is read of it, and what is not; and the object that holds it.

#include "ecology/model_definition.h"

#include <fmt/format.h>
#include <gmock/gmock.h>

#include <filesystem>
#include <fstream>

#include "ecology/constants.h"
#include "ecology/forcings.h"
#include "ecology/initial_conditions.h"
#include "platform/files/program_path.h"
#include "platform/units/units.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace ecology_model_definition_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

class DefinitionFile : public ::testing::Test {
 protected:
  const ModelDefinition& read(std::string_view text) {
    held = readModelDefinition(folder.write("m.biorig", text));
    return *held;
  }
  // The first declaration of a kind, by the keywords of its section.
  const CSolverItem& declared(CSolverItem::Kind kind, std::string_view keywords) {
    constexpr std::string_view kNames[][2] = {{"STATE_VARIABLES", "STATE_VARIABLE_1"},
                                              {"CONSTANTS", "CONSTANT_1"},
                                              {"FORCINGS", "FORCING_1"},
                                              {"AUXILIARY_VARIABLES", "AUXILIARY_VARIABLE_1"},
                                              {"PROCESSES", "PROCESS_1"},
                                              {"DERIVED_OUTPUTS", "DERIVED_OUTPUT_1"}};
    read(fmt::format("BIO_RIG_SETUP {{\n{} {{\n{} {{\n{}\n}}\n}}\n}}\n", kNames[kind][0], kNames[kind][1],
                     keywords));
    EXPECT_EQ(held->fault, "");
    return held->items[kind].at(0);
  }
  CGlobalKvs& choose(std::string_view text) {
    UFileName file;
    file = folder.write("m.biorig", text);
    root.wqsModelDefinition->Choose(file);
    return root;
  }

  test::TemporaryFolder folder;
  std::shared_ptr<const ModelDefinition> held;
  test::Model model;
  CGlobalKvs& root = model.root;
};

constexpr CSolverItem::Kind kKinds[] = {CSolverItem::kStateVariable, CSolverItem::kConstant,
                                        CSolverItem::kForcing,       CSolverItem::kAuxiliaryVariable,
                                        CSolverItem::kProcess,       CSolverItem::kDerivedOutput};

TEST_F(DefinitionFile, WhatADeclarationLacks) {
  for (const CSolverItem::Kind kind : kKinds) {
    const CSolverItem& it = declared(kind, "");
    EXPECT_EQ(it.kind, kind);
    EXPECT_EQ(it.id, 0);
    for (const std::string& text : {it.symbol, it.description, it.onlineHelp, it.documentation, it.scope,
                                    it.expression, it.classText, it.spatialVariationText, it.unit})
      EXPECT_EQ(text, "");
    EXPECT_EQ(it.quantityCode, 999);
    EXPECT_EQ(it.Quantity(), 0);
    EXPECT_EQ(it.defaultValue, 0);
    EXPECT_EQ(it.minimum, 1);
    EXPECT_EQ(it.maximum, 0);
    EXPECT_FALSE(it.HasLimits());
    EXPECT_EQ(it.builtInId, 0);
    const bool isGiven = kind == CSolverItem::kConstant || kind == CSolverItem::kForcing;
    EXPECT_EQ(it.output, isGiven);
    EXPECT_EQ(it.userSpecified, isGiven);  // the engine has no such built-in
    EXPECT_EQ(it.spatialVariation, 2);
  }
}

TEST_F(DefinitionFile, WhichKindsReadWhat) {
  // As "dqx...": symbol, quantity, default, minimum, maximum, expression, class, user's, built-in, variation.
  const std::string_view all = R"(SYMBOL "S"; ID 7; DESCRIPTION "about"; ONLINE_HELP "help"
    DOCUMENTATION "doc"; SCOPE "WC"; OUTPUT "yes"; QUN_TYPE 100006; DEFAULT_VALUE 1.5; MIN_VALUE -1
    MAX_VALUE 2.5; EXPRESSION "\"a\" - b"; TRANSPORT "T"; PROCESS_TYPE "P"; FORMAT "F"
    IS_USER_SPECIFIED "NO"; BUILT_IN_ID 7; SPATIAL_VARIATION "NONE"; UNIT "u")";
  const auto marksOf = [](const CSolverItem& it) {
    std::string marks;
    const auto mark = [&marks](char letter, bool is) { marks += is ? letter : '.'; };
    mark('s', it.symbol == "S");
    mark('o', it.output);
    mark('q', it.quantityCode == 100006);
    mark('d', it.defaultValue == 1.5);
    mark('l', it.minimum == -1 && it.maximum == 2.5);
    mark('e', it.expression == "a - b");
    mark('c', !it.classText.empty());
    mark('u', it.userSpecified);
    mark('b', it.builtInId == 7);
    mark('v', it.spatialVariationText == "NONE");
    return marks + it.classText + std::to_string(it.spatialVariation);
  };
  Texts marks;
  for (const CSolverItem::Kind kind : kKinds) {
    const CSolverItem& it = declared(kind, all);
    EXPECT_EQ(it.id, 7);
    EXPECT_EQ(it.description + it.onlineHelp + it.documentation + it.scope, "abouthelpdocWC");
    marks.push_back(marksOf(it));
  }
  EXPECT_THAT(marks, ElementsAre("s.qdl.c...T3", "soqdl...bv0", "soqdl...bv0", "so...e...v0", "so...ec..vP0",
                                 ".....ec..vF0"));
}

TEST_F(DefinitionFile, YesInAnyCaseAndNothingElse) {
  EXPECT_TRUE(declared(CSolverItem::kProcess, "OUTPUT \"yEs\"").output);
  EXPECT_FALSE(declared(CSolverItem::kProcess, "OUTPUT \"YES \"").output);
  EXPECT_FALSE(declared(CSolverItem::kProcess, "OUTPUT #true").output);
  EXPECT_TRUE(declared(CSolverItem::kConstant, "BUILT_IN_ID 1; IS_USER_SPECIFIED \"Yes\"").userSpecified);
}

TEST_F(DefinitionFile, BuiltInsThatTheEngineHas) {
  const auto isUsers = [this](CSolverItem::Kind kind, int id) {
    return declared(kind, fmt::format("IS_USER_SPECIFIED \"NO\"; BUILT_IN_ID {}", id)).userSpecified;
  };
  for (const int id : {1, 2, 3, 4, 7, 8, 15, 22, 64, 65}) {
    EXPECT_FALSE(isUsers(CSolverItem::kConstant, id)) << id;
    EXPECT_FALSE(isUsers(CSolverItem::kForcing, id)) << id;
  }
  for (const int id : {-1, 0, 5, 6, 23, 24, 63, 66}) {
    EXPECT_TRUE(isUsers(CSolverItem::kConstant, id)) << id;
    EXPECT_TRUE(isUsers(CSolverItem::kForcing, id)) << id;
  }
}

TEST_F(DefinitionFile, SpatialVariation) {
  EXPECT_EQ(declared(CSolverItem::kForcing, "SPATIAL_VARIATION \"NONE\"").spatialVariation, 0);
  for (const char* text : {"HORISONTAL", "VERTICAL", "none", ""})
    EXPECT_EQ(declared(CSolverItem::kForcing, fmt::format("SPATIAL_VARIATION \"{}\"", text)).spatialVariation,
              2);
  EXPECT_EQ(
      declared(CSolverItem::kStateVariable, "SCOPE \"WC\"; SPATIAL_VARIATION \"NONE\"").spatialVariation, 3);
  EXPECT_EQ(declared(CSolverItem::kStateVariable, "SCOPE \"wc\"").spatialVariation, 2);
}

TEST_F(DefinitionFile, UnitsOfKnownQuantities) {
  const CSolverItem& known = declared(CSolverItem::kForcing, "QUN_TYPE 100006; UNIT \"K\"");
  EXPECT_EQ(known.unit, qunBaseUnit(100006)->symbol);
  EXPECT_EQ(known.Quantity(), 100006);
  const CSolverItem& unknown = declared(CSolverItem::kForcing, "QUN_TYPE 123; UNIT \"1/d\"");
  EXPECT_EQ(unknown.unit, "1/d");
  EXPECT_EQ(unknown.quantityCode, 123);
  EXPECT_EQ(unknown.Quantity(), 0);
  EXPECT_EQ(declared(CSolverItem::kForcing, "QUN_TYPE 999; UNIT \"1/d\"").unit, "1/d");
}

TEST_F(DefinitionFile, SectionsGoOnAsLongAsTheNextNumberIsThere) {
  const ModelDefinition& it = read(R"(BIO_RIG_SETUP {
    DESCRIPTION "Three"
    CONSTANTS { CONSTANT_2 { SYMBOL "b" }; CONSTANT_1 { SYMBOL "a" }; CONSTANT_4 { SYMBOL "d" } }
    FORCINGS { FORCING_2 { SYMBOL "f" } }
    STATE_VARIABLES {
      STATE_VARIABLE_1 { SYMBOL "x"; TRANSPORT "ADVECTION_DISPERSION" }
      STATE_VARIABLE_2 { SYMBOL "y"; TRANSPORT "advection_dispersion" }
      STATE_VARIABLE_3 { SYMBOL "z"; TRANSPORT "ADVECTION_DISPERSION" }
    }
    DERIVED_OUTPUTS { DERIVED_OUTPUT_1 { ID 1 } }
    PROCESSES { PROCESS_1 { ID 2; OUTPUT "NO" }; PROCESS_2 { ID 3; OUTPUT "YES" } }
    AUXILIARY_VARIABLES { AUXILIARY_VARIABLE_1 { ID 4; OUTPUT "YES" } }
  })");
  EXPECT_EQ(it.fault, "");
  EXPECT_EQ(it.name, "Three");
  ASSERT_EQ(it.items[CSolverItem::kConstant].size(), 2U);
  EXPECT_EQ(it.items[CSolverItem::kConstant][0].symbol, "a");
  EXPECT_EQ(it.items[CSolverItem::kConstant][1].symbol, "b");
  EXPECT_THAT(it.items[CSolverItem::kForcing], IsEmpty());
  EXPECT_THAT(it.transported, ElementsAre(0, 2));
  std::vector<int> outputs;
  for (const CSolverItem* item : it.outputItems) outputs.push_back(item->id);
  EXPECT_THAT(outputs, ElementsAre(4, 3, 1));
}

TEST_F(DefinitionFile, EquationsGoToTheFirstVariableOfTheSymbol) {
  const ModelDefinition& it = read(R"(BIO_RIG_SETUP {
    STATE_VARIABLES { STATE_VARIABLE_1 { SYMBOL "PHY"; EXPRESSION "lost" }; STATE_VARIABLE_2 { SYMBOL "phy" }
                      STATE_VARIABLE_3 { SYMBOL "OXY" }; STATE_VARIABLE_4 { SYMBOL "BED" } }
    STATE_VARIABLE_EQUATIONS {
      STATE_VARIABLE_EQUATION_1 { phy "\"gro\" - dea" }
      STATE_VARIABLE_EQUATION_2 { other "x"; OXY "rea" ; PHY 5 }
      STATE_VARIABLE_EQUATION_3 { OXY "rea - use" }
      STATE_VARIABLE_EQUATION_5 { BED "never" }
    }
  })");
  Texts expressions;
  for (const CSolverItem& variable : it.items[CSolverItem::kStateVariable])
    expressions.push_back(variable.expression);
  // The second equation is one of PHY, for which it has no text.
  EXPECT_THAT(expressions, ElementsAre("gro - dea", "", "rea - use", ""));
}

TEST_F(DefinitionFile, NoNameNoDefinitionAndNoFault) {
  held = readModelDefinition("");
  EXPECT_TRUE(held->IsEmpty());
  EXPECT_EQ(held->fault, "");
}

TEST_F(DefinitionFile, BadFilesSayWhereTheyAreBad) {
  EXPECT_THAT(read("BIO_RIG_SETUP {\n CONSTANTS {\n CONSTANT_1 {\n ID 1 }\n").fault, HasSubstr("line"));
  EXPECT_TRUE(held->IsEmpty());
  EXPECT_THAT(read("BIO_RIG_SETUP {\n ID = }\n").fault, HasSubstr("line 2"));
  EXPECT_THAT(read("BIO_RIG_SETUP { DESCRIPTION \"\xff\xfe\" }").fault, HasSubstr("m.biorig"));
  EXPECT_THAT(read(std::string_view("B\0I\0O\0", 6)).fault, HasSubstr("m.biorig"));
  const std::string noTarget =
      "\"" + folder.file("m.biorig") +
      "\" is not a model definition: it has no BIO_RIG_SETUP. Choose the .biorig file "
      "of an ecological model";
  EXPECT_EQ(read("OTHER { }").fault, noTarget);
  EXPECT_EQ(read("").fault, noTarget);
  std::string deep = "BIO_RIG_SETUP ";
  for (int level = 0; level < 100'000; ++level) deep += "{ a ";
  EXPECT_NE(read(deep).fault, "");
  EXPECT_TRUE(held->IsEmpty());
  EXPECT_THAT(readModelDefinition(folder.file("none.biorig"))->fault, HasSubstr("none.biorig"));
  EXPECT_NE(readModelDefinition(folder.path().string())->fault, "");
  EXPECT_NE(readModelDefinition("/dev/zero")->fault, "");
}

TEST_F(DefinitionFile, AFileThatMayNotBeRead) {
  const std::string path = folder.write("m.biorig", "BIO_RIG_SETUP { }");
  std::filesystem::permissions(path, std::filesystem::perms::none);
  if (std::ifstream(path)) GTEST_SKIP() << "this user may read any file";
  EXPECT_THAT(readModelDefinition(path)->fault, HasSubstr(path));
}

TEST_F(DefinitionFile, TooLargeAFileIsNotRead) {
  const std::string path = folder.write("m.biorig", "BIO_RIG_SETUP { }");
  std::filesystem::resize_file(path, ModelDefinition::kMostBytes + 1);  // a hole takes no room
  EXPECT_EQ(
      readModelDefinition(path)->fault,
      "The model definition \"" + path + "\" is not read: it is larger than 64 MB, which no model needs");
}

TEST_F(DefinitionFile, TooManyDeclarationsAreNone) {
  std::string text = "BIO_RIG_SETUP { CONSTANTS {";
  for (int n = 1; n <= ModelDefinition::kMostDeclarations; ++n) text += fmt::format("CONSTANT_{}{{}};", n);
  EXPECT_EQ(read(text + "}}").fault, "");
  EXPECT_EQ(held->items[CSolverItem::kConstant].size(),
            static_cast<std::size_t>(ModelDefinition::kMostDeclarations));
  EXPECT_EQ(read(text + "}; FORCINGS { FORCING_1 {} } }").fault,
            "The model definition \"" + folder.file("m.biorig") +
                "\" is not read: it declares more than 200000 items, which no model needs");
  EXPECT_TRUE(held->IsEmpty());
}

constexpr std::string_view kSmall = R"(BIO_RIG_SETUP {
  STATE_VARIABLES {
    STATE_VARIABLE_1 { SYMBOL "PHY"; ID 3; DESCRIPTION "About PHY"; QUN_TYPE 100006; DEFAULT_VALUE 1.5
                       TRANSPORT "ADVECTION_DISPERSION" }
    STATE_VARIABLE_2 { SYMBOL "BED"; ID 7; UNIT "g/m2"; TRANSPORT "NONE" }
  }
  CONSTANTS { CONSTANT_1 { SYMBOL "k"; ID 1; DEFAULT_VALUE 2.5 } }
  FORCINGS { FORCING_1 { SYMBOL "f"; ID 1; DEFAULT_VALUE 0.5 } }
})";

TEST_F(DefinitionFile, ANewDefinitionInFileOrder) {
  EXPECT_EQ(savedText(*root.wqsModelDefinition),
            "MODEL_DEFINITION {\n"
            "    Model_Definition_File (file)\"\"\n"
            "    Integration_Method 1\n"
            "    Update_Frequency 1\n"
            "    Disable_Processes #false\n"
            "}\n"
            "STATE_VARIABLES {\n"
            "    NoOfComponents 0\n"
            "}\n");
}

TEST_F(DefinitionFile, SectionsGoByTheIds) {
  choose(kSmall);
  CWQSModelDefinitionKvs& it = *root.wqsModelDefinition;
  it.integration = CWQSModelDefinitionKvs::kRungeKutta4;
  it.frequency = 12;
  it.disableProcesses = true;
  EXPECT_EQ(savedText(it, folder.file("s.v27")), fmt::format("MODEL_DEFINITION {{\n"
                                                             "    Model_Definition_File (file)\"m.biorig\"\n"
                                                             "    Integration_Method 2\n"
                                                             "    Update_Frequency 12\n"
                                                             "    Disable_Processes #true\n"
                                                             "}}\n"
                                                             "STATE_VARIABLES {{\n"
                                                             "    NoOfComponents 2\n"
                                                             "    STATE_VARIABLE_3 {{\n"
                                                             "        ID 3\n"
                                                             "        Transport \"AD\"\n"
                                                             "        Description \"About PHY\"\n"
                                                             "        QUN_Type 100006\n"
                                                             "        Unit \"{}\"\n"
                                                             "    }}\n"
                                                             "    STATE_VARIABLE_7 {{\n"
                                                             "        ID 7\n"
                                                             "        Transport \"NONE\"\n"
                                                             "        Description \"\"\n"
                                                             "        QUN_Type 999\n"
                                                             "        Unit \"g/m2\"\n"
                                                             "    }}\n"
                                                             "}}\n",
                                                             qunBaseUnit(100006)->symbol));
}

TEST_F(DefinitionFile, ALoadReadsTheModelAndNotWhatTheSetupSaysOfIt) {
  folder.write("m.biorig", kSmall);
  test::load(*root.wqsModelDefinition,
             "MODEL_DEFINITION { Model_Definition_File (file)\"m.biorig\"; Integration_Method 3; "
             "Update_Frequency 4; Disable_Processes #true }\n"
             "STATE_VARIABLES { NoOfComponents 1; STATE_VARIABLE_4 { ID 4; Transport \"AD\" } }",
             folder.file("s.v27"));
  const CWQSModelDefinitionKvs& it = *root.wqsModelDefinition;
  EXPECT_EQ(it.integration, 3);
  EXPECT_EQ(it.frequency, 4);
  EXPECT_TRUE(it.disableProcesses);
  EXPECT_EQ(it.GetNoStateVariables(), 2);
  EXPECT_EQ(it.GetNoTransported(), 1);
  EXPECT_THAT(model.host.texts, IsEmpty());
}

TEST_F(DefinitionFile, LookupsOutOfRange) {
  const CWQSModelDefinitionKvs& it = *choose(kSmall).wqsModelDefinition;
  EXPECT_EQ(it.StateVariable(0), nullptr);
  EXPECT_EQ(it.StateVariable(3), nullptr);
  EXPECT_EQ(it.StateVariable(2)->symbol, "BED");
  EXPECT_EQ(it.Transported(1)->symbol, "PHY");
  EXPECT_EQ(it.Transported(2), nullptr);
  EXPECT_EQ(it.Transported(-1), nullptr);
  EXPECT_EQ(it.Constant(1)->symbol, "k");
  EXPECT_EQ(it.Forcing(2), nullptr);
}

TEST_F(DefinitionFile, AModelThatIsGoneLeavesAllListsEmptyAndSaysSo) {
  test::load(*root.wqsModelDefinition, "MODEL_DEFINITION { Model_Definition_File (file)\"none.biorig\" }",
             folder.file("s.v27"));
  ASSERT_EQ(model.host.texts.size(), 1U);
  EXPECT_THAT(
      model.host.texts[0],
      AllOf(HasSubstr("none.biorig"),
            HasSubstr("\nThe ecological model has no state variables, constants and forcings until its "
                      "file is read, and a save leaves out their values.")));
  test::load(*root.wqsConstants, "CONSTANTS { No_Of_Constants 1; CONSTANT_1 { Value 3.0 } }");
  EXPECT_EQ(savedText(*root.wqsConstants), "CONSTANTS {\n    No_Of_Constants 0\n}\n");
  const ValidationList messages = test::messagesOf(*root.wqsModelDefinition);
  ASSERT_EQ(messages.size(), 1U);
  EXPECT_EQ(messages[0], (CMessage{PageId::ecoModelDefinition, "None or Invalid Model Definition File"}));
  EXPECT_THAT(savedText(*root.wqsModelDefinition, folder.file("s.v27")), HasSubstr("(file)\"none.biorig\""));
}

TEST_F(DefinitionFile, Checks) {
  CWQSModelDefinitionKvs& it = *root.wqsModelDefinition;
  it.frequency = 0;
  EXPECT_THAT(test::textsOf(test::messagesOf(it)),
              ElementsAre("None or Invalid Model Definition File", "Invalid Update Frequency"));
  it.frequency = 1;
  for (const char* section : {"STATE_VARIABLES { STATE_VARIABLE_1 {} }", "CONSTANTS { CONSTANT_1 {} }",
                              "FORCINGS { FORCING_1 {} }", "AUXILIARY_VARIABLES { AUXILIARY_VARIABLE_1 {} }",
                              "PROCESSES { PROCESS_1 {} }", "DERIVED_OUTPUTS { DERIVED_OUTPUT_1 {} }"}) {
    choose(fmt::format("BIO_RIG_SETUP {{ {} }}", section));
    EXPECT_THAT(test::messagesOf(it), IsEmpty()) << section;
  }
}

TEST_F(DefinitionFile, AnotherModelClearsWhatWasGivenForGood) {
  choose(kSmall);
  root.wqsConstants->at(1).value = 9;
  root.wqsForcings->at(1).value = 9;
  root.wqsInitialConditions->at(1).at(1).value = 9;
  choose("BIO_RIG_SETUP { CONSTANTS { CONSTANT_1 { DEFAULT_VALUE 1.0 }; CONSTANT_2 {} } }");
  EXPECT_EQ(root.wqsConstants->GetCount(), 2);
  EXPECT_EQ(root.wqsConstants->at(1).value, 1);
  EXPECT_EQ(root.wqsForcings->GetCount(), 0);
  EXPECT_EQ(root.wqsInitialConditions->GetCount(), 0);
  choose(kSmall);
  EXPECT_EQ(root.wqsConstants->GetCount(), 1);
  EXPECT_EQ(root.wqsConstants->at(1).value, 2.5);
  EXPECT_EQ(root.wqsForcings->at(1).value, 0.5);
  EXPECT_EQ(root.wqsInitialConditions->at(1).at(1).value, 1.5);
}

TEST_F(DefinitionFile, ACopyHasTheSameModel) {
  choose(kSmall);
  test::Model other;
  other.root.wqsModelDefinition->CopyFrom(*root.wqsModelDefinition);
  EXPECT_EQ(&other.root.wqsModelDefinition->definition(), &root.wqsModelDefinition->definition());
  EXPECT_TRUE(other.root.wqsModelDefinition->SameState(*root.wqsModelDefinition));
}

// The exact state tells every word of a model, in whichever declaration.
TEST_F(DefinitionFile, ReadingsAreTheSameWhereTheyDeclareTheSame) {
  const auto text = [](std::string_view variable, std::string_view process) {
    return fmt::format(
        "BIO_RIG_SETUP {{ STATE_VARIABLES {{ STATE_VARIABLE_1 {{ SYMBOL \"A\"; {} }} }}\n"
        "PROCESSES {{ PROCESS_1 {{ SYMBOL \"P\"; OUTPUT \"YES\"; {} }} }} }}\n",
        variable, process);
  };
  const std::string plain = text("TRANSPORT \"AD\"", "DESCRIPTION \"d\"");
  choose(plain);
  CGlobalKvs first;
  first.AssignState(root);
  const ModelDefinition* const before = &root.wqsModelDefinition->definition();
  choose(plain);
  EXPECT_NE(&root.wqsModelDefinition->definition(), before);
  EXPECT_TRUE(root.wqsModelDefinition->SameState(*first.wqsModelDefinition));
  for (const std::string& other :
       {text("TRANSPORT \"NONE\"", "DESCRIPTION \"d\""), text("TRANSPORT \"AD\"", "DESCRIPTION \"e\""),
        text("TRANSPORT \"AD\"; DEFAULT_VALUE 2", "DESCRIPTION \"d\""), std::string("A {")}) {
    choose(other);
    EXPECT_FALSE(root.wqsModelDefinition->SameState(*first.wqsModelDefinition)) << other;
  }
}

TEST_F(DefinitionFile, TemplatesByTheirDescriptionsOrNames) {
  folder.write("b.biorig", "BIO_RIG_SETUP { DESCRIPTION \"Plankton\" }");
  folder.write("a.BIORIG", "BIO_RIG_SETUP { }");
  folder.write("c.biorig", "broken {");
  folder.write(".hidden.biorig", "BIO_RIG_SETUP { }");
  folder.write("d.txt", "BIO_RIG_SETUP { }");
  std::filesystem::create_directory(folder.path() / "folder.biorig");
  CWQSModelDefinitionKvs& it = *root.wqsModelDefinition;
  it.FindTemplates(folder.path().string());
  Texts names;
  for (const ModelTemplate& found : it.templates()) names.push_back(found.name);
  EXPECT_THAT(names, ElementsAre("a.BIORIG", "Plankton", "c.biorig", "From File ..."));
  EXPECT_EQ(it.templates()[1].path, folder.file("b.biorig"));
  EXPECT_EQ(it.templates().back().path, "");
  it.FindTemplates(folder.file("none"));
  ASSERT_EQ(it.templates().size(), 1U);
  EXPECT_EQ(it.templates()[0].name, "From File ...");
}

TEST_F(DefinitionFile, TheProgramComesWithAModel) {
  const std::string program = CKTOConfigFiles::GetProgramPath(1);
  EXPECT_EQ(program, CKTOConfigFiles::GetProgramPath(0) + "/");
  const std::vector<ModelTemplate>& templates = root.wqsModelDefinition->templates();
  ASSERT_EQ(templates.size(), 2U);
  EXPECT_EQ(templates[0].path, program + "Templates/BIORig/oxygen.biorig");
  UFileName file;
  file = templates[0].path;
  root.wqsModelDefinition->Choose(file);
  EXPECT_EQ(root.wqsModelDefinition->definition().fault, "");
  EXPECT_EQ(root.wqsModelDefinition->GetNoStateVariables(), 5);
  EXPECT_EQ(root.wqsModelDefinition->GetNoTransported(), 4);
  // It can be used as it stands: all defaults are in their ranges.
  EXPECT_THAT(test::messagesOf(*root.wqsConstants), IsEmpty());
  EXPECT_THAT(test::messagesOf(*root.wqsForcings), IsEmpty());
  EXPECT_THAT(test::messagesOf(*root.wqsInitialConditions), IsEmpty());
  for (const CSolverItem& variable : root.wqsModelDefinition->stateVariables())
    EXPECT_NE(variable.expression, "") << variable.symbol;
}

}  // namespace ecology_model_definition_test
}  // namespace gridbay
