// The concentrations at boundaries, sources and all over the surface: a constant for each component, or a
// file with an item for each.

#include <gmock/gmock.h>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/evaporation.h"
#include "advection_dispersion/infiltration.h"
#include "advection_dispersion/precipitation.h"
#include "advection_dispersion/source_sink.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "hydrodynamic/source_sink.h"
#include "platform/units/units.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_concentrations_test {

using test::savedText;
using Texts = std::vector<std::string>;

class Concentrations : public ::testing::Test {
 protected:
  Concentrations() {
    root.boundary->SetNoBoundaries(2);
    root.boundary->GetItem(1)->Set(0, 5, 0, 9);
    root.boundary->GetItem(2)->Set(0, 5, 3, 9);
    root.sourceSink->SetNoSources(1);
    root.bathymetry->GetArea(1)->dy = 30;
  }
  void setTypes(const std::vector<std::int32_t>& types) {
    root.nadComponent->SetCount(static_cast<int>(types.size()));
    for (std::size_t i = 0; i < types.size(); ++i)
      root.nadComponent->at(static_cast<int>(i) + 1).type = types[i];
  }
  // A file that covers the simulation, with items of these quantities in their base units.
  void write(const std::vector<int>& quantities, std::vector<TsbGridAxis> axes = {}, std::size_t steps = 2) {
    TsbDefinition definition;
    definition.time.step = 3000;
    definition.time.count = steps;
    definition.axes = std::move(axes);
    for (const int quantity : quantities)
      definition.items.push_back({"Item", quantity, std::string(qunBaseUnit(quantity)->text)});
    test::writeFile(path, definition);
  }
  // The texts of an object's check, all of one page.
  static Texts faults(CKvsBase& object, PageId page) {
    const ValidationList messages = test::messagesOf(object);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  Texts invalid() const { return {"Data file  \" " + path + "\"  is not valid"}; }

  static constexpr int kMass = item::kConcentration;
  static constexpr int kHeat = item::kTemperature;

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  std::string path = folder.file("data.tsb0");
};

TEST_F(Concentrations, OfABoundaryInFileOrder) {
  root.nadComponent->SetCount(2);
  CNadBoundaryObjectKvs& second = root.nadBoundary->at(2);
  second.format = 2;
  second.constants = {1.5F, 2.5F};
  second.file = "/case/b.tsb1";
  EXPECT_EQ(savedText(*root.nadBoundary),
            "BOUNDARY_CONCENTRATIONS {\n"
            "    BOUNDARY_1 {\n"
            "        Data_Format 0\n"
            "        Constant_Value_1 0.0\n"
            "        Constant_Value_2 0.0\n"
            "        FILE_NAME (file)\"\"\n"
            "    }\n"
            "    BOUNDARY_2 {\n"
            "        Data_Format 2\n"
            "        Constant_Value_1 1.5\n"
            "        Constant_Value_2 2.5\n"
            "        FILE_NAME (file)\"b.tsb1\"\n"
            "    }\n"
            "}\n");
}

TEST_F(Concentrations, OfASourceInFileOrder) {
  EXPECT_EQ(savedText(*root.nadSourceSink),
            "SOURCE_CONCENTRATIONS {\n"
            "    SOURCE_SINK_1 {\n"
            "        Data_Format 0\n"
            "        Constant_Value_1 0.0\n"
            "        FILE_NAME (file)\"\"\n"
            "    }\n"
            "}\n");
}

TEST_F(Concentrations, OfTheSurfaceInFileOrder) {
  const std::string rest =
      "    Constant_Value_1 0.0\n"
      "    FILE_NAME (file)\"\"\n"
      "}\n";
  EXPECT_EQ(savedText(*root.nadPrecipitation), "PRECIPITATION_CONCENTRATIONS {\n    Data_Format -1\n" + rest);
  EXPECT_EQ(savedText(*root.nadEvaporation), "EVAPORATION_CONCENTRATIONS {\n    Data_Format -1\n" + rest);
  EXPECT_EQ(savedText(*root.nadInfiltration), "INFILTRATION_CONCENTRATIONS {\n    Data_Format -3\n" + rest);
}

TEST_F(Concentrations, FollowTheComponents) {
  root.nadBoundary->at(1).constants = {7};
  root.nadSourceSink->at(1).constants = {8};
  root.nadPrecipitation->constants = {9};
  root.nadComponent->SetCount(3);
  const std::vector<float> zeros{0, 0, 0};
  EXPECT_EQ(root.nadBoundary->at(1).constants, (std::vector<float>{7, 0, 0}));
  EXPECT_EQ(root.nadBoundary->at(2).constants, zeros);
  EXPECT_EQ(root.nadSourceSink->at(1).constants, (std::vector<float>{8, 0, 0}));
  EXPECT_EQ(root.nadPrecipitation->constants, (std::vector<float>{9, 0, 0}));
  EXPECT_EQ(root.nadEvaporation->constants, zeros);
  EXPECT_EQ(root.nadInfiltration->constants, zeros);
  EXPECT_THAT(savedText(*root.nadBoundary), ::testing::HasSubstr("Constant_Value_3 0.0"));
  root.nadComponent->SetCount(1);
  EXPECT_EQ(root.nadBoundary->at(1).constants, std::vector<float>{7});
  root.nadBoundary->at(1).SetNoConstants(-1);
  EXPECT_EQ(root.nadBoundary->at(1).constants, std::vector<float>{7});
}

TEST_F(Concentrations, ANewPlaceHasAConstantForEachComponent) {
  root.nadComponent->SetCount(3);
  root.boundary->SetNoBoundaries(4);
  root.sourceSink->SetNoSources(2);
  EXPECT_EQ(root.nadBoundary->GetCount(), 4);
  EXPECT_EQ(root.nadBoundary->at(4).constants.size(), 3U);
  EXPECT_EQ(root.nadSourceSink->at(2).constants.size(), 3U);
  root.boundary->SetNoBoundaries(1);
  EXPECT_EQ(root.nadBoundary->GetCount(), 1);
}

TEST_F(Concentrations, AreReadBack) {
  root.nadComponent->SetCount(2);
  test::load(*root.nadBoundary,
             "BOUNDARY_CONCENTRATIONS {\n BOUNDARY_1 { Constant_Value_2 4.0; Constant_Value_3 5.0 }\n"
             " BOUNDARY_2 { Data_Format 1; FILE_NAME (file)\"x.tsb0\" } }");
  EXPECT_EQ(root.nadBoundary->at(1).constants, (std::vector<float>{0, 4}));
  EXPECT_EQ(root.nadBoundary->at(1).format, 0);
  EXPECT_EQ(root.nadBoundary->at(2).format, 1);
  EXPECT_EQ(root.nadBoundary->at(2).file.text(), "x.tsb0");
  EXPECT_TRUE(model.host.texts.empty());
  const std::string text = savedText(*root.nadBoundary);
  root.nadBoundary->at(1).constants = {1, 1};
  test::load(*root.nadBoundary, text);
  EXPECT_EQ(savedText(*root.nadBoundary), text);
}

TEST_F(Concentrations, SectionsThatAreMissing) {
  test::load(*root.nadBoundary, "BOUNDARY_CONCENTRATIONS {}");
  test::load(*root.nadSourceSink, "SOURCE_CONCENTRATIONS {}");
  test::load(*root.nadPrecipitation, "OTHER {}");
  const std::string boundary =
      "Error in the KVS-FILE\nThe number of AD Boundary sections does not correspond to the number of "
      "Boundaries";
  EXPECT_EQ(model.host.texts,
            (Texts{boundary, boundary,
                   "Error in the KVS-FILE\nThe number of AD Source Sink sections does not correspond to the "
                   "number of Boundaries"}));
  EXPECT_EQ(root.nadPrecipitation->format, -1);
}

TEST_F(Concentrations, ByPath) {
  root.nadComponent->SetCount(2);
  const auto set = [this](std::string_view keyword, std::string_view text) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath;
    PathAccess access{PathAccess::What::set, nullptr, &file->tree().root(), &documentPath};
    return root.nadBoundary->AccessPath("BOUNDARY_CONCENTRATIONS/BOUNDARY_2/" + std::string(keyword), access);
  };
  EXPECT_TRUE(set("Constant_Value_2", "Constant_Value_2 3.5"));
  EXPECT_EQ(root.nadBoundary->at(2).constants[1], 3.5F);
  EXPECT_FALSE(set("Constant_Value_3", "Constant_Value_3 3.5"));
  EXPECT_FALSE(set("Constant_Value_0", "Constant_Value_0 3.5"));
  EXPECT_FALSE(set("Constant_Value_x", "Constant_Value_x 3.5"));
}

