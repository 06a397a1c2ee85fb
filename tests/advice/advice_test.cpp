// Each rule where it speaks, with its fix, and near that where it must be silent.

#include <fmt/format.h>
#include <gmock/gmock.h>

#include <cmath>
#include <filesystem>
#include <functional>
#include <set>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/source_sink.h"
#include "advice/advisor.h"
#include "advice/rules.h"
#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "ecology/boundary.h"
#include "ecology/precipitation.h"
#include "ecology/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "mud_transport/boundary.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/wave_data.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/waves.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"
#include "setup/dlg_enumerator.h"
#include "setup/edit_history.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/advice/advice_fixture.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advice_advice_test {

using test::AdviceTest;
using ::testing::HasSubstr;

TEST_F(AdviceTest, OnANewOrCleanSetupThereIsNone) {
  EXPECT_TRUE(look().empty());
  CGlobalKvs fresh;
  EXPECT_TRUE(advisor.lookThoroughly(fresh, "").empty());
}

TEST_F(AdviceTest, EachRuleHasANameOfItsOwn) {
  std::set<std::string_view> kinds;
  for (const AdviceRule& rule : adviceRules()) EXPECT_TRUE(kinds.insert(rule.kind).second) << rule.kind;
  EXPECT_EQ(kinds.size(), 13U);
}

TEST_F(AdviceTest, AreasAndTheirFiles) {
  const auto moved = [this](double by, double axesOff = 0) {
    Area area = inner();
    area.easting += by;
    area.axesOff = axesOff;
    write(area, sea);
  };
  const auto own = [this](const char* projection) { model->bathymetry->projection = projection; };
  const auto zone33 = [this] {
    Area area = inner();
    double longitude = 0;
    double latitude = 0;
    CVdMapProjection("UTM-32").Proj2Geo(area.easting, area.northing, &longitude, &latitude);
    area.projection = "UTM-33";
    CVdMapProjection("UTM-33").Geo2Proj(longitude, latitude, &area.easting, &area.northing);
    write(area, sea);
  };
  speaks({
      {"area-position",
       "Area 2 lies at (5,6) of area 1; by its file's coordinates it belongs at (6,6), 90 m away.",
       "Move area 2 to (6,6)",
       [this] {
         model->bathymetry->GetArea(2)->origin = {5, 6};
       }},
      {"area-position", "the nearest point to where its file's coordinates put it, and yet 15 m off",
       "Values of area 2 at points that nest, in inner_nested.tsb2", [=] { moved(15); }},
      {"area-position", "it belongs at (-45,6), 4590 m away. There it does not lie inside area 1.",
       "Coordinates of area 2 by its place in the setup, in inner_placed.tsb2", [=] { moved(-51 * 90); }},
      {"area-position", "There it does not lie inside area 2.", "Move area 3 into area 1",
       [this] {
         write({"third.tsb2", 10, 30, kInner + 6 * 90, kInnerNorth}, sea);
         model->bathymetry->SetNoAreas(3);
         model->bathymetry->GetArea(3)->fileName = folder.file("third.tsb2");
       }},
      {"projection", "There is no projection \"UTM-99\".", "Projection of area 1: WGS 84 / UTM zone 32N",
       [=] { own("UTM-99"); }},
      {"projection", "The setup is in WGS 84 / UTM zone 33N, the file of area 1 in WGS 84 / UTM zone 32N.",
       "Projection of area 1: WGS 84 / UTM zone 32N", [=] { own("UTM-33"); }},
      {"projection",
       "The file of area 2 is in WGS 84 / UTM zone 33N, that of area 1 in WGS 84 / UTM zone 32N.",
       "Values of area 2 in the projection of area 1, in inner_nested.tsb2", zone33},
      {"projection", "The axes of area 2's file begin at 480840, 6100540",
       "Axes of area 2's file from its longitude and latitude, in inner_placed.tsb2", [=] { moved(0, 300); }},
      {"projection", "There is no projection \"UTM-0\", in which weir 1 is given.",
       "Projection of weir 1: WGS 84 / UTM zone 32N",
       [this] {
         weir({480100, 480200}, {6100100, 6100200}).coordinateType = "UTM-0";
       }},
      {"land-value", "No point of area 1 lies below its land value of 6 m",
       "Turn the depths of area 1 to elevations, in outer_turned.tsb2",
       [this] {
         model->boundary->SetNoBoundaries(0);
         write({"outer.tsb2"}, [](int, int) { return 8.0F; });
       }},
      {"land-value", "The highest point of area 1 lies at 3 m, below its land value of 6 m",
       "Land value of 1 m for area 1, in outer_land.tsb2",
       [this] { write({"outer.tsb2"}, [](int j, int) { return j < 15 ? -5.0F : 3.0F; }); }},
  });
  isSilent({
      [=] { moved(5); }, [=] { own("EPSG:32632"); }, [=] { own(""); }, [=] { moved(0, 10); },
      [this] { write({"outer.tsb2"}, sea); },
      [this] {
        model->moduleSelection->hydrodynamicFeatures = 0;  // all of it may be flooded
        write({"outer.tsb2"}, [](int j, int) { return j < 15 ? -5.0F : 3.0F; });
      },
      [this] { model->bathymetry->GetArea(2)->fileName = folder.file("none.tsb2"); },  // a fault
  });
}

