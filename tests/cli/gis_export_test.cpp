// What the layers of a GeoPackage say of all that is placed.

#include <filesystem>

#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/result.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/map/map_fixture.h"
#include "tests/support/programs.h"

namespace gridbay {
namespace cli_gis_export_test {

using test::ProgramRun;
using test::runTool;
using ::testing::AllOf;
using ::testing::HasSubstr;
using ::testing::Not;

class GisExport : public test::MapFixture {
 protected:
  void SetUp() override {
    makeTwoAreas();
    if (theEdition.wetlandSweepKit) root().bathymetry->SetNoAreas(1);
  }
  ProgramRun run() {
    const std::string path = folder.file("s." + std::string(theEdition.fileKind));
    EXPECT_TRUE(document.OnSaveDocument(path));
    return runTool({"export", "gis", path, out, "--force"});
  }
  // The attributes of a layer without their types: "number = 1".
  std::string layer(const std::string& name) const {
    std::string text = test::runProgram("ogrinfo", {"-q", out, name}).out;
    for (const std::string type : {" (String)", " (Integer64)", " (Real)"}) {
      for (std::size_t at = 0; (at = text.find(type)) != text.npos;) text.erase(at, type.size());
    }
    return text;
  }
  std::string out = folder.file("o.gpkg");
};

TEST_F(GisExport, BoundariesAndSourcesTellWhatDrivesThem) {
  test::writeSeries(folder.file("tide.tsb0"), {.count = 3}, 100000, "m", 2);
  root().boundary->defaultPosition = 0;
  root().boundary->SetNoBoundaries(3);
  for (int number = 1; number <= 3; ++number)
    root().boundary->at(number).Set(0, 4 * number - 3, 0, 4 * number - 1);
  CNhdBoundaryObjectKvs& constant = root().nhdBoundary->at(1);
  constant.formulation = CNhdBoundaryObjectKvs::kFlux;
  constant.value = 2.1F;
  root().nhdBoundary->at(2).SetDataFormat(CNhdBoundaryObjectKvs::kSineSeries);
  root().nhdBoundary->at(2).range = 0.3F;
  CNhdBoundaryObjectKvs& fromFile = root().nhdBoundary->at(3);
  fromFile.SetDataFormat(CNhdBoundaryObjectKvs::kType0File);
  fromFile.dataFile.fileName = folder.file("tide.tsb0");
  fromFile.dataFile.items = {2};
  root().sourceSink->SetNoSources(2);
  root().sourceSink->at(1).type = CSourceSinkObjectKvs::kPair;
  root().sourceSink->at(1).source = {1, 2};
  root().sourceSink->at(1).sink = {12, 9};
  root().nhdSourceSink->at(1).constantMagnitude = 3.3F;
  root().nhdSourceSink->at(1).constantVelocity = 0.7F;
  root().sourceSink->at(2).source = {3, 3};
  root().nhdSourceSink->at(2).dataFormat = CNhdSourceSinkObjectKvs::kFromFile;
  root().nhdSourceSink->at(2).dataFile.fileName = folder.file("tide.tsb0");
  const ProgramRun exported = run();
  ASSERT_EQ(exported.status, 0) << exported.err;

  const std::string boundaries = layer("open_boundaries");
  EXPECT_THAT(boundaries, AllOf(HasSubstr("driven_by = flux, constant"), HasSubstr("value = 2.1\n"),
                                HasSubstr("unit = m³/s"), HasSubstr("driven_by = level, sine series"),
                                HasSubstr("range = 0.3\n"), HasSubstr("period_s = 43200\n")));
  EXPECT_THAT(boundaries, AllOf(HasSubstr("driven_by = level, file"), HasSubstr("file = tide.tsb0\n"),
                                HasSubstr("items = 2\n"), HasSubstr("item_names = Series 2\n")));
  const std::string sources = layer("sources_and_sinks");
  EXPECT_THAT(sources, AllOf(HasSubstr("kind = source"), HasSubstr("partner_area = 1\n"),
                             HasSubstr("partner_j = 12\n"), HasSubstr("kind = sink"),
                             HasSubstr("partner_k = 2\n"), HasSubstr("discharge_m3_s = 3.3\n"),
                             HasSubstr("velocity_m_s = 0.7\n"), HasSubstr("direction_deg = 0\n")));
  EXPECT_THAT(sources, AllOf(HasSubstr("items = 1; 2\n"), HasSubstr("item_names = Series 1; Series 2\n")));
  EXPECT_THAT(layer("source_sink_pairs"), HasSubstr("discharge_m3_s = 3.3\n"));
  EXPECT_THAT(layer("areas"), HasSubstr("file = a1.tsb2\n"));
}

TEST_F(GisExport, StructuresAreNamedAsOnTheirPages) {
  const std::string projection = "EPSG:32632";
  root().nhdDike->SetCount(1);
  CNhdDikeObjectKvs& dike = root().nhdDike->at(1);
  dike.coordinateType = projection;
  dike.crestLevelSpecification = CNhdDikeObjectKvs::kInSpaceAndTime;
  dike.crestLevelFile = folder.file("crest.tsb1");
  for (const double x : {500100.0, 500200.0}) dike.points.push_back({x, 6000100, 3});
  const auto place = [&projection](LineStructure& line, std::int32_t valve) {
    line.coordinateType = projection;
    line.x = {500100, 500200};
    line.y = {6000100, 6000100};
    line.valve = valve;
  };
  root().nhdWeir->SetCount(1);
  place(root().nhdWeir->at(1), 1);
  root().nhdWeir->at(1).type = CNhdWeirObjectKvs::kFormula2;
  root().nhdCulvert->SetCount(1);
  place(root().nhdCulvert->at(1), 3);
  root().nhdCulvert->at(1).geometryType = CNhdCulvertObjectKvs::kCircular;
  const ProgramRun exported = run();
  ASSERT_EQ(exported.status, 0) << exported.err;
  EXPECT_THAT(layer("dikes"), AllOf(HasSubstr("crest_variation = 3\n"),
                                    HasSubstr("crest_variation_name = In space and time\n"),
                                    HasSubstr("crest_file = crest.tsb1\n"), HasSubstr("crest_item = 1\n")));
  EXPECT_THAT(layer("weirs"),
              AllOf(HasSubstr("type = 3\n"), HasSubstr("type_name = Weir formula 2 (Honma)\n"),
                    HasSubstr("valve_name = Only negative flow\n")));
  EXPECT_THAT(layer("culverts"), AllOf(HasSubstr("geometry = 1\n"), HasSubstr("geometry_name = Circular\n"),
                                       HasSubstr("valve_name = No flow\n")));
}

TEST_F(GisExport, WhatIsWrittenHasItsFileAndSteps) {
  root().nhdResult->outputs.SetCount(1);
  root().nhdResult->outputs.at(1).part = {{1, 5, 1}, {1, 5, 1}};
  root().nhdResult->outputs.at(1).file = folder.file("depth.tsb2");
  root().nhdResult->outputs.at(1).steps = {0, 90, 30};
  const bool hasModule = !theEdition.wetlandSweepKit;
  if (hasModule) {
    root().moduleSelection->simulationType = module::kAdvectionDispersion;
    root().nadResult->outputs.SetCount(1);
    root().nadResult->outputs.at(1).part = {{1, 5, 1}, {1, 5, 1}};
    root().nadResult->outputs.at(1).file = folder.file("salt.tsb2");
    root().nadResult->outputs.at(1).steps = {0, 80, 20};
    root().massBudget->SetNoPolygons(1);
    root().nadMassBudget->SetCount(2);
    for (int number = 1; number <= 2; ++number) {
      MassFile& file = *root().nadMassBudget->GetMassFile(number);
      file.polygon = 1;
      file.title = "Bay " + std::to_string(number);
      file.file = folder.file("bay" + std::to_string(number) + ".tsb0");
      file.steps = {0, 70, 10};
    }
    root().nadBoxSummation->SetCount(1);
    LineOrBox& box = *root().nadBoxSummation->GetLineOrBox(1);
    box.title = "Harbour";
    box.first = {1, 1};
    box.last = {4, 4};
    box.file = folder.file("box.tsb0");
    box.steps = {5, 60, 1};
  }
  const ProgramRun exported = run();
  ASSERT_EQ(exported.status, 0) << exported.err;
  const std::string outputs = layer("output_areas");
  EXPECT_THAT(outputs, AllOf(HasSubstr("file = depth.tsb2\n"), HasSubstr("step_interval = 30\n")));
  if (!hasModule) return;
  EXPECT_THAT(outputs, AllOf(HasSubstr("file = salt.tsb2\n"), HasSubstr("last_step = 80\n")));
  EXPECT_THAT(layer("mass_budgets"),
              AllOf(HasSubstr("titles = Bay 1; Bay 2\n"), HasSubstr("files = bay1.tsb0; bay2.tsb0\n"),
                    HasSubstr("steps = 0 to 70 by 10; 0 to 70 by 10\n")));
  EXPECT_THAT(layer("mass_boxes"), AllOf(HasSubstr("name = Harbour\n"), HasSubstr("file = box.tsb0\n"),
                                         HasSubstr("first_step = 5\n"), HasSubstr("last_step = 60\n")));
}

TEST_F(GisExport, AFileThatIsNotWholeIsToldAndHasAStatusOfItsOwn) {
  root().nhdDike->SetCount(1);
  ProgramRun exported = run();
  EXPECT_EQ(exported.status, 1);
  EXPECT_THAT(exported.err,
              HasSubstr("o.gpkg is not whole. Left out, having no place on the map: Dike 1 (Dikes)"));
  EXPECT_THAT(layer("areas"), HasSubstr("number = 1\n"));
  if (theEdition.wetlandSweepKit) return;
  std::filesystem::remove(folder.file("a2.tsb2"));
  root().nhdDike->SetCount(0);
  root().sourceSink->SetNoSources(1);
  root().sourceSink->at(1).sourceArea = 2;
  exported = run();
  EXPECT_EQ(exported.status, 1);
  EXPECT_THAT(exported.err, AllOf(HasSubstr("a2.tsb2"), HasSubstr("on the map: Area 2; Source 1 (")));
}

TEST_F(GisExport, AFolderThatIsNotThereIsToldInPlainWords) {
  out = folder.file("no/o.gpkg");
  const ProgramRun exported = run();
  EXPECT_EQ(exported.status, 2);
  EXPECT_EQ(exported.err, "cannot write \"" + out + "\": No such file or directory\n");
}

}  // namespace cli_gis_export_test
}  // namespace gridbay
