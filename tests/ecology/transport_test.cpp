// The transported state variables at boundaries, sources and all over the surface, their dispersion,
// deposition and mass budgets.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/source_sink.h"
#include "ecology/boundary.h"
#include "ecology/deposition.h"
#include "ecology/dispersion.h"
#include "ecology/evaporation.h"
#include "ecology/infiltration.h"
#include "ecology/mass_budget.h"
#include "ecology/precipitation.h"
#include "ecology/source_sink.h"
#include "platform/units/units.h"
#include "tests/ecology/carried_model.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"

namespace gridbay {
namespace ecology_transport_test {

using test::load;
using test::savedText;
using Texts = std::vector<std::string>;
using Values = std::vector<double>;
using Items = std::vector<std::uint32_t>;

class WqsTransport : public ::testing::Test {
 protected:
  WqsTransport() {
    root.boundary->SetNoBoundaries(2);
    root.boundary->GetItem(1)->Set(0, 5, 0, 9);
    root.sourceSink->SetNoSources(1);
    root.bathymetry->GetArea(1)->dy = 30;
    test::define(root, folder, test::kCarriedModel);
  }
  // A file that covers the simulation, with items of these quantities in their base units.
  void write(const std::vector<int>& quantities, std::vector<TsbGridAxis> axes = {}, std::size_t steps = 2) {
    TsbDefinition definition;
    definition.time.step = 3000;
    definition.time.count = steps;
    definition.axes = std::move(axes);
    for (const int quantity : quantities) {
      const QunUnit* unit = qunBaseUnit(quantity);
      definition.items.push_back({"Item", quantity, unit == nullptr ? "" : std::string(unit->text)});
    }
    test::writeFile(path, definition);
  }
  // The texts of an object's check, all of one page.
  static Texts faults(CKvsBase& object, PageId page) {
    const ValidationList messages = test::messagesOf(object);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    EXPECT_TRUE(test::messagesOf(object, 0).empty() || page == PageId::ecoPrecipitation ||
                page == PageId::ecoEvaporation || page == PageId::ecoInfiltration ||
                page == PageId::ecoDispersion);
    return test::textsOf(messages);
  }
  Texts invalid() const { return {"Data file  \" " + path + "\"  is not valid"}; }
  static bool set(CKvsBase& object, std::string_view keywordPath, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess access{PathAccess::What::set, nullptr, &file->tree().root(), &documentPath};
    return object.AccessPath(keywordPath, access);
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  std::string path = folder.file("data.tsb0");
};

TEST_F(WqsTransport, BoundariesInFileOrder) {
  CWQSADBoundaryItemKvs& second = root.wqsAdBoundary->at(2);
  second.format = 2;
  second.constants = {1.0 / 3, 2.5};
  second.file.fileName = "/case/b.tsb1";
  second.file.items = {4, 2};
  const std::string text =
      "AD_BOUNDARY {\n"
      "    BOUNDARY_1 {\n"
      "        Data_Format 0\n"
      "        Constant_Value_1 1.5\n"
      "        Constant_Value_2 8.0\n"
      "        File_Name (file)\"\"\n"
      "        Item_Numbers 1 2\n"
      "    }\n"
      "    BOUNDARY_2 {\n"
      "        Data_Format 2\n"
      "        Constant_Value_1 0.3333333333333333\n"
      "        Constant_Value_2 2.5\n"
      "        File_Name (file)\"b.tsb1\"\n"
      "        Item_Numbers 4 2\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(*root.wqsAdBoundary), text);
  CWQSADBoundaryKvs copy(nullptr);
  copy.CopyFrom(*root.wqsAdBoundary);
  EXPECT_EQ(savedText(copy), text);
  root.wqsAdBoundary->Rebuild();
  load(*root.wqsAdBoundary, text);
  EXPECT_EQ(savedText(*root.wqsAdBoundary), text);
}

TEST_F(WqsTransport, SourcesInFileOrder) {
  const std::string text =
      "AD_SOURCESINK {\n"
      "    SOURCESINK_1 {\n"
      "        Data_Format 1\n"
      "        Constant_Value_1 1.5\n"
      "        Constant_Value_2 0.25\n"
      "        File_Name (file)\"s.tsb0\"\n"
      "        Item_Numbers 3 1\n"
      "    }\n"
      "}\n";
  load(*root.wqsAdSourceSink,
       "AD_SOURCESINK { SOURCESINK_1 { Data_Format 1; Constant_Value_2 0.25; Constant_Value_3 9.0\n"
       "File_Name (file)\"s.tsb0\"; Item_Numbers 3 1 } }");
  EXPECT_EQ(savedText(*root.wqsAdSourceSink), text);
}

TEST_F(WqsTransport, TheSurfaceInFileOrder) {
  const std::string rest =
      "    Constant_Value_1 1.5\n"
      "    Constant_Value_2 8.0\n"
      "    File_Name (file)\"\"\n"
      "    Item_Numbers 1 2\n"
      "}\n";
  EXPECT_EQ(savedText(*root.wqsAdPrecipitation), "PRECIPITATION {\n    Data_Format -1\n" + rest);
  EXPECT_EQ(savedText(*root.wqsAdEvaporation), "EVAPORATION {\n    Data_Format -1\n" + rest);
  EXPECT_EQ(savedText(*root.wqsAdInfiltration), "INFILTRATION {\n    Data_Format -3\n" + rest);
  const std::string text =
      "INFILTRATION {\n"
      "    Data_Format 2\n"
      "    Constant_Value_1 0.5\n"
      "    Constant_Value_2 8.0\n"
      "    File_Name (file)\"i.tsb2\"\n"
      "    Item_Numbers 2 5\n"
      "}\n";
  load(*root.wqsAdInfiltration,
       "INFILTRATION { Data_Format 2; Constant_Value_1 0.5; File_Name (file)\"i.tsb2\"; Item_Numbers 2 5 }");
  EXPECT_EQ(savedText(*root.wqsAdInfiltration), text);
  load(*root.wqsAdInfiltration, "OTHER {}");
  EXPECT_EQ(savedText(*root.wqsAdInfiltration), text);
  CWQSADInfiltrationKvs copy(nullptr);
  EXPECT_EQ(copy.format, -3);
  copy.CopyFrom(*root.wqsAdInfiltration);
  EXPECT_EQ(savedText(copy), text);
  EXPECT_TRUE(copy.SameState(*root.wqsAdInfiltration));
  copy.constants[1] = 7;
  EXPECT_FALSE(copy.SameState(*root.wqsAdInfiltration));
}

TEST_F(WqsTransport, SectionsThatAreMissingArePassedOver) {
  load(*root.wqsAdBoundary, "AD_BOUNDARY { BOUNDARY_2 { Constant_Value_2 6.25 } }");
  EXPECT_EQ(root.wqsAdBoundary->at(1).constants, (Values{1.5, 8}));
  EXPECT_EQ(root.wqsAdBoundary->at(2).constants, (Values{1.5, 6.25}));
  load(*root.wqsAdSourceSink, "AD_SOURCESINK {}");
  load(*root.wqsAdDispersion, "AD_DISPERSION { X_DIRECTION_COEFFICIENTS { Constant_Value 2.0 } }");
  EXPECT_EQ(root.wqsAdDispersion->constantX, 2);
  load(*root.wqsAdDeposition, "AD_DEPOSITION { SurfaceDeposition {} }");
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(WqsTransport, NothingIsCarried) {
  test::define(root, folder, test::kModelOfTheBed);
  const std::string rest =
      "        Data_Format 0\n"
      "        File_Name (file)\"\"\n"
      "        Item_Numbers\n"
      "    }\n";
  EXPECT_EQ(savedText(*root.wqsAdBoundary),
            "AD_BOUNDARY {\n    BOUNDARY_1 {\n" + rest + "    BOUNDARY_2 {\n" + rest + "}\n");
  EXPECT_EQ(root.wqsAdDeposition->GetCount(), 0);
  EXPECT_TRUE(faults(*root.wqsAdBoundary, PageId::ecoBoundary).empty());
}

TEST_F(WqsTransport, FollowersOfBoundariesSourcesAndAreas) {
  root.wqsAdBoundary->at(1).constants = {4, 5};
  root.boundary->SetNoBoundaries(3);
  root.sourceSink->SetNoSources(2);
  EXPECT_EQ(root.wqsAdBoundary->GetCount(), 3);
  EXPECT_EQ(root.wqsAdBoundary->at(1).constants, (Values{4, 5}));
  EXPECT_EQ(root.wqsAdBoundary->at(3).constants, (Values{1.5, 8}));
  EXPECT_EQ(root.wqsAdSourceSink->at(2).constants, (Values{1.5, 8}));
  root.wqsAdDeposition->surface.at(2).at(1).value = 3;
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(root.wqsAdDeposition->surface.at(2).GetCount(), 3);
  EXPECT_EQ(root.wqsAdDeposition->surface.at(2).at(1).value, 3);
  EXPECT_EQ(root.wqsAdDeposition->surface.at(2).at(3).value, 8);
  EXPECT_EQ(root.wqsAdDeposition->soil.at(1).at(2).value, 1.5);
  EXPECT_EQ(root.wqsAdDispersion->filesX.GetCount(), 3);
  EXPECT_EQ(root.wqsAdDispersion->filesY.GetCount(), 3);
  root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(root.wqsAdDeposition->soil.at(1).GetCount(), 1);
}

TEST_F(WqsTransport, AnotherDefinitionMakesAllAnew) {
  const auto give = [](auto& values) {
    values.format = 2;
    values.constants = {4, 5};
    values.file.fileName = "/case/f.tsb2";
  };
  give(root.wqsAdBoundary->at(1));
  give(root.wqsAdSourceSink->at(1));
  give(*root.wqsAdPrecipitation);
  give(*root.wqsAdEvaporation);
  give(*root.wqsAdInfiltration);
  root.wqsAdDeposition->includeSoil = true;
  root.wqsAdDeposition->soil.at(1).at(1).value = 3;
  root.wqsMassBudget->SetCount(1);
  root.wqsMassBudget->GetItem(1)->title = "basin";
  root.wqsMassBudget->GetItem(1)->entries = {0, 1, 1};
  test::define(root, folder, test::kModelWithoutLimits);
  test::define(root, folder, test::kCarriedModel);
  const auto expectNew = [](const auto& values, int format) {
    EXPECT_EQ(values.format, format);
    EXPECT_EQ(values.constants, (Values{1.5, 8}));
    EXPECT_TRUE(values.file.fileName.empty());
    EXPECT_EQ(values.file.items, (Items{1, 2}));
  };
  expectNew(root.wqsAdBoundary->at(1), 0);
  expectNew(root.wqsAdSourceSink->at(1), 0);
  expectNew(*root.wqsAdPrecipitation, -1);
  expectNew(*root.wqsAdEvaporation, -1);
  expectNew(*root.wqsAdInfiltration, -3);
  EXPECT_EQ(root.wqsAdDeposition->soil.at(1).at(1).value, 1.5);
  EXPECT_TRUE(root.wqsAdDeposition->includeSoil);
  EXPECT_EQ(root.wqsMassBudget->GetItem(1)->title, "basin");
  EXPECT_EQ(root.wqsMassBudget->GetItem(1)->entries, EntryFlags{1});
}

TEST_F(WqsTransport, ABadValueOfABoundaryHasAMessageOfItsOwn) {
  root.wqsAdBoundary->at(1).constants = {10.5, -0.5};
  root.wqsAdBoundary->at(2).constants = {10, 20.5};
  EXPECT_EQ(faults(*root.wqsAdBoundary, PageId::ecoBoundary),
            (Texts{"Boundary 1: PHY: Value Out of Range", "Boundary 1: OXY: Value Out of Range",
                   "Boundary 2: OXY: Value Out of Range"}));
  root.wqsAdBoundary->at(1).format = 3;  // which is none
  root.wqsAdBoundary->at(2).constants = {0, 20};
  EXPECT_TRUE(faults(*root.wqsAdBoundary, PageId::ecoBoundary).empty());
}

TEST_F(WqsTransport, BadValuesOfSourcesAndOfTheSurface) {
  root.wqsAdSourceSink->at(1).constants = {-1, 21};
  EXPECT_EQ(faults(*root.wqsAdSourceSink, PageId::ecoSourceSink),
            (Texts{"Source/Sink 1: PHY: Value Out of Range", "Source/Sink 1: OXY: Value Out of Range"}));
  root.wqsAdSourceSink->at(1).format = -1;
  EXPECT_TRUE(faults(*root.wqsAdSourceSink, PageId::ecoSourceSink).empty());
  const auto check = [](auto& values, PageId page) {
    values.format = -1;
    values.constants = {-1, 21};
    EXPECT_EQ(faults(values, page), (Texts{"PHY: Value Out of Range", "OXY: Value Out of Range"}));
    values.format = -3;
    EXPECT_TRUE(faults(values, page).empty());
  };
  check(*root.wqsAdPrecipitation, PageId::ecoPrecipitation);
  check(*root.wqsAdEvaporation, PageId::ecoEvaporation);
  check(*root.wqsAdInfiltration, PageId::ecoInfiltration);
}

TEST_F(WqsTransport, WithoutLimitsNoValueIsInRange) {
  test::define(root, folder, test::kModelWithoutLimits);
  EXPECT_EQ(faults(*root.wqsAdPrecipitation, PageId::ecoPrecipitation), Texts{"ANY: Value Out of Range"});
  EXPECT_EQ(faults(*root.wqsAdSourceSink, PageId::ecoSourceSink),
            Texts{"Source/Sink 1: ANY: Value Out of Range"});
}

TEST_F(WqsTransport, AFileHasAnItemForEachVariable) {
  CWQSADBoundaryItemKvs& boundary = root.wqsAdBoundary->at(1);
  boundary.format = 1;
  boundary.constants = {99, 99};  // not asked
  boundary.file.fileName = path;
  const auto check = [this] { return faults(*root.wqsAdBoundary, PageId::ecoBoundary); };
  EXPECT_EQ(check(), invalid());  // there is none
  write({item::kConcentration, item::kUndefined});
  EXPECT_TRUE(check().empty());
  write({item::kUndefined, item::kTemperature, item::kConcentration});
  EXPECT_EQ(check(), invalid());
  boundary.file.items = {3, 2};  // those that are meant
  EXPECT_TRUE(check().empty());
  boundary.file.items = {3};
  EXPECT_EQ(check(), invalid());
  boundary.file.items = {1, 2};
  write({item::kConcentration, item::kUndefined}, {}, 1);  // it does not cover the simulation
  EXPECT_EQ(check(), invalid());
  boundary.format = 2;
  EXPECT_EQ(check(), invalid());
  write({item::kConcentration, item::kUndefined}, {{5, 0, 30, "m"}});
  EXPECT_TRUE(check().empty());
  write({item::kConcentration, item::kUndefined}, {{6, 0, 30, "m"}});
  EXPECT_EQ(check(), invalid());
  CVdFileSelectorDlg selector;
  boundary.RequestDataFile(selector, 1);
  ASSERT_EQ(selector.requests().size(), 2U);
  EXPECT_EQ(selector.requests()[1]->description(), "OXY");
}

TEST_F(WqsTransport, FilesOfSourcesAndOfTheSurface) {
  CWQSADSourceSinkItemKvs& source = root.wqsAdSourceSink->at(1);
  source.format = 1;
  source.file.fileName = path;
  EXPECT_EQ(faults(*root.wqsAdSourceSink, PageId::ecoSourceSink), invalid());
  write({item::kConcentration, item::kUndefined});
  EXPECT_TRUE(faults(*root.wqsAdSourceSink, PageId::ecoSourceSink).empty());
  const auto check = [this](auto& values, PageId page) {
    values.constants = {99, 99};  // not asked
    values.format = 0;
    values.file.fileName = "";
    EXPECT_EQ(faults(values, page), Texts{"Filename:  is not valid"});
    values.file.fileName = path;
    EXPECT_TRUE(faults(values, page).empty());
    values.format = 2;  // the file is no map
    EXPECT_EQ(faults(values, page), Texts{"Filename: " + path + " is not valid"});
  };
  check(*root.wqsAdPrecipitation, PageId::ecoPrecipitation);
  check(*root.wqsAdEvaporation, PageId::ecoEvaporation);
  check(*root.wqsAdInfiltration, PageId::ecoInfiltration);
  write({item::kConcentration, item::kUndefined}, {{4, 0, 30, "m"}, {3, 0, 30, "m"}}, 1);
  EXPECT_TRUE(faults(*root.wqsAdPrecipitation, PageId::ecoPrecipitation).empty());
}

TEST_F(WqsTransport, ByPath) {
  EXPECT_TRUE(set(*root.wqsAdBoundary, "AD_BOUNDARY/BOUNDARY_2/Constant_Value_2", "Constant_Value_2 3.5"));
  EXPECT_EQ(root.wqsAdBoundary->at(2).constants[1], 3.5);
  EXPECT_TRUE(set(*root.wqsAdBoundary, "AD_BOUNDARY/BOUNDARY_2/Item_Numbers", "Item_Numbers 5 6"));
  EXPECT_EQ(root.wqsAdBoundary->at(2).file.items, (Items{5, 6}));
  EXPECT_FALSE(set(*root.wqsAdBoundary, "AD_BOUNDARY/BOUNDARY_2/Constant_Value_3", "Constant_Value_3 1.0"));
  const std::string areaPath = "AD_DEPOSITION/SoilDeposition/STATE_VARIABLE_7/AREA_1/Constant_Value";
  EXPECT_TRUE(set(*root.wqsAdDeposition, areaPath, "Constant_Value 2.5"));
  EXPECT_EQ(root.wqsAdDeposition->soil.at(2).at(1).value, 2.5);
  EXPECT_FALSE(set(*root.wqsAdDeposition,
                   "AD_DEPOSITION/SoilDeposition/STATE_VARIABLE_2/AREA_1/Constant_Value",
                   "Constant_Value 2.5"));
}

TEST_F(WqsTransport, DispersionInFileOrder) {
  CWQSADDispersionKvs& coefs = *root.wqsAdDispersion;
  coefs.factorX = 1.0 / 3;  // held in full
  coefs.filesY.at(1).file.items = {3};
  const std::string text = savedText(coefs);
  EXPECT_THAT(text, ::testing::HasSubstr("Proportionality_Factor_Xdir 0.3333333333333333\n"));
  coefs.factorX = 1;
  load(coefs, text);
  EXPECT_EQ(savedText(coefs), text);
}

TEST_F(WqsTransport, DispersionIsChecked) {
  CWQSADDispersionKvs& coefs = *root.wqsAdDispersion;
  const auto check = [&] { return faults(coefs, PageId::ecoDispersion); };
  coefs.minimum = 5;
  coefs.maximum = 1;
  EXPECT_TRUE(check().empty());
  coefs.proportional = 1;
  EXPECT_EQ(check(), Texts{"Maximum value must be larger than minimum value"});
  coefs.maximum = 5;
  EXPECT_TRUE(check().empty());
  // In full precision: 30 / 30² fx + 30 / 30² fy.
  root.bathymetry->GetArea(1)->dx = 30;
  coefs.factorX = coefs.factorY = 7.5;
  EXPECT_EQ(check(), Texts{"Dispersion Coefficients : Too much Dispersion"});
  coefs.factorY = 7.4999999999;
  EXPECT_TRUE(check().empty());
  coefs.proportional = 0;
  coefs.formatX = coefs.formatY = 1;
  coefs.filesX.at(1).file.fileName = path;
  coefs.filesY.at(1).file.fileName = path;
  const Texts both{invalid()[0], invalid()[0]};
  EXPECT_EQ(check(), both);
  write({item::kDispersionCoefficient}, {{4, 0, 30, "m"}, {3, 0, 30, "m"}}, 1);
  root.bathymetry->GetArea(1)->noJ = 5;
  root.bathymetry->GetArea(1)->noK = 4;
  EXPECT_EQ(check(), both);
  root.bathymetry->GetArea(1)->noJ = 4;
  root.bathymetry->GetArea(1)->noK = 3;
  EXPECT_TRUE(check().empty());
}

TEST_F(WqsTransport, DepositionInFileOrder) {
  CWQSADDepositionKvs& deposition = *root.wqsAdDeposition;
  deposition.includeSurface = true;
  CWQSADDepositionItemKvs& held = deposition.surface.at(2).at(1);
  held.format = 1;
  held.value = 0.5;
  held.file.fileName = "/case/d.tsb2";
  held.file.items = {4};
  const auto area = [](const std::string& rest) {
    return "            AREA_1 {\n" + rest + "            }\n        }\n";
  };
  const auto constant = [&](const std::string& value) {
    return area("                Data_Format 0\n                Constant_Value " + value +
                "\n                File_Name (file)\"\"\n                Item_Numbers 1\n");
  };
  const std::string text =
      "AD_DEPOSITION {\n"
      "    IncludeSurfaceDeposition #true\n"
      "    SurfaceDeposition {\n"
      "        STATE_VARIABLE_3 {\n" +
      constant("1.5") + "        STATE_VARIABLE_7 {\n" +
      area(
          "                Data_Format 1\n                Constant_Value 0.5\n"
          "                File_Name (file)\"d.tsb2\"\n                Item_Numbers 4\n") +
      "    }\n"
      "    IncludeSoilDeposition #false\n"
      "    SoilDeposition {\n"
      "        STATE_VARIABLE_3 {\n" +
      constant("1.5") + "        STATE_VARIABLE_7 {\n" + constant("8.0") + "    }\n}\n";
  EXPECT_EQ(savedText(deposition), text);
  deposition.Rebuild();
  deposition.includeSurface = false;
  load(deposition, text);
  EXPECT_EQ(savedText(deposition), text);
  CWQSADDepositionKvs other(nullptr);
  other.AssignState(deposition);
  EXPECT_TRUE(other.SameState(deposition));
  other.surface.at(2).at(1).value = 1;
  EXPECT_FALSE(other.SameState(deposition));
  deposition.CopyFrom(other);
  EXPECT_EQ(deposition.surface.at(2).at(1).value, 1);
}

TEST_F(WqsTransport, DepositionIsCheckedWhereItIsIncluded) {
  CWQSADDepositionKvs& deposition = *root.wqsAdDeposition;
  deposition.surface.at(1).at(1).value = 10.5;
  deposition.soil.at(2).at(1).value = -0.5;
  const auto check = [&] { return faults(deposition, PageId::ecoDeposition); };
  EXPECT_TRUE(check().empty());
  deposition.includeSoil = true;
  EXPECT_EQ(check(), Texts{"Soil: OXY: Value Out of Range"});
  deposition.includeSurface = true;
  EXPECT_EQ(check(), (Texts{"Surface: PHY: Value Out of Range", "Soil: OXY: Value Out of Range"}));
  deposition.includeSoil = false;
  CWQSADDepositionItemKvs& held = deposition.surface.at(1).at(1);
  held.format = 1;
  held.file.fileName = path;
  EXPECT_EQ(check(), invalid());
  write({item::kConcentration}, {{4, 0, 30, "m"}, {3, 0, 30, "m"}}, 1);
  EXPECT_TRUE(check().empty());
  write({item::kTemperature}, {{4, 0, 30, "m"}, {3, 0, 30, "m"}}, 1);
  EXPECT_EQ(check(), invalid());
  CVdFileSelectorDlg selector;
  held.RequestDataFile(selector, 1, 1);
  EXPECT_EQ(selector.requests()[0]->description(), "Initial Conditions");
  held.format = 2;  // which is none
  EXPECT_TRUE(check().empty());
}

TEST_F(WqsTransport, MassFilesInFileOrder) {
  EXPECT_EQ(savedText(*root.wqsMassBudget), "MASS_BUDGET {\n    No_Of_Mass_Files 0\n}\n");
  root.wqsMassBudget->SetCount(2);
  EXPECT_EQ(root.wqsMassBudget->GetItem(1)->steps, (USubLine{0, 100, 1}));
  root.wqsMassBudget->GetItem(1)->entries = {0};
  MassFile& file = *root.wqsMassBudget->GetItem(2);
  file.polygon = 2;
  file.steps = {5, 95, 10};
  file.file = "/case/m.tsb0";
  file.title = "Mass";
  file.entries = {1, 0, 1};
  const std::string text =
      "MASS_BUDGET {\n"
      "    No_Of_Mass_Files 2\n"
      "    MASS_FILE_1 {\n"
      "        AssociatedPolygon 1\n"
      "        TRange 0 100 1\n"
      "        FILE_NAME (result)\"\"\n"
      "        Title \"\"\n"
      "        STATE_VARIABLES {\n"
      "            Number_Selected 0\n"
      "        }\n"
      "    }\n"
      "    MASS_FILE_2 {\n"
      "        AssociatedPolygon 2\n"
      "        TRange 5 95 10\n"
      "        FILE_NAME (result)\"m.tsb0\"\n"
      "        Title \"Mass\"\n"
      "        STATE_VARIABLES {\n"
      "            Number_Selected 2\n"
      "            Selected_State_Variables 1 3\n"
      "        }\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(*root.wqsMassBudget), text);
  root.wqsMassBudget->SetCount(0);
  load(*root.wqsMassBudget, text);
  EXPECT_EQ(savedText(*root.wqsMassBudget), text);
  EXPECT_EQ(root.wqsMassBudget->GetItem(2)->entries, (EntryFlags{1, 0, 1}));
  EXPECT_TRUE(model.host.texts.empty());
  load(*root.wqsMassBudget, "MASS_BUDGET { No_Of_Mass_Files 1 }");
  EXPECT_EQ(
      model.host.texts,
      Texts{"Error in the KVS-FILE\nThe number of Mass Budget Polygons does not correspond to the number "
            "specified"});
}

TEST_F(WqsTransport, MassFilesAreChecked) {
  root.massBudget->SetNoPolygons(1);
  root.wqsMassBudget->SetCount(1);
  MassFile& file = *root.wqsMassBudget->GetItem(1);
  file.file = "/case/m.tsb0";
  EXPECT_TRUE(faults(*root.wqsMassBudget, PageId::ecoMassBudget).empty());
  file.polygon = 2;
  file.steps = {0, 101, 1};
  file.entries = {0, 0, 0};
  file.file = "";
  EXPECT_EQ(
      faults(*root.wqsMassBudget, PageId::ecoMassBudget),
      (Texts{"Invalid polygon", "TRange is out of range", "No item selected", "No output file specified"}));
}

}  // namespace ecology_transport_test
}  // namespace gridbay