TEST_F(AdviceTest, TheRun) {
  const auto depths = [this](float drying, float flooding) {
    model->areaDescription->dryingDepth = drying;
    model->areaDescription->floodingDepth = flooding;
  };
  const auto step = [this](float seconds) { model->simulationPeriod->timeStepInterval = seconds; };
  const auto flow = [this]() -> CNhdBoundaryObjectKvs& { return *model->nhdBoundary->GetItem(1); };
  const auto structures = [](auto& list, int count) {
    list.SetCount(count);
    for (int number = 1; number <= count; ++number) {
      LineStructure& structure = *list.GetItem(number);
      structure.coordinateType = "UTM-32";
      structure.x = {480100, 480200};
      structure.y = {6100100, 6100200};
    }
  };
  speaks({
      {"courant",
       "The Courant number is 70.1 in area 2, 5 m deep; beyond 5 a run is often unstable. A time step of 20 "
       "s would do.",
       "Time step of 20 s", [=] { step(300); }},
      {"courant", "A time step of 20 s would do.", "Time step of 20 s, and a shorter run",
       [=, this] {
         step(300);
         model->simulationPeriod->noPointsInTime = 200'000'001;
         model->simulationPeriod->warmUpPeriod = 200'000'000;
       }},
      {"flood-and-dry", "The flooding depth of 0.2 m is 20 times the drying depth of 0.01 m.",
       "Flooding depth of 0.02 m", [=] { depths(0.01F, 0.2F); }},
      {"warm-up", "The warm-up ends at time step 400, the run at 360.",
       "Warm-up in the first tenth of the run", [this] { model->simulationPeriod->warmUpPeriod = 400; }},
      {"engine", "The time step is 0 s.", "Time step of 15 s", [=] { step(0); }},
      {"engine", "The simulation has 0 time steps.", "100 time steps",
       [this] { model->simulationPeriod->noPointsInTime = 1; }},
      {"engine", "The simulation has 0 time steps.", "240 time steps, up to the last one that is written",
       [this] {
         model->simulationPeriod->noPointsInTime = 1;
         model->nhdResult->outputs.SetCount(1);
         model->nhdResult->outputs.GetItem(1)->steps.last = 240;
       }},
      {"engine", "The time step is 0 s.", "Time step of 10 s",  // with which the run ends as the tide does
       [=, this] {
         writeTide(smooth(7), start());
         step(0);
       }},
      {"engine", "The code of the scheme is 4, which is none of 1, 5, -5, -1.", "Code of the scheme of 1",
       [this] { model->moduleSelection->adScheme = 4; }},
      {"engine", "The formulation of boundary 1 is 7, which is none of 1, 2.", "Formulation of 1",
       [=] { flow().formulation = 7; }},
      {"engine", "The data format of boundary 1 is 6", "Data format of 1", [=] { flow().dataFormat = 6; }},
      {"engine", "The type of output 1 is 9", "Type of 2",
       [this] {
         model->nhdResult->outputs.SetCount(1);
         model->nhdResult->outputs.GetItem(1)->type = 9;
       }},
      {"engine", "The simulation has 0 time steps.", "100 time steps",
       [this] {
         model->simulationPeriod->noPointsInTime = 1;
         model->simulationPeriod->warmUpPeriod = 400;  // which would come to lie behind the run
       }},
      {"engine", "There are 19 outputs.", "The last output out",
       [this] { model->nhdResult->outputs.SetCount(19); }},
      {"engine", "There are 303 polygons.", "The last 3 polygons out",
       [this] { model->massBudget->SetNoPolygons(303); }},
      {"engine", "There are 1002 weirs.", "The last 2 weirs out",
       [=, this] { structures(*model->nhdWeir, 1002); }},
      {"engine", "There are 1001 culverts.", "The last culvert out",
       [=, this] { structures(*model->nhdCulvert, 1001); }},
  });
  isSilent({
      [=] { step(21); },
      [=] { depths(0.05F, 0.2F); },
      [=, this] {
        depths(0.01F, 0.2F);
        model->areaDescription->enableFloodAndDryChecking = 0;
      },
      [this] { model->simulationPeriod->warmUpPeriod = 360; },
      [this] { model->simulationPeriod->noPointsInTime = 2; },
      [=] { flow().formulation = CNhdBoundaryObjectKvs::kFlux; },
      [this] { model->nhdResult->outputs.SetCount(18); },
  });
}

