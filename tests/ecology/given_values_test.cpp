// Constants, forcings, initial and starting conditions of the ecological model.

#include <fmt/format.h>
#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "core/edition.h"
#include "ecology/constants.h"
#include "ecology/forcings.h"
#include "ecology/initial_conditions.h"
#include "ecology/model_definition.h"
#include "ecology/starting_conditions.h"
#include "platform/units/units.h"
#include "tests/ecology/carried_model.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace ecology_given_values_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

// Constants and forcings alike: the user's with one value, one built in, the user's that may vary, and one
// with no limits.
constexpr std::string_view kItems = R"({0}S {{
  {0}_1 {{ SYMBOL "a"; ID 4; QUN_TYPE 100006; DEFAULT_VALUE 2.5; MIN_VALUE 0.0; MAX_VALUE 10.0
          IS_USER_SPECIFIED "YES"; SPATIAL_VARIATION "NONE" }}
  {0}_2 {{ SYMBOL "b"; ID 6; DEFAULT_VALUE 0.5; MIN_VALUE 0.0; MAX_VALUE 10.0; BUILT_IN_ID 7 }}
  {0}_3 {{ SYMBOL "c"; ID 9; DEFAULT_VALUE 1.25; MIN_VALUE 0.0; MAX_VALUE 10.0; IS_USER_SPECIFIED "YES" }}
  {0}_4 {{ SYMBOL "d"; ID 10; DEFAULT_VALUE 0.5 }}
}}
)";

class GivenValues : public ::testing::Test {
 protected:
  GivenValues() {
    root.bathymetry->SetNoAreas(2);
    knowGrid(1, 12, 10);
    knowGrid(2, 6, 4);
    std::string text(test::kCarriedModel.substr(0, test::kCarriedModel.rfind('}')));
    for (const char* section : {"CONSTANT", "FORCING"}) text += fmt::format(fmt::runtime(kItems), section);
    test::define(root, folder, text + "}");
    EXPECT_EQ(root.wqsModelDefinition->definition().fault, "");
  }
  void knowGrid(int area, int noJ, int noK) {
    CBathymetryObjectKvs& grid = *root.bathymetry->GetArea(area);
    grid.noJ = noJ;
    grid.noK = noK;
    grid.dx = grid.dy = 100;
  }
  // A file of `items` items; a series where there are no points.
  void write(std::size_t noJ, std::size_t noK, int items = 1, int quantity = 100201, int dataType = 0,
             std::size_t steps = 1, double step = 3000) {
    TsbDefinition definition;
    definition.dataType = dataType;
    definition.time.step = step;
    definition.time.count = steps;
    if (noJ > 0) definition.axes = {{noJ, 0, 100, "m"}, {noK, 0, 100, "m"}};
    for (int item = 0; item < items; ++item)
      definition.items.push_back({"Item", quantity, std::string(qunBaseUnit(quantity)->text)});
    test::writeFile(path, definition);
  }
  static Texts faults(CKvsBase& object, PageId page, Severity severity = Severity::fault) {
    const ValidationList messages = test::messagesOf(object);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page);
      EXPECT_EQ(message.severity, severity);
    }
    return test::textsOf(messages);
  }
  std::string invalid() const { return "Data file  \" " + path + "\"  is not valid"; }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  std::string path = folder.file("f.tsb");
};