TEST_F(Concentrations, AreCopied) {
  root.nadBoundary->at(1).constants = {4};
  root.nadPrecipitation->format = 2;
  CNadBoundaryKvs copy(nullptr);
  copy.CopyFrom(*root.nadBoundary);
  EXPECT_EQ(savedText(copy), savedText(*root.nadBoundary));
  CNadPrecipitationKvs rain(nullptr);
  rain.CopyFrom(*root.nadPrecipitation);
  EXPECT_EQ(savedText(rain), savedText(*root.nadPrecipitation));
  EXPECT_TRUE(rain.SameState(*root.nadPrecipitation));
  rain.constants[0] = 1;
  EXPECT_FALSE(rain.SameState(*root.nadPrecipitation));
}

TEST_F(Concentrations, AFileHasAnItemForEachComponentOfItsQuantity) {
  setTypes({0, 1, 2, -2});
  root.nadBoundary->at(1).format = 1;
  root.nadBoundary->at(1).file = path;
  const auto check = [this] { return faults(*root.nadBoundary, PageId::adBoundary); };
  EXPECT_EQ(check(), invalid());  // there is none
  write({kMass, kMass, kHeat, kHeat});
  EXPECT_TRUE(check().empty());
  write({kMass, kMass, kHeat});
  EXPECT_EQ(check(), invalid());
  write({kMass, kMass, kHeat, kMass});
  EXPECT_EQ(check(), invalid());
  write({kMass, kMass, kHeat, kHeat}, {}, 1);
  EXPECT_EQ(check(), invalid());  // it does not cover the simulation
  EXPECT_TRUE(test::messagesOf(*root.nadBoundary, 0).empty());
  CVdFileSelectorDlg selector;
  root.nadBoundary->at(1).RequestDataFile(selector, 1);
  Texts descriptions;
  for (const auto& request : selector.requests()) descriptions.push_back(request->description());
  EXPECT_EQ(descriptions, (Texts{"Conservative component", "Decaying component", "Dissipating component",
                                 "Exchange component"}));
}