TEST_F(AdviceTest, AShorterTimeStepKeepsThePeriod) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "its file has one area";
  CSimulationPeriodKvs& period = *model->simulationPeriod;
  period.timeStepInterval = 300;
  period.noPointsInTime = 25;
  period.warmUpPeriod = 6;
  model->nhdResult->outputs.SetCount(1);
  USubLine& steps = model->nhdResult->outputs.GetItem(1)->steps;
  steps = {0, 24, 2};
  const DateTime end = period.End();
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].site.area, 2);
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  EXPECT_FLOAT_EQ(period.timeStepInterval, 20);
  EXPECT_EQ(period.noPointsInTime, 24 * 15 + 1);
  EXPECT_EQ(period.warmUpPeriod, 90);
  EXPECT_EQ(steps, (USubLine{0, 360, 30}));
  EXPECT_NEAR(period.End().linear(), end.linear(), 1e-9);
  // Of more time steps than can be counted the run takes as many as can.
  period.timeStepInterval = 300;
  period.noPointsInTime = 200'000'001;
  steps = {10, 200'000'000, 100'000'000};
  ASSERT_TRUE(makeFix(*model, look().at(0).fix, path));
  EXPECT_EQ(period.LastTimeStep(), 2147483646);
  EXPECT_EQ(steps, (USubLine{150, 2147483646, 1'500'000'000}));
}

TEST_F(AdviceTest, Series) {
  const auto with = [](std::vector<float> values, std::size_t at, float value) {
    values[at] = value;
    return values;
  };
  constexpr std::size_t kWhole = 13;  // two hours
  speaks({
      {"series", "tide.tsb0 ends at 1990-01-01 13:30:00, in the run, which ends at 1990-01-01 14:00:00.",
       "End with the series, at 1990-01-01 13:30:00", [=, this] { writeTide(smooth(10), start()); }},
      {"series", "tide.tsb0 begins at 1990-01-01 12:10:00, after the run does at 1990-01-01 12:00:00.",
       "Begin with the series", [=, this] { writeTide(smooth(kWhole), start().plusDays(10.0 / 1440)); }},
      {"series", "tide.tsb0 begins at 1990-01-03 12:00:00, after the run", "Move the run to the series",
       [=, this] { writeTide(smooth(kWhole), start().plusDays(2)); }},
      {"series", "\"Tide\" of", "Fill the gaps, in tide_filled.tsb0",
       [=, this] { writeTide(with(smooth(kWhole), 4, -1e-35F), start()); }},
      {"series", "jumps from", "Smooth 1 value that jumps, in tide_smooth.tsb0",
       [=, this] { writeTide(with(smooth(30), 6, 9.0F), start()); }},
  });
  isSilent({
      [=, this] { writeTide(smooth(kWhole), start()); },
      [=, this] { writeTide(smooth(30), start().plusDays(-0.01)); },
      [=, this] {
        writeTide(smooth(5), start());
        model->nhdBoundary->GetItem(1)->dataFormat = CNhdBoundaryObjectKvs::kConstant;  // not in use
      },
  });
  writeTide(with(with(smooth(kWhole), 4, -1e-35F), 5, -1e-35F), start());
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_THAT(found[0].doubt, HasSubstr("has 2 missing values, the first at 1990-01-01 12:40:00."));
  EXPECT_EQ(found[0].place.thing, "boundary 1");
  // A gap lies on the line between its neighbours.
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  EXPECT_EQ(model->nhdBoundary->GetItem(1)->dataFile.fileName.text(), "tide_filled.tsb0");
  const Result<TsbFile> filled = TsbFile::open(folder.file("tide_filled.tsb0"));
  ASSERT_TRUE(filled) << filled.error();
  std::vector<float> values(kWhole);
  ASSERT_TRUE(filled->readSteps(1, 0, std::span(values)));
  std::vector<float> expected = smooth(kWhole);
  const float third = (expected[6] - expected[3]) / 3;
  expected[4] = expected[3] + third;
  expected[5] = expected[3] + 2 * third;
  for (std::size_t i = 0; i < kWhole; ++i) EXPECT_NEAR(values[i], expected[i], 1e-6) << i;

  // A later run takes what is written with it, and ends when it did.
  clean();
  writeTide(smooth(kWhole), start().plusDays(10.0 / 1440));
  model->nhdResult->outputs.SetCount(1);
  model->nhdResult->outputs.GetItem(1)->steps = {0, 360, 10};
  const DateTime end = model->simulationPeriod->End();
  ASSERT_TRUE(makeFix(*model, look().at(0).fix, path));
  EXPECT_EQ(dateTimeText(start()), "1990-01-01 12:10:00");
  EXPECT_NEAR(model->simulationPeriod->End().linear(), end.linear(), 1e-9);
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->steps, (USubLine{0, 330, 10}));

  // A shorter run takes what is written with it.
  clean();
  writeTide(smooth(10), start());
  model->nhdResult->outputs.SetCount(2);
  model->nhdResult->outputs.GetItem(1)->steps = {0, 360, 10};
  model->nhdResult->outputs.GetItem(2)->steps = {0, 100, 10};
  ASSERT_TRUE(makeFix(*model, look().at(0).fix, path));
  EXPECT_EQ(model->simulationPeriod->LastTimeStep(), 270);
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->steps, (USubLine{0, 270, 10}));
  EXPECT_EQ(model->nhdResult->outputs.GetItem(2)->steps, (USubLine{0, 100, 10}));
  if (theEdition.wetlandSweepKit) return;

  // What a module writes, too.
  clean();
  writeTide(smooth(10), start());
  model->moduleSelection->simulationType = module::kAdvectionDispersion;
  model->nadMassBudget->SetCount(1);
  model->nadMassBudget->GetMassFile(1)->steps = {0, 360, 7};
  const std::vector<Advice> ends = look();
  const auto shorter = std::ranges::find_if(
      ends, [](const Advice& advice) { return advice.fix.name.starts_with("End with the series, at "); });
  ASSERT_NE(shorter, ends.end());
  ASSERT_TRUE(makeFix(*model, shorter->fix, path));
  EXPECT_EQ(model->nadMassBudget->GetMassFile(1)->steps, (USubLine{0, 270, 7}));
}

