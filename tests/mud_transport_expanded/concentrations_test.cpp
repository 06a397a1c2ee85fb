// Concentrations at boundaries and sources, and the dispersion.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/dispersion_coef.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/task_selection.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_expanded_concentrations_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

class ExpandedConcentrations : public ::testing::Test {
 protected:
  ExpandedConcentrations() {
    root.boundary->SetNoBoundaries(2);
    root.boundary->GetItem(1)->Set(0, 5, 0, 9);
    root.boundary->GetItem(2)->Set(0, 5, 3, 9);
    root.sourceSink->SetNoSources(1);
    root.nmtExpTaskSelection->SetCounts(1, 2, true);
  }
  void writeSeries(int items) {
    test::writeSeries(path, {.step = 3000, .count = 2}, 100403, "kg m-3", items);
  }
  static ValidationList messages(CKvsBase& object) { return test::messagesOf(object); }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  std::string path = folder.file("data.tsb0");
  const std::string invalid = "Data file  \" " + path + "\"  is not valid";
};

TEST_F(ExpandedConcentrations, OfABoundaryInTheOrderOfTheList) {
  root.boundary->SetNoBoundaries(1);
  root.nmtExpBoundary->at(1).format = 2;
  root.nmtExpBoundary->at(1).constants = {30, 1.5F, 2.5F};
  root.nmtExpBoundary->at(1).file = "/case/b.tsb1";
  EXPECT_EQ(savedText(*root.nmtExpBoundary),
            "BOUNDARY_CONCENTRATIONS {\n"
            "    BOUNDARY_1 {\n"
            "        Data_Format 2\n"
            "        Constant_Value_1 30.0\n"
            "        Constant_Value_2 1.5\n"
            "        Constant_Value_3 2.5\n"
            "        FILE_NAME (file)\"b.tsb1\"\n"
            "    }\n"
            "}\n");
}

TEST_F(ExpandedConcentrations, OfASourceWithSalinityLast) {
  EXPECT_EQ(savedText(*root.nmtExpSources),
            "SOURCE_CONCENTRATIONS {\n"
            "    SOURCE_SINK_1 {\n"
            "        Data_Format 0\n"
            "        Constant_Value_1 0.01\n"
            "        Constant_Value_2 0.01\n"
            "        Constant_Value_3 20.0\n"
            "        FILE_NAME (file)\"\"\n"
            "    }\n"
            "}\n");
  test::load(*root.nmtExpSources,
             "SOURCE_CONCENTRATIONS { SOURCE_SINK_1 { Constant_Value_1 1.0; Constant_Value_2 2.0;"
             " Constant_Value_3 3.0 } }");
  EXPECT_THAT(root.nmtExpSources->at(1).constants, ElementsAre(3, 1, 2));
  root.nmtExpTaskSelection->SetSalinity(false);
  test::load(*root.nmtExpSources, "SOURCE_CONCENTRATIONS { SOURCE_SINK_1 { Constant_Value_1 8.0 } }");
  EXPECT_THAT(root.nmtExpSources->at(1).constants, ElementsAre(8, 2));
}

TEST_F(ExpandedConcentrations, ThatTheFileLacksAreToldWithOneText) {
  test::load(*root.nmtExpBoundary, "BOUNDARY_CONCENTRATIONS { BOUNDARY_1 {} }");
  test::load(*root.nmtExpSources, "SOURCE_CONCENTRATIONS {}");
  const std::string text =
      "Error in the KVS-FILE\nThe number of AD Source Sink sections does not correspond to the number of "
      "Boundaries";
  EXPECT_EQ(model.host.texts, (Texts{text, text}));
}

TEST_F(ExpandedConcentrations, AFileHasAnItemForEachFraction) {
  CNmtExpBoundaryObjectKvs& boundary = root.nmtExpBoundary->at(1);
  boundary.file = path;
  boundary.format = 1;
  const ValidationList notValid{{PageId::mtExpBoundary, invalid}};
  EXPECT_EQ(messages(*root.nmtExpBoundary), notValid);
  writeSeries(2);  // salinity is not counted
  EXPECT_THAT(messages(*root.nmtExpBoundary), IsEmpty());
  boundary.format = 2;
  EXPECT_EQ(messages(*root.nmtExpBoundary), notValid);
  CNmtExpSourceObjectKvs& source = root.nmtExpSources->at(1);
  source.file = path;
  source.format = 1;
  EXPECT_THAT(messages(*root.nmtExpSources), IsEmpty());
  writeSeries(3);
  EXPECT_EQ(messages(*root.nmtExpSources), (ValidationList{{PageId::mtExpSources, invalid}}));
  source.format = 0;
  EXPECT_THAT(messages(*root.nmtExpSources), IsEmpty());
}

TEST_F(ExpandedConcentrations, Dispersion) {
  root.bathymetry->SetNoAreas(2);
  CNmtExpDispersionCoefKvs& coefs = *root.nmtExpDispersionCoef;
  EXPECT_EQ(coefs.filesY.GetCount(), 2);
  coefs.formatX = 1;
  coefs.filesX.at(1).file.fileName = path;
  coefs.filesX.at(2).file.fileName = path;
  const CMessage notValid{PageId::mtExpDispersionCoef, invalid};
  EXPECT_EQ(messages(coefs), (ValidationList{notValid, notValid}));
  coefs.proportional = 1;
  coefs.minimum = 2;
  coefs.maximum = 1;
  EXPECT_EQ(
      messages(coefs),
      (ValidationList{{PageId::mtExpDispersionCoef, "Maximum value must be larger than minimum value"}}));
  coefs.formatX = 0;
  coefs.maximum = 3;
  root.bathymetry->SetNoAreas(1);
  CBathymetryObjectKvs& area = *root.bathymetry->GetArea(1);
  area.noJ = area.noK = 10;
  area.dx = area.dy = 1;
  EXPECT_EQ(messages(coefs),
            (ValidationList{{PageId::mtExpDispersionCoef, "Dispersion Coefficients : Too much Dispersion"}}));
  test::load(coefs, "DISPERSION_CONDITIONS { X_DIRECTION_COEFFICIENTS {} }");
  EXPECT_EQ(
      model.host.texts,
      Texts{"Error in the KVS-FILE\nThe number of AD Dispertion coefficient sections does not correspond "
            "to the number of sub domaines"});
}

}  // namespace mud_transport_expanded_concentrations_test
}  // namespace gridbay