TEST_F(Concentrations, AProfileLiesAlongTheBoundary) {
  root.nadBoundary->at(1).format = 2;
  root.nadBoundary->at(1).file = path;
  const auto check = [this] { return faults(*root.nadBoundary, PageId::adBoundary); };
  write({kMass}, {{5, 0, 30, "m"}});
  EXPECT_TRUE(check().empty());
  root.boundary->GetItem(1)->Set(0, 9, 0, 5);  // the same the other way round
  EXPECT_TRUE(check().empty());
  write({kMass}, {{6, 0, 30, "m"}});
  EXPECT_EQ(check(), invalid());
  write({kMass}, {{5, 0, 20, "m"}});
  EXPECT_EQ(check(), invalid());
  write({kMass});
  EXPECT_EQ(check(), invalid());
  root.nadBoundary->at(1).format = 0;
  EXPECT_TRUE(check().empty());
  root.nadBoundary->at(2).format = 2;  // a diagonal
  root.nadBoundary->at(2).file = path;
  write({kMass}, {{5, 0, 30, "m"}});
  EXPECT_EQ(check(), invalid());
}

TEST_F(Concentrations, HeatOfAPairIsADifference) {
  setTypes({2});
  CNadSourceSinkObjectKvs& source = root.nadSourceSink->at(1);
  source.format = 1;
  source.file = path;
  const auto check = [this] { return faults(*root.nadSourceSink, PageId::adSourceSink); };
  write({kHeat});
  EXPECT_TRUE(check().empty());
  root.sourceSink->GetItem(1)->type = CSourceSinkObjectKvs::kPair;
  EXPECT_EQ(check(), invalid());
  write({item::kTemperatureDifference});
  EXPECT_TRUE(check().empty());
  root.sourceSink->GetItem(1)->type = CSourceSinkObjectKvs::kIsolatedSink;
  EXPECT_EQ(check(), invalid());
  source.format = 2;  // any format above the constant is a file
  EXPECT_EQ(check(), invalid());
  source.format = 0;
  EXPECT_TRUE(check().empty());
}