// Each of them ends in the run where it is in use, and is not spoken of where it is not.
TEST_F(AdviceTest, SeriesOfAllModules) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "it has the flow alone";
  constexpr std::size_t kShort = 10;
  writeTide(smooth(kShort), start());
  const std::string file = folder.file("tide.tsb0");
  struct Case {
    PageId page;
    std::string thing;
    std::string keyword;
    std::function<void()> use;
    std::function<void()> leave;
  };
  const auto runs = [this](std::int32_t code) { model->moduleSelection->simulationType = code; };
  const Case cases[] = {
      {PageId::infiltration, "", "HYDRODYNAMIC_MODULE/INFILTRATION/File_Name",
       [&] {
         model->nhdInfiltration->infiltrationType = CNhdInfiltrationKvs::kNetRate;
         model->nhdInfiltration->infiltrationFormat = CNhdInfiltrationKvs::kVaryingInTime;
         model->nhdInfiltration->netRateFile.fileName = file;
       },
       [&] { model->nhdInfiltration->infiltrationFormat = CNhdInfiltrationKvs::kConstantInTime; }},
      {PageId::waves, "", "HYDRODYNAMIC_MODULE/WAVES/File_Name",
       [&] {
         model->nhdResistance->formulation = CNhdResistanceKvs::kWaveInduced;
         model->nhdResistance->waveFormat = CNhdResistanceKvs::kWaveSeries;
         model->nhdResistance->waveFile.fileName = file;
       },
       [&] { model->nhdResistance->waveFormat = CNhdResistanceKvs::kWaveMap; }},
      {PageId::hdSourceAndSink, "", "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/Precipitation/File_Name",
       [&] {
         model->nhdSourceSink->precipitationKind = CNhdSourceSinkKvs::kTimeSeries;
         model->nhdSourceSink->precipitationFile.fileName = file;
       },
       [&] { model->nhdSourceSink->precipitationKind = CNhdSourceSinkKvs::kConstant; }},
      {PageId::adBoundary, "boundary 1",
       "ADVECTION_DISPERSION_MODULE/BOUNDARY_CONCENTRATIONS/BOUNDARY_1/FILE_NAME",
       [&] {
         runs(module::kAdvectionDispersion);
         model->nadBoundary->GetItem(1)->format = 1;
         model->nadBoundary->GetItem(1)->file = file;
       },
       [&] { runs(module::kHydrodynamic); }},
      {PageId::mtWaveData, "", "MUD_TRANSPORT_MODULE/FORCING_FUNCTIONS/WAVE_DATA/File_Name",
       [&] {
         runs(module::kMudTransport);
         model->nmtTaskSelection->multiFraction = false;
         model->nmtWaveData->description = CNmtWaveDataKvs::kIncluded;
         model->nmtWaveData->input = CNmtWaveDataKvs::kFromFile;
         model->nmtWaveData->file.fileName = file;
       },
       [&] { model->nmtWaveData->input = CNmtWaveDataKvs::kConstant; }},
      {PageId::mtExpSources, "source 1",
       "MUD_TRANSPORT_EXPANDED_MODULE/SOURCE_CONCENTRATIONS/SOURCE_SINK_1/FILE_NAME",
       [&] {
         runs(module::kMudTransportExpanded);
         model->nmtExpSources->GetItem(1)->format = 1;
         model->nmtExpSources->GetItem(1)->file = file;
       },
       [&] { model->nmtExpSources->GetItem(1)->format = 0; }},
      {PageId::mtExpTsvWaves, "",
       "MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/WAVE_DATA/TWOD_Wavefields/File_Name",
       [&] {
         runs(module::kMudTransportExpanded);
         model->nmtExpForcings->includeWaves = 1;
         model->nmtExpWaves->typeOfWaveVariation = CNmtExpWavesKvs::kVarying;
         model->nmtExpTsvWaves->file.fileName = file;
       },
       [&] { model->nmtExpWaves->typeOfWaveVariation = CNmtExpWavesKvs::kConstant; }},
      {PageId::ecoPrecipitation, "", "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS/PRECIPITATION/File_Name",
       [&] {
         runs(module::kEcological);
         model->nhdSourceSink->precipitation = 1;
         model->wqsAdPrecipitation->format = 0;
         model->wqsAdPrecipitation->file.fileName = file;
       },
       [&] { model->wqsAdPrecipitation->format = -1; }},
  };
  for (const Case& each : cases) {
    SCOPED_TRACE(each.keyword);
    clean();
    each.use();
    const std::vector<Advice> found = look();
    const auto ofSeries = std::ranges::find(found, "series", &Advice::kind);
    ASSERT_NE(ofSeries, found.end());
    EXPECT_THAT(ofSeries->doubt, HasSubstr("tide.tsb0 ends at 1990-01-01 13:30:00, in the run"));
    EXPECT_EQ(ofSeries->place.page, each.page);
    EXPECT_EQ(ofSeries->place.thing, each.thing);
    EXPECT_EQ(ofSeries->place.keyword, each.keyword);
    EXPECT_EQ(std::ranges::count(found, "series", &Advice::kind), 1);
    each.leave();
    for (const Advice& advice : look()) EXPECT_NE(advice.kind, "series") << advice.doubt;
  }
}