TEST_F(GivenValues, ConstantsInFileOrder) {
  CWQSConstantsItemKvs& third = root.wqsConstants->at(3);
  third.format = CWQSConstantsItemKvs::kMap;
  third.value = 4.5;
  third.File(2)->fileName = "/case/c2.tsb2";
  third.File(2)->items = {3};
  EXPECT_EQ(savedText(*root.wqsConstants),
            "CONSTANTS {\n"
            "    No_Of_Constants 4\n"
            "    CONSTANT_1 {\n"
            "        ID 4\n"
            "        User_Specified #true\n"
            "        Spatial_Variation 0\n"
            "        Data_Format 0\n"
            "        Value 2.5\n"
            "    }\n"
            "    CONSTANT_2 {\n"
            "        ID 6\n"
            "        User_Specified #false\n"
            "        Built_In_ID 7\n"
            "    }\n"
            "    CONSTANT_3 {\n"
            "        ID 9\n"
            "        User_Specified #true\n"
            "        Spatial_Variation 2\n"
            "        Data_Format 3\n"
            "        AREA_1 {\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "        AREA_2 {\n"
            "            File_Name (file)\"c2.tsb2\"\n"
            "            Item_Numbers 3\n"
            "        }\n"
            "        Value 4.5\n"
            "    }\n"
            "    CONSTANT_4 {\n"
            "        ID 10\n"
            "        User_Specified #true\n"
            "        Spatial_Variation 2\n"
            "        Data_Format 0\n"
            "        Value 0.5\n"
            "    }\n"
            "}\n");
}

TEST_F(GivenValues, ConstantsComeBackWhateverTheirIds) {
  test::load(
      *root.wqsConstants,
      "CONSTANTS { No_Of_Constants 9\n"
      "CONSTANT_3 { ID 77; User_Specified #false; Data_Format 3; AREA_2 { File_Name (file)\"c.tsb2\" };"
      " AREA_3 { File_Name (file)\"x.tsb2\" }; Value 7.0 }\n"
      "CONSTANT_2 { User_Specified #true; Data_Format 3; Value 5.0 }\n"
      "CONSTANT_1 { Data_Format 0; AREA_1 { File_Name (file)\"y.tsb2\" } } }");
  EXPECT_EQ(root.wqsConstants->GetCount(), 4);
  const CWQSConstantsItemKvs& third = root.wqsConstants->at(3);
  EXPECT_EQ(third.format, 3);
  EXPECT_EQ(third.value, 7);
  ASSERT_EQ(third.files.size(), 2U);
  EXPECT_EQ(third.files[1].fileName.text(), "c.tsb2");
  EXPECT_EQ(root.wqsConstants->at(2).format, 0);  // built in: it reads nothing
  EXPECT_EQ(root.wqsConstants->at(2).value, 0.5);
  EXPECT_TRUE(root.wqsConstants->at(1).files[0].fileName.empty());
  EXPECT_EQ(root.wqsConstants->at(1).value, 2.5);
}

TEST_F(GivenValues, ConstantsFollowTheAreas) {
  root.wqsConstants->at(3).File(1)->fileName = "kept.tsb2";
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(root.wqsConstants->at(3).files.size(), 3U);
  EXPECT_EQ(root.wqsConstants->at(3).files[2].items.size(), 1U);
  root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(root.wqsConstants->at(3).files.size(), 1U);
  EXPECT_EQ(root.wqsConstants->at(3).File(1)->fileName.text(), "kept.tsb2");
  EXPECT_EQ(root.wqsConstants->at(3).File(2), nullptr);
  EXPECT_EQ(root.wqsConstants->at(3).File(0), nullptr);
}

TEST_F(GivenValues, ConstantsOutOfTheirRanges) {
  // One without limits has no value in range.
  EXPECT_THAT(faults(*root.wqsConstants, PageId::ecoConstants), ElementsAre("4: Value Out of Range"));
  root.wqsConstants->at(1).value = 10;
  root.wqsConstants->at(2).value = 10.5;
  root.wqsConstants->at(3).value = -0.5;
  EXPECT_THAT(faults(*root.wqsConstants, PageId::ecoConstants),
              ElementsAre("2: Value Out of Range", "3: Value Out of Range", "4: Value Out of Range"));
  ValidationList none;
  EXPECT_EQ(root.wqsConstants->Validate(none, 0), 0);
}

TEST_F(GivenValues, MapsOfAConstantFitTheirAreasAndGiveOneMessage) {
  CWQSConstantsItemKvs& it = root.wqsConstants->at(1);
  const auto texts = [&] {
    ValidationList messages;
    const unsigned counted = it.Validate(messages, 1, 1);
    EXPECT_EQ(counted, messages.size());
    return test::textsOf(messages);
  };
  it.format = CWQSConstantsItemKvs::kMap;
  it.value = 99;  // not looked at
  for (UTsbSelection& file : it.files) file.fileName = path;
  EXPECT_THAT(texts(), ElementsAre(invalid()));
  write(12, 10, 1, 100006);
  EXPECT_THAT(texts(), ElementsAre(invalid()));  // not that of Area 2
  knowGrid(2, 12, 10);
  EXPECT_THAT(texts(), IsEmpty());
  write(12, 10, 1, 100201);
  EXPECT_THAT(texts(), ElementsAre(invalid()));  // another quantity
  write(12, 10, 2, 100006);
  it.File(2)->items = {2};
  EXPECT_THAT(texts(), IsEmpty());
  it.File(2)->items = {3};
  EXPECT_THAT(texts(), ElementsAre(invalid()));
}

TEST_F(GivenValues, ForcingsInFileOrder) {
  CWQSForcingsItemKvs& first = root.wqsForcings->at(1);
  first.format = CWQSForcingsItemKvs::kTimeSeries;
  first.value = 4.5;
  first.file.fileName = "/case/f.tsb0";
  EXPECT_EQ(savedText(*root.wqsForcings),
            "FORCINGS {\n"
            "    No_Of_Forcings 4\n"
            "    FORCING_1 {\n"
            "        ID 4\n"
            "        User_Specified #true\n"
            "        Spatial_Variation 0\n"
            "        Data_Format 1\n"
            "        File_Name (file)\"f.tsb0\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "    FORCING_2 {\n"
            "        ID 6\n"
            "        User_Specified #false\n"
            "        Built_In_ID 7\n"
            "    }\n"
            "    FORCING_3 {\n"
            "        ID 9\n"
            "        User_Specified #true\n"
            "        Spatial_Variation 2\n"
            "        Data_Format 0\n"
            "        Value 1.25\n"
            "    }\n"
            "    FORCING_4 {\n"
            "        ID 10\n"
            "        User_Specified #true\n"
            "        Spatial_Variation 2\n"
            "        Data_Format 0\n"
            "        Value 0.5\n"
            "    }\n"
            "}\n");
}

TEST_F(GivenValues, ForcingsAreTakenOverWhereTheyFit) {
  const auto valueAfter = [this](std::string_view keywords) {
    root.wqsForcings->Rebuild();
    test::load(*root.wqsForcings, fmt::format("FORCINGS {{ FORCING_1 {{ {}; Value 7.25 }} }}", keywords));
    return root.wqsForcings->at(1).value;
  };
  EXPECT_EQ(valueAfter("ID 4; User_Specified #true; Spatial_Variation 0"), 7.25);
  EXPECT_EQ(valueAfter("Data_Format 0"), 7.25);  // by its place
  EXPECT_EQ(valueAfter("ID 5; User_Specified #true; Spatial_Variation 0"), 2.5);
  EXPECT_EQ(valueAfter("ID 4; User_Specified #false; Spatial_Variation 0"), 2.5);
  EXPECT_EQ(valueAfter("ID 4; User_Specified #true; Spatial_Variation 2"), 2.5);
  test::load(
      *root.wqsForcings,
      "FORCINGS { FORCING_1 { ID 4; Data_Format 1; File_Name (file)\"f.tsb0\"; Item_Numbers 2; Value 3.0 }; "
      "FORCING_2 { ID 6; User_Specified #false; Data_Format 1; Value 5.0 } }");
  EXPECT_EQ(root.wqsForcings->at(1).format, 1);
  EXPECT_EQ(root.wqsForcings->at(1).file.items, std::vector<std::uint32_t>{2});
  EXPECT_EQ(root.wqsForcings->at(1).value, 2.5);
  EXPECT_EQ(root.wqsForcings->at(2).format, 0);
}

TEST_F(GivenValues, ForcingsOutOfTheirRanges) {
  EXPECT_THAT(faults(*root.wqsForcings, PageId::ecoForcings), IsEmpty());  // the fourth has no limits
  root.wqsForcings->at(2).value = 11;
  root.wqsForcings->at(3).value = -1;
  root.wqsForcings->at(4).value = 1e9;
  EXPECT_THAT(faults(*root.wqsForcings, PageId::ecoForcings),
              ElementsAre("2: Value Out of Range", "3: Value Out of Range"));
}

TEST_F(GivenValues, FilesOfForcings) {
  CWQSForcingsItemKvs& it = root.wqsForcings->at(3);
  it.file.fileName = path;
  const auto isValid = [&](std::int32_t format) {
    it.format = format;
    const Texts texts = faults(*root.wqsForcings, PageId::ecoForcings);
    if (!texts.empty()) EXPECT_THAT(texts, ElementsAre(invalid()));
    return texts.empty();
  };
  EXPECT_FALSE(isValid(CWQSForcingsItemKvs::kTimeSeries));  // there is no file
  write(0, 0, 1, 100201, 0, 2);
  EXPECT_TRUE(isValid(CWQSForcingsItemKvs::kTimeSeries));  // any quantity where none is declared
  EXPECT_FALSE(isValid(CWQSForcingsItemKvs::kMap));
  write(0, 0, 1, 100201, 0, 2, 2000);
  EXPECT_FALSE(isValid(CWQSForcingsItemKvs::kTimeSeries));  // too short
  write(5, 5, 1, 100201, 0, 2);
  EXPECT_FALSE(isValid(CWQSForcingsItemKvs::kTimeSeries));
  EXPECT_TRUE(isValid(CWQSForcingsItemKvs::kMap));
  write(5, 5, 1, 100201, 0, 2, 2000);
  EXPECT_FALSE(isValid(CWQSForcingsItemKvs::kMap));
  write(5, 5);
  EXPECT_TRUE(isValid(CWQSForcingsItemKvs::kMap));  // it holds throughout
  it.format = 0;
  root.wqsForcings->at(1).format = CWQSForcingsItemKvs::kTimeSeries;
  root.wqsForcings->at(1).file.fileName = path;
  write(0, 0, 1, 100201, 0, 2);
  EXPECT_THAT(faults(*root.wqsForcings, PageId::ecoForcings), ElementsAre(invalid()));  // not a temperature
  write(0, 0, 1, 100006, 0, 2);
  EXPECT_THAT(faults(*root.wqsForcings, PageId::ecoForcings), IsEmpty());
}

TEST_F(GivenValues, InitialConditionsGoByTheIds) {
  CWQSInitialConditionsItemKvs& item = *root.wqsInitialConditions->Find(2, 2).item;
  item.format = CWQSInitialConditionsItemKvs::kMap;
  item.file.fileName = "/case/i.tsb2";
  EXPECT_EQ(root.wqsInitialConditions->Find(2, 2).declaration->symbol, "OXY");
  EXPECT_EQ(root.wqsInitialConditions->Find(3, 1).item, nullptr);
  EXPECT_EQ(root.wqsInitialConditions->Find(1, 3).declaration, nullptr);
  root.bathymetry->SetNoAreas(3);
  root.bathymetry->SetNoAreas(2);
  const std::string text = savedText(*root.wqsInitialConditions);
  EXPECT_EQ(text,
            "INITIAL_CONDITIONS {\n"
            "    STATE_VARIABLE_3 {\n"
            "        AREA_1 {\n"
            "            Data_Format 0\n"
            "            Constant_Value 1.5\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "        AREA_2 {\n"
            "            Data_Format 0\n"
            "            Constant_Value 1.5\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "    STATE_VARIABLE_7 {\n"
            "        AREA_1 {\n"
            "            Data_Format 0\n"
            "            Constant_Value 8.0\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "        AREA_2 {\n"
            "            Data_Format 1\n"
            "            Constant_Value 8.0\n"
            "            File_Name (file)\"i.tsb2\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "}\n");
  root.wqsInitialConditions->Rebuild();
  test::load(*root.wqsInitialConditions, text);
  EXPECT_EQ(savedText(*root.wqsInitialConditions), text);
}

TEST_F(GivenValues, ANewAreaBeginsWithTheDefaults) {
  root.wqsInitialConditions->at(1).at(1).value = 3;
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(root.wqsInitialConditions->at(1).at(1).value, 3);
  EXPECT_EQ(root.wqsInitialConditions->at(1).at(3).value, 1.5);
  EXPECT_EQ(root.wqsInitialConditions->at(2).at(3).value, 8);
}

TEST_F(GivenValues, ChecksOfInitialConditions) {
  constexpr PageId kPage = PageId::ecoInitialConditions;
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage), IsEmpty());
  root.wqsInitialConditions->at(1).at(2).value = 10.5;
  root.wqsInitialConditions->at(2).at(1).value = -1;
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage),
              ElementsAre("PHY: Area 2: Value Out of Range", "OXY: Area 1: Value Out of Range"));
  CWQSInitialConditionsItemKvs& item = root.wqsInitialConditions->at(1).at(2);
  root.wqsInitialConditions->at(2).at(1).value = 0;
  item.format = CWQSInitialConditionsItemKvs::kMap;
  item.file.fileName = path;
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage), ElementsAre(invalid()));
  write(12, 10);
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage), ElementsAre(invalid()));  // that of Area 1
  write(6, 4);
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage), IsEmpty());
  write(6, 4, 1, 100006);
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage), ElementsAre(invalid()));
  test::define(root, folder, test::kModelWithoutLimits);
  EXPECT_THAT(faults(*root.wqsInitialConditions, kPage),
              ElementsAre("ANY: Area 1: Value Out of Range", "ANY: Area 2: Value Out of Range"));
}