TEST_F(Concentrations, OfRainAreAskedForWhereItRains) {
  root.nadPrecipitation->format = 0;
  root.nadPrecipitation->file = path;
  const auto check = [this] { return faults(*root.nadPrecipitation, PageId::adPrecipitation); };
  EXPECT_TRUE(check().empty());
  root.nhdSourceSink->precipitation = 2;
  EXPECT_EQ(check(), invalid());
  root.nhdSourceSink->precipitation = 0;
  root.nhdSourceSink->precipitationKind = CNhdSourceSinkKvs::kMap;
  EXPECT_EQ(check(), invalid());
  write({kMass});
  EXPECT_TRUE(check().empty());
  root.nadPrecipitation->format = 2;
  EXPECT_EQ(check(), invalid());
  write({kMass}, {{4, 0, 30, "m"}, {3, 0, 30, "m"}});
  EXPECT_TRUE(check().empty());
  write({kMass}, {{4, 0, 30, "m"}, {3, 0, 30, "m"}}, 1);  // holds throughout
  EXPECT_TRUE(check().empty());
  root.bathymetry->GetArea(1)->noJ = 4;
  root.bathymetry->GetArea(1)->noK = 2;
  root.bathymetry->GetArea(1)->dx = 30;
  EXPECT_EQ(check(), invalid());
  for (const int format : {-3, -1}) {
    root.nadPrecipitation->format = format;
    EXPECT_TRUE(check().empty()) << format;
  }
}

TEST_F(Concentrations, OfEvaporationAndInfiltrationAreAskedForWhereWaterEvaporates) {
  root.nadEvaporation->format = 0;
  root.nadEvaporation->file = path;
  root.nadInfiltration->format = 0;
  root.nadInfiltration->file = path;
  const auto check = [this] {
    const Texts evaporation = faults(*root.nadEvaporation, PageId::adEvaporation);
    EXPECT_EQ(faults(*root.nadInfiltration, PageId::adInfiltration), evaporation);
    return evaporation;
  };
  EXPECT_TRUE(check().empty());
  root.nhdSourceSink->evaporation = 1;
  EXPECT_EQ(check(), invalid());
  root.nhdSourceSink->evaporation = 0;
  root.nhdSourceSink->precipitation = 1;
  EXPECT_TRUE(check().empty());
  root.nhdSourceSink->netPrecipitation = true;
  EXPECT_EQ(check(), invalid());
  root.nhdSourceSink->precipitation = 0;
  EXPECT_TRUE(check().empty());
  root.nhdSourceSink->evaporationKind = CNhdSourceSinkKvs::kTimeSeries;
  EXPECT_EQ(check(), invalid());
  for (const int format : {-3, -1}) {
    root.nadEvaporation->format = root.nadInfiltration->format = format;
    EXPECT_TRUE(check().empty()) << format;
  }
}

}  // namespace advection_dispersion_concentrations_test
}  // namespace gridbay