TEST_F(AdviceTest, NamesOfFiles) {
  const std::string beside = folder.file("fine.tsb2");
  isSilent({[this] {
    std::filesystem::create_directory(folder.file("sub"));
    model->bathymetry->overlandFile = folder.file("sub/fine.tsb2");
    model->nhdResult->outputs.SetCount(1);
    model->nhdResult->outputs.GetItem(1)->file = folder.file("sub/out.tsb2");
  }});
  // A file is copied, under another name where there is another one of its own; a result is written there.
  const test::TemporaryFolder elsewhere;
  elsewhere.write("fine.tsb2", "fine");
  const auto fine = [&] { model->bathymetry->overlandFile = elsewhere.file("fine.tsb2"); };
  const std::string outside = "fine.tsb2 lies outside of the setup's folder.";
  speaks({{"file-name", outside, "Copy fine.tsb2 into the setup's folder", fine}});
  folder.write("fine.tsb2", "other");
  speaks({{"file-name", outside, "Copy fine.tsb2 into the setup's folder as fine_2.tsb2", fine}});
  folder.write("fine.tsb2", "fine");
  speaks({{"file-name", outside, "Take fine.tsb2 of the setup's folder", fine}});
  ASSERT_TRUE(makeFix(*model, {"Copy", {}, {{elsewhere.file("fine.tsb2"), folder.file("copy.tsb2")}}}, path));
  EXPECT_EQ(test::textOf(folder.file("copy.tsb2")), "fine");
  const auto result = [&] {
    model->nhdResult->outputs.SetCount(1);
    model->nhdResult->outputs.GetItem(1)->file = elsewhere.file("fine.tsb2");
  };
  speaks({{"file-name", outside, "Write fine_2.tsb2 in the setup's folder", result}});
  std::filesystem::remove(beside);
  clean();
  test::writeGrid(beside);
  model->bathymetry->overlandFile = "/elsewhere/fine.tsb2";
  std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].fix.name, "Take fine.tsb2 of the setup's folder");
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  EXPECT_EQ(model->bathymetry->overlandFile.absolute(), beside);
  EXPECT_TRUE(look().empty());
  // A setup that was never saved has no folder.
  model->bathymetry->overlandFile = "/elsewhere/fine.tsb2";
  EXPECT_TRUE(advisor.lookThoroughly(*model, "").empty());

  // A name in the folder that is absolute on disk.
  clean();
  const KvsHandle source = test::fileOf(
      "VANE27_NESTED_MODEL {\n    NESTED_MODEL_GLOBALS {\n        BATHYMETRY_SELECTION {\n            "
      "Overland_Filename (file)\"" +
      beside + "\"\n        }\n    }\n}\n");
  found = advisor.lookThoroughly(*model, path, source.get());
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].doubt, beside + " is named absolutely.");
  EXPECT_EQ(
      found[0].fix.settings,
      (std::vector<Setting>{{"NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/Overland_Filename", "fine.tsb2"}}));
}