TEST_F(GivenValues, HotStartIsReadInAHotModelOnly) {
  const std::string_view text =
      "STARTING_CONDITIONS { Hot_Start #true; AREA_2 { DATA_FILE { File_Name (file)\"h.tsb2\" } } }";
  CWQSStartingConditionsKvs& it = *root.wqsStartingConditions;
  EXPECT_FALSE(it.hotStart);
  test::load(it, text);
  EXPECT_FALSE(it.hotStart);
  root.bathymetry->hotStart = 1;
  test::load(it, text);
  EXPECT_TRUE(it.hotStart);
  EXPECT_EQ(savedText(it),
            "STARTING_CONDITIONS {\n"
            "    Hot_Start #true\n"
            "    AREA_1 {\n"
            "        DATA_FILE {\n"
            "            File_Name (file)\"\"\n"
            "        }\n"
            "    }\n"
            "    AREA_2 {\n"
            "        DATA_FILE {\n"
            "            File_Name (file)\"h.tsb2\"\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(GivenValues, AHotFileHasAnItemForEachStateVariable) {
  root.bathymetry->SetNoAreas(1);
  CWQSStartingConditionsKvs& it = *root.wqsStartingConditions;
  it.at(1).file = path;
  const auto texts = [&] { return faults(it, PageId::ecoStartingConditions, Severity::dependedUpon); };
  write(12, 10, 3, 100201, 2);
  EXPECT_THAT(texts(), IsEmpty());  // cold
  it.hotStart = true;
  EXPECT_THAT(texts(), IsEmpty());  // transported or not
  for (const int items : {2, 4}) {
    write(12, 10, items, 100201, 2);
    EXPECT_THAT(texts(), ElementsAre(invalid())) << items;
  }
  write(12, 10, 3, 100201, 0);
  EXPECT_THAT(texts(), ElementsAre(invalid()));
  write(11, 10, 3, 100201, 2);
  EXPECT_THAT(texts(), ElementsAre(invalid()));
  it.at(1).file = "";
  EXPECT_THAT(texts(), ElementsAre("Data file  \" \"  is not valid"));
  it.hotStart = false;
  EXPECT_THAT(texts(), IsEmpty());
}

TEST_F(GivenValues, WhatIsSetByItsPath) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "it has no such model";
  root.moduleSelection->simulationType = module::kEcological;
  const std::string document = folder.file("s.v27");
  const auto set = [&](std::string_view at, std::string_view keyword) {
    const KvsHandle given = test::fileOf(keyword);
    PathAccess access{PathAccess::What::set, nullptr, &given->tree().root(), &document};
    return root.AccessPath(at, access) && !access.isWrittenOnly;
  };
  EXPECT_TRUE(set("BIO_RIG_MODULE/CONSTANTS/CONSTANT_1/Value", "Value 3.5"));
  EXPECT_EQ(root.wqsConstants->at(1).value, 3.5);
  EXPECT_TRUE(set("BIO_RIG_MODULE/CONSTANTS/CONSTANT_3/AREA_2/File_Name", "File_Name (file)\"x.tsb2\""));
  EXPECT_EQ(root.wqsConstants->at(3).File(2)->fileName.text(), "x.tsb2");
  EXPECT_FALSE(set("BIO_RIG_MODULE/CONSTANTS/No_Of_Constants", "No_Of_Constants 1"));
  EXPECT_FALSE(set("BIO_RIG_MODULE/CONSTANTS/CONSTANT_5/Value", "Value 1"));
  EXPECT_FALSE(set("BIO_RIG_MODULE/STATE_VARIABLES/STATE_VARIABLE_3/ID", "ID 1"));
  EXPECT_TRUE(
      set("BIO_RIG_MODULE/INITIAL_CONDITIONS/STATE_VARIABLE_7/AREA_2/Constant_Value", "Constant_Value 9.0"));
  EXPECT_EQ(root.wqsInitialConditions->at(2).at(2).value, 9);
  EXPECT_FALSE(
      set("BIO_RIG_MODULE/INITIAL_CONDITIONS/STATE_VARIABLE_5/AREA_2/Constant_Value", "Constant_Value 9.0"));
  // Another model is read at once.
  folder.write("bed.biorig", test::kModelOfTheBed);
  EXPECT_TRUE(set("BIO_RIG_MODULE/MODEL_DEFINITION/Model_Definition_File",
                  "Model_Definition_File (file)\"bed.biorig\""));
  EXPECT_EQ(root.wqsConstants->GetCount(), 0);
  EXPECT_TRUE(root.KnowsSection("BIO_RIG_MODULE/STATE_VARIABLES/STATE_VARIABLE_3"));
  EXPECT_FALSE(root.KnowsSection("BIO_RIG_MODULE/CONSTANTS/CONSTANT_1"));
}

}  // namespace ecology_given_values_test
}  // namespace gridbay