TEST_F(AdviceTest, OutputsLargerThanTheDisk) {
  const auto big = [this] {
    model->nhdResult->outputs.SetCount(1);
    CNhdResultObjectKvs& output = *model->nhdResult->outputs.GetItem(1);
    output.part = {{0, 999, 1}, {0, 999, 1}};
    output.steps = {0, 360, 1};
  };
  fixesByTool = false;  // which asks the disk itself
  big();
  const double size = model->nhdResult->TotalSizeMB();
  ASSERT_GT(size, 1000);
  advisor.setFreeMegabytes([=, this](const std::string& where) {
    EXPECT_EQ(where, folder.path().string());
    return size / 3;
  });
  speaks({{"output-size", "the disk has room for", "Write less often", big}});
  advisor.setFreeMegabytes([size](const std::string&) { return size; });
  isSilent({big});
  // The disk is that of the output's own folder, or of what there is of it.
  std::filesystem::create_directory(folder.file("there"));
  advisor.setFreeMegabytes([=, this](const std::string& where) {
    EXPECT_EQ(where, folder.file("there"));
    return size / 3;
  });
  const auto elsewhere = [=, this] {
    big();
    model->nhdResult->outputs.GetItem(1)->file = folder.file("there/not yet/out.tsb2");
  };
  speaks({{"output-size", "to " + folder.file("there") + "; the disk has room for", "Write less often",
           elsewhere}});
  advisor.setFreeMegabytes([](const std::string&) { return std::nullopt; });
  isSilent({big});
}

TEST_F(AdviceTest, AFileThatIsWrittenAnewIsReadAnew) {
  EXPECT_TRUE(look().empty());
  Area area = inner();
  area.easting += 90;
  write(area, sea);
  ASSERT_EQ(look().size(), 1U);
  write(inner(), sea);
  EXPECT_TRUE(look().empty());
}

TEST_F(AdviceTest, WhatIsNotReadYetIsNotSpokenOf) {
  model->bathymetry->GetArea(2)->origin = {5, 6};
  EXPECT_TRUE(advisor.look(*model, path).empty());
  EXPECT_FALSE(advisor.isComplete());
  int pieces = 0;
  while (!advisor.read(std::chrono::milliseconds(0)) && pieces < 100) ++pieces;
  EXPECT_GE(pieces, 2);  // a file at a time at most
  EXPECT_TRUE(advisor.isComplete());
  EXPECT_EQ(advisor.look(*model, path).size(), 1U);
  EXPECT_TRUE(advisor.isComplete());
}

TEST_F(AdviceTest, DamagedAndMissingFilesAreLeftToTheCheck) {
  folder.write("outer.tsb2", "no data file");
  folder.write("tide.tsb0", "");
  model->nhdBoundary->GetItem(1)->SetDataFormat(CNhdBoundaryObjectKvs::kType0File);
  model->nhdBoundary->GetItem(1)->dataFile.fileName = folder.file("tide.tsb0");
  EXPECT_TRUE(look().empty());
  test::writeSeries(folder.file("outer.tsb2"), {}, 100000, "m");  // of another shape
  EXPECT_TRUE(look().empty());
  model->boundary->GetItem(1)->Set(-2147483647, 2147483647, 0, 0);
  model->bathymetry->GetArea(2)->origin = {2147483647, -2147483647};
  write({"outer.tsb2"}, coast);
  EXPECT_FALSE(look().empty());
}

TEST_F(AdviceTest, AFixIsMadeWholeOrNotAtAll) {
  const AdviceFix fix{
      "Both",
      {{"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth", "0.03"}, {"NESTED_MODEL_GLOBALS/NONE", "1"}}};
  const Outcome made = makeFix(*model, fix, path);
  ASSERT_FALSE(made);
  EXPECT_THAT(made.error(), HasSubstr("NESTED_MODEL_GLOBALS/NONE"));
  EXPECT_FLOAT_EQ(model->areaDescription->dryingDepth, 0.02F);
  // So with its files: one that is there stays as it is, and one that was made goes.
  const auto file = [this](const char* name) { return folder.file(name); };
  folder.write("a", "a");
  folder.write("there", "there");
  const auto errorOf = [&](std::vector<AdviceFile> files, std::vector<Setting> settings = {}) {
    const Outcome refused = makeFix(*model, {"Files", std::move(settings), std::move(files)}, path);
    return refused ? std::string() : refused.error();
  };
  EXPECT_EQ(errorOf({{file("a"), file("b")}, {file("a"), file("there")}}),
            "There is a file " + file("there") + " already");
  EXPECT_EQ(errorOf({{file("a"), file("b")}, {file("none"), file("c")}}), file("none") + " can't be read");
  EXPECT_THAT(errorOf({{file("a"), file("b"), FilledSeries{}}}), HasSubstr("a"));
  EXPECT_NE(errorOf({{file("a"), file("b")}}, {{"NESTED_MODEL_GLOBALS/NONE", "1"}}), "");
  EXPECT_FALSE(std::filesystem::exists(file("b")));
  EXPECT_EQ(test::textOf(folder.file("there")), "there");
  const Outcome stopped =
      makeFix(*model, {"Files", {}, {{file("a"), file("b")}}}, path, [](double) { return false; });
  ASSERT_FALSE(stopped);
  EXPECT_EQ(stopped.error(), "The fix was stopped");
  EXPECT_FALSE(std::filesystem::exists(file("b")));
}

TEST_F(AdviceTest, OfALargeGridBlocksAreKept) {
  const auto deepAt = [](int j, int k) { return j == 1000 && k == 700 ? -80.0F : -5.0F; };
  Area large{"outer.tsb2", 1201, 90};
  write(large, deepAt);
  model->bathymetry->SetNoAreas(1);
  model->boundary->SetNoBoundaries(0);
  model->sourceSink->SetNoSources(0);
  model->simulationPeriod->timeStepInterval = 20;
  EXPECT_EQ(look().size(), 1U);
  EXPECT_THAT(look()[0].doubt, HasSubstr("in area 1, 80 m deep"));
  EXPECT_EQ(look()[0].site.points, (std::vector<GridPoint>{{1000, 700}}));
}

TEST_F(AdviceTest, TheShippedExamplesAreFreeOfIt) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "they have two areas";
  const std::string examples = std::string(GRIDBAY_TESTS) + "/../examples";
  const auto run = [](const test::ProgramRun& done) { ASSERT_EQ(done.status, 0) << done.out << done.err; };
  const auto tool = [&](const std::vector<std::string>& words) { run(test::runTool(words)); };
  const auto file = [this](const std::string& name) { return folder.file(name); };
  run(test::runProgram(test::programPath("make_estuary"), {folder.path().string()}));
  for (const std::string area : {"estuary", "inlet"}) {
    tool({"convert", "raster", file(area + ".asc"), file(area + ".tsb2"), "--land", "5", "--crs", "UTM-32"});
    tool({"convert", "raster", file(area + "_roughness.asc"), file(area + "_roughness.tsb2"), "--item-type",
          "Manning number", "--crs", "UTM-32"});
  }
  const std::string begin = "2026-03-21 06:00:00";
  for (const auto& [name, type] : {std::pair<std::string, std::string>{"tide", "Water level"},
                                   {"river", "Discharge"},
                                   {"rain", "Rainfall rate"},
                                   {"sea", "Concentration"}})
    tool({"convert", "series", file(name + ".csv"), file(name + ".tsb0"), "--item-type", type, "--start",
          begin, "--time-unit", "min", "--skip-lines", "1"});
  const std::string setup = file("estuary.v27");
  tool({"new", setup, "--area", file("estuary.tsb2"), "--area", file("inlet.tsb2") + "@36,33", "--start",
        begin, "--step", "3", "--steps", "14400"});
  tool({"boundaries", setup, "--detect"});
  run(test::runProgram(examples + "/estuary/flood", {test::toolPath(), setup}));
  EXPECT_EQ(test::runTool({"validate", "--advice", setup}).out, "0 faults\nno advice\n");
  std::filesystem::copy(examples + "/ecology/oxygen.biorig", folder.path());
  for (const std::string name : {"salinity", "mud", "oxygen"}) {
    const std::string carrying = file(name + ".v27");
    std::filesystem::copy(setup, carrying);
    run(test::runProgram(examples + "/estuary/" + name, {test::toolPath(), carrying}));
    EXPECT_EQ(test::runTool({"validate", "--advice", carrying}).out, "0 faults\nno advice\n") << name;
  }
  // A point off is told, and mended.
  const std::string origin = "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/Origin";
  tool({"set", setup, origin + "=35,33"});
  EXPECT_THAT(test::runTool({"validate", "--advice", setup}).out,
              HasSubstr("by its file's coordinates it belongs at (36,33), 90 m away."));
  EXPECT_EQ(test::runTool({"fix", setup, "1"}).out,
            "Move area 2 to (36,33)\n  " + origin + ": 35 33 -> 36 33\n");
  EXPECT_EQ(test::runTool({"validate", "--advice", setup}).out, "0 faults\nno advice\n");
}

}  // namespace advice_advice_test
}  // namespace gridbay
