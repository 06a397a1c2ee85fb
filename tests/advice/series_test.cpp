// What the fixes of series make: values without gaps and jumps, series and runs that go together.

#include "advice/series_mending.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/wind_conditions.h"
#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"
#include "tests/advice/advice_fixture.h"

namespace gridbay {
namespace advice_series_test {

using ::testing::AllOf;
using ::testing::HasSubstr;

constexpr float kNone = -1e-35F;
constexpr std::size_t kWhole = 13;  // two hours of ten minutes

using Values = std::vector<float>;

class SeriesFixTest : public test::AdviceTest {
 protected:
  static TsbDefinition every10Minutes(std::size_t count, const DateTime& start,
                                      std::vector<TsbItem> items = {{"Tide", item::kWaterLevel, "m"}}) {
    TsbDefinition file;
    file.time.start = *start.parts();
    file.time.unit = "min";
    file.time.step = 10;
    file.time.count = count;
    file.items = std::move(items);
    return file;
  }
  // Each item with its values in order, step by step.
  std::string write(const std::string& name, const TsbDefinition& file, const std::vector<Values>& items) {
    Result<TsbWriter> writer = TsbWriter::create(folder.file(name), file);
    EXPECT_TRUE(writer) << writer.error();
    const std::size_t points = file.pointCount();
    for (std::size_t item = 0; item < items.size(); ++item) {
      for (std::size_t step = 0; step < file.time.count; ++step)
        EXPECT_TRUE(writer->write(item + 1, step, std::span(items[item]).subspan(step * points, points)));
    }
    EXPECT_TRUE(writer->commit());
    return folder.file(name);
  }
  TsbDefinition definitionOf(const std::string& name) const {
    const Result<TsbFile> file = TsbFile::open(folder.file(name));
    EXPECT_TRUE(file) << file.error();
    return file ? file->definition() : TsbDefinition();
  }
  Values read(const std::string& name, std::size_t item = 1) const {
    const Result<TsbFile> file = TsbFile::open(folder.file(name));
    if (!file) return {};
    Values values(file->definition().pointCount() * file->definition().time.count);
    EXPECT_TRUE(file->readSteps(item, 0, std::span(values)));
    return values;
  }
  void drive(const std::string& file, std::int32_t format = CNhdBoundaryObjectKvs::kType0File) {
    model->nhdBoundary->GetItem(1)->SetDataFormat(format);
    model->nhdBoundary->GetItem(1)->dataFile.fileName = file;
  }
  // Makes the first fix; the others are those of the same kind.
  void fixFirst() {
    const std::vector<Advice> found = look();
    ASSERT_FALSE(found.empty());
    const Outcome made = makeFix(*model, found[0].fix, path);
    ASSERT_TRUE(made) << made.error();
  }
  void expectNear(const Values& values, const Values& expected) {
    ASSERT_EQ(values.size(), expected.size());
    for (std::size_t i = 0; i < values.size(); ++i) EXPECT_NEAR(values[i], expected[i], 1e-5) << i;
  }
  void leavesNothing(const std::string& from, FileMaking making, const std::string& error,
                     const FileProgress& progress = {}) {
    const std::string to = folder.file("made.tsb0");
    const Outcome made = makeFix(*model, {"Make", {}, {{from, to, std::move(making)}}}, path, progress);
    ASSERT_FALSE(made);
    EXPECT_THAT(made.error(), HasSubstr(error));
    for (const auto& entry : std::filesystem::directory_iterator(folder.path()))
      EXPECT_THAT(entry.path().filename().string(), ::testing::Not(HasSubstr("made"))) << error;
  }
};

Values with(Values values, std::vector<std::pair<std::size_t, float>> others) {
  for (const auto& [at, value] : others) values[at] = value;
  return values;
}
Values raised(Values values, std::size_t from, float by) {
  for (std::size_t i = from; i < values.size(); ++i) values[i] += by;
  return values;
}

TEST_F(SeriesFixTest, Jumps) {
  const Values tide = smooth(60);
  const auto writes = [this](Values values) {
    return [this, values = std::move(values)] { writeTide(values, start()); };
  };
  Values steps(30, 0);
  speaks({
      {"series", "jumps from 0.4794 to 9 m between", "Smooth 1 value that jumps, in tide_smooth.tsb0",
       writes(with(tide, {{6 + 1, 9.0F}}))},
      // A smaller one, once the greater is away.
      {"series", "jumps", "Smooth 4 values that jump, in tide_smooth.tsb0",
       writes(with(tide, {{7, 900.0F}, {20, -9.0F}, {21, -9.0F}, {40, 9.0F}}))},
      {"series", "jumps", "Smooth 4 values that jump, in tide_smooth.tsb0", writes(raised(steps, 15, 1))},
      {"series", "jumps", "Smooth 4 values that jump, in tide_smooth.tsb0", writes(raised(tide, 15, 40))},
  });
  // By the line between the neighbours; the others stay.
  writeTide(with(tide, {{20, 9.0F}, {21, 8.0F}}), start());
  fixFirst();
  EXPECT_EQ(model->nhdBoundary->GetItem(1)->dataFile.fileName.text(), "tide_smooth.tsb0");
  const float third = (tide[22] - tide[19]) / 3;
  expectNear(read("tide_smooth.tsb0"), with(tide, {{20, tide[19] + third}, {21, tide[19] + 2 * third}}));
  EXPECT_THAT(definitionOf("tide_smooth.tsb0").history, HasSubstr("jumps taken out"));
  EXPECT_EQ(read("tide.tsb0"), with(tide, {{20, 9.0F}, {21, 8.0F}}));
  // Over several steps where it stays.
  clean();
  writeTide(raised(steps, 15, 1), start());
  fixFirst();
  const Values way = read("tide_smooth_2.tsb0");
  expectNear({way.begin() + 12, way.begin() + 20}, {0, 0.2F, 0.4F, 0.6F, 0.8F, 1, 1, 1});
  // Any mess comes to an end.
  clean();
  for (unsigned seed = 1; seed <= 300; ++seed) {
    unsigned state = seed;
    std::vector<double> mess(10 + seed % 90);
    for (double& value : mess) {
      state = state * 1664525U + 1013904223U;
      value = (state >> 28U) % (seed % 7 + 2) * ((state >> 24U) % 16 == 0 ? 50.0 : 1.0);
    }
    const bool jumps = greatestJump(mess).has_value();
    EXPECT_EQ(takeOutJumps(mess) > 0, jumps) << seed;
    EXPECT_FALSE(greatestJump(mess)) << seed;
  }
  // A rating curve goes on by levels.
  TsbDefinition curve = every10Minutes(kWhole, start(), {{"Flow", item::kDischarge, "m3 s-1"}});
  curve.time.type = TsbTimeAxisType::relative;
  curve.time.unit = "m";
  for (std::size_t i = 0; i < kWhole; ++i) curve.time.values.push_back(static_cast<double>(i));
  drive(write("curve.tsb0", curve, {with(Values(kWhole, 0), {{12, 50.0F}})}),
        CNhdBoundaryObjectKvs::kRatingCurve);
  for (const Advice& advice : look()) EXPECT_NE(advice.kind, "series") << advice.doubt;
}

// With gaps, in several items, and for all that name the file.
TEST_F(SeriesFixTest, JumpsOfAFileThatSeveralTake) {
  const Values tide = smooth(40);
  const TsbDefinition both =
      every10Minutes(40, start(), {{"North", item::kWaterLevel, "m"}, {"South", item::kWaterLevel, "m"}});
  const std::string file =
      write("both.tsb0", both, {with(tide, {{8, 9.0F}}), with(tide, {{30, -9.0F}, {5, kNone}})});
  model->boundary->SetNoBoundaries(2);
  model->boundary->GetItem(2)->Set(0, 0, 14, 0);
  model->boundary->GetItem(1)->Set(0, 2, 0, 30);
  for (int number : {1, 2}) {
    model->nhdBoundary->GetItem(number)->SetDataFormat(CNhdBoundaryObjectKvs::kType0File);
    model->nhdBoundary->GetItem(number)->dataFile.fileName = file;
    model->nhdBoundary->GetItem(number)->dataFile.items = {static_cast<std::uint32_t>(number)};
  }
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 3U);
  EXPECT_EQ(found[0].fix.name, "Smooth 2 values that jump and fill the gaps, in both_smooth.tsb0");
  EXPECT_EQ(found[1].fix.name, "Fill the gaps, in both_filled.tsb0");
  fixFirst();
  EXPECT_TRUE(look().empty());
  for (int number : {1, 2})
    EXPECT_EQ(model->nhdBoundary->GetItem(number)->dataFile.fileName.text(), "both_smooth.tsb0");
  expectNear(read("both_smooth.tsb0", 1), with(tide, {{8, (tide[7] + tide[9]) / 2}}));
  expectNear(read("both_smooth.tsb0", 2),
             with(tide, {{5, (tide[4] + tide[6]) / 2}, {30, (tide[29] + tide[31]) / 2}}));
}

TEST_F(SeriesFixTest, GapsOfProfilesAndDirections) {
  // Of the points one has a gap, one no value; so has all of an item.
  TsbDefinition profile = every10Minutes(kWhole, start(), {{"Level", item::kWaterLevel, "m"}});
  profile.axes = {{31, 0, 90, "m"}};
  Values levels;
  for (std::size_t step = 0; step < kWhole; ++step) {
    for (std::size_t point = 0; point < 31; ++point)
      levels.push_back(point == 9 || (point == 4 && step > 2 && step < 5)
                           ? kNone
                           : static_cast<float>(step) / 10 + static_cast<float>(point));
  }
  const auto drives = [&] {
    drive(write("line.tsb1", profile, {levels}), CNhdBoundaryObjectKvs::kType1File);
  };
  speaks({{"series", "has 15 missing values", "Fill the gaps, in line_filled.tsb1", drives}});
  if (theEdition.wetlandSweepKit) drives();
  fixFirst();
  const Values filled = read("line_filled.tsb1");
  for (std::size_t step = 0; step < kWhole; ++step) {
    for (std::size_t point = 0; point < 31; ++point)
      EXPECT_NEAR(filled[step * 31 + point],
                  static_cast<float>(step) / 10 + static_cast<float>(point == 9 ? 8 : point), 1e-5);
  }
  speaks({{"series", "has 403 missing values", "Fill the gaps, with 0 for \"Level\", in line_filled_2.tsb1",
           [&] {
             drive(write("line.tsb1", profile, {Values(levels.size(), kNone)}),
                   CNhdBoundaryObjectKvs::kType1File);
           }}});
  clean();
  drive(folder.file("line.tsb1"), CNhdBoundaryObjectKvs::kType1File);
  fixFirst();
  EXPECT_EQ(read("line_filled_2.tsb1"), Values(levels.size(), 0));
  // With a value for "missing" that comes on a line.
  TsbItem zero{"Tide", item::kWaterLevel, "m"};
  zero.deleteValue = 0;
  speaks({{"series", "has 1 missing value,", "Fill the gaps, in zero_filled.tsb0", [&] {
             drive(write("zero.tsb0", every10Minutes(kWhole, start(), {zero}),
                         {{-6, -5, -4, -3, -2, -1, 0, 1, 2, 3, 4, 5, 6}}));
           }}});

  // Between 350 and 10 degrees lies north.
  const std::vector<TsbItem> wind{{"Speed", item::kWindVelocity, "m s-1"},
                                  {"Direction", item::kWindDirection, "degree"}};
  const auto blows = [&](Values directions) {
    return [&, directions = std::move(directions)] {
      Values speeds(directions.size(), 10);
      const std::string file =
          write("wind.tsb0", every10Minutes(kWhole, start(), wind), {speeds, directions});
      model->windConditions->SetDataFormat(CWindConditionsKvs::kConstantInSpace);
      model->windConditions->windFile.fileName = file;
    };
  };
  if (theEdition.wetlandSweepKit) return;  // which has no wind
  const Values east{90, 90, 350, kNone, kNone, kNone, 10, kNone, 100, 100, 190, kNone, kNone};
  speaks({{"series", "\"Direction\" of", "Fill the gaps, in wind_filled.tsb0", blows(east)}});
  clean();
  blows(east)();
  fixFirst();
  expectNear(read("wind_filled.tsb0", 2), {90, 90, 350, 355, 0, 5, 10, 55, 100, 100, 190, 190, 190});
  std::vector<double> turned{-170, double{kNone}, 170, double{kNone}, -10, double{kNone}, 20};
  TsbTimeAxis time = every10Minutes(turned.size(), start()).time;
  ASSERT_TRUE(fillGaps(turned, wind[1], time));
  EXPECT_THAT(turned, ::testing::ElementsAre(-170, -180, 170, ::testing::AnyOf(80, -100), -10, 5, 20));
  std::vector<double> radians{6.2, double{kNone}, 0.2};
  ASSERT_TRUE(fillGaps(radians, {"Direction", item::kWindDirection, "rad"}, time));
  EXPECT_NEAR(radians[1], 6.2 + (0.2 - 6.2 + 2 * 3.14159265358979) / 2 - 2 * 3.14159265358979, 1e-9);
}

// Of series that may jump a value that no other one comes near, as one that is mistyped.
TEST_F(SeriesFixTest, ValuesThatStandApart) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "no wind";
  const std::vector<TsbItem> wind{{"Speed", item::kWindVelocity, "m s-1"},
                                  {"Direction", item::kWindDirection, "degree"}};
  const Values gusts{3, 4, 12, 5, 3, 0, 14, 6, 5, 5, 4, 3, 3};
  const auto blows = [&](Values speeds) {
    return [&, speeds = std::move(speeds)] {
      const std::string file =
          write("wind.tsb0", every10Minutes(kWhole, start(), wind), {speeds, Values(speeds.size(), 90)});
      model->windConditions->SetDataFormat(CWindConditionsKvs::kConstantInSpace);
      model->windConditions->windFile.fileName = file;
    };
  };
  const char* mended =
      "Put the value that stands apart on the line between its neighbours, in wind_filled.tsb0";
  speaks({{"series", "is 9000 m s-1 at 1990-01-01 12:40:00, far from all its other values", mended,
           blows(with(gusts, {{4, 9000.0F}}))},
          {"series", "is -9999 m s-1 at 1990-01-01 12:00:00", mended, blows(with(gusts, {{0, -9999.0F}}))}});
  isSilent({blows(gusts), blows(with(gusts, {{4, 500.0F}})), blows(Values(kWhole, 3)),
            blows(with(Values(kWhole, 0), {{4, 60.0F}})), blows(with(gusts, {{4, 9000.0F}, {5, 9000.0F}}))});
  clean();
  blows(with(gusts, {{4, 9000.0F}}))();
  fixFirst();
  expectNear(read("wind_filled.tsb0", 1), with(gusts, {{4, 2.5F}}));
  expectNear(read("wind_filled.tsb0", 2), Values(kWhole, 90));
}

TEST_F(SeriesFixTest, ASetupThatWasNeverSaved) {
  const std::filesystem::path before = std::filesystem::current_path();
  std::filesystem::current_path(folder.path());
  path.clear();
  writeTide(with(smooth(kWhole), {{4, kNone}}), start());
  fixFirst();
  EXPECT_TRUE(look().empty());
  EXPECT_EQ(model->nhdBoundary->GetItem(1)->dataFile.fileName.absolute(), folder.file("tide_filled.tsb0"));
  std::filesystem::current_path(before);
}

TEST_F(SeriesFixTest, WhatHasNoPartOfTheRun) {
  const auto later = [this](double minutes) { return start().plusDays(minutes / 1440); };
  const auto relative = [&](double first, double step, std::size_t count) {
    TsbDefinition file = every10Minutes(count, start());
    file.time.type = TsbTimeAxisType::relativeEquidistant;
    file.time.first = first;
    file.time.step = step;
    drive(write("tide.tsb0", file, {smooth(count)}));
  };
  speaks({
      {"series", "begins at 1990-01-03 12:00:00, after the run", "Move the run to the series",
       [&] { writeTide(smooth(kWhole), later(2880)); }},
      {"series", "ends at 1990-01-01 11:30:00, in the run", "Move the run to the series",
       [&] { writeTide(smooth(kWhole), later(-150)); }},
      {"series", "begins at 1990-01-03 12:00:00, after the run", "Move the run to the series",
       [&] { writeTide(smooth(4), later(2880)); }},
      {"series", "begins at 1990-01-01 12:10:00, after the run",
       "Begin with the run and hold the last value "
       "until its end, in tide_moved.tsb0",
       [&] { relative(10, 10, kWhole - 1); }},
      {"series", "begins at 1990-01-01 12:10:00, after the run",
       "Move the series to the run's begin, in "
       "tide_moved.tsb0",
       [&] { relative(10, 10, kWhole); }},
      {"series", "ends at 1990-01-01 12:00:12, in the run",
       "Hold the last value until the run's end, in "
       "tide_held.tsb0",
       [&] { relative(0, 0.1, 3); }},
      // All of it lies within a step of the run.
      {"series", "ends at 1990-01-01 12:00:12, in the run",
       "Hold the last value until the run's end, in "
       "tide_held.tsb0",
       [&] {
         TsbDefinition file = every10Minutes(3, start());
         file.time.step = 0.1;
         drive(write("tide.tsb0", file, {smooth(3)}));
       }},
  });
  // The run takes what is written along, and has no more steps than there are values for.
  clean();
  writeTide(smooth(4), later(2880));
  model->nhdResult->outputs.SetCount(1);
  model->nhdResult->outputs.GetItem(1)->steps = {30, 360, 10};
  fixFirst();
  EXPECT_EQ(dateTimeText(start()), "1990-01-03 12:00:00");
  EXPECT_EQ(model->simulationPeriod->LastTimeStep(), 90);
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->steps, (USubLine{30, 90, 10}));
  // Where it would leave another series, this one goes to it.
  clean();
  const std::string stays = write("stays.tsb0", every10Minutes(kWhole, start()), {smooth(kWhole)});
  model->boundary->SetNoBoundaries(2);
  model->boundary->GetItem(2)->Set(0, 0, 14, 0);
  model->boundary->GetItem(1)->Set(0, 2, 0, 30);
  writeTide(smooth(5), later(2880));
  model->nhdBoundary->GetItem(2)->SetDataFormat(CNhdBoundaryObjectKvs::kType0File);
  model->nhdBoundary->GetItem(2)->dataFile.fileName = stays;
  ASSERT_EQ(look().size(), 1U);
  fixFirst();
  EXPECT_TRUE(look().empty());
  EXPECT_EQ(dateTimeText(start()), "1990-01-01 12:00:00");
  const TsbDefinition moved = definitionOf("tide_moved.tsb0");
  EXPECT_EQ(moved.time.start, *start().parts());
  EXPECT_EQ(moved.time.type, TsbTimeAxisType::calendar);
  EXPECT_THAT(moved.time.values, ::testing::ElementsAre(0, 10, 20, 30, 40, ::testing::DoubleNear(120, 1e-6)));
  const Values few = smooth(5);
  EXPECT_EQ(read("tide_moved.tsb0"), (Values{few[0], few[1], few[2], few[3], few[4], few[4]}));
  // Few values may jump, and do so after that.
  speaks({{"series", "ends at 1990-01-01 12:00:12, in the run",
           "Hold the last value until the run's end, in tide_held.tsb0", [&] {
             TsbDefinition file = every10Minutes(3, start());
             file.time.step = 0.1;
             drive(write("tide.tsb0", file, {{0, 0, 9}}));
           }}});

  // Where the axis is to keep its steps it has more of them.
  clean();
  const CoveringSeries equal{start(), model->simulationPeriod->End(), false, true};
  ASSERT_TRUE(
      makeFix(*model,
              {"Hold",
               {},
               {{write("five.tsb0", every10Minutes(5, start()), {few}), folder.file("held.tsb0"), equal}}},
              path));
  EXPECT_EQ(definitionOf("held.tsb0").time.type, TsbTimeAxisType::calendarEquidistant);
  Values held = few;
  held.resize(kWhole, held.back());
  EXPECT_EQ(read("held.tsb0"), held);

  // A map is held as a whole.
  clean();
  TsbDefinition waves = every10Minutes(2, start(), {{"Height", item::kSignificantWaveHeight, "m"}});
  waves.time.type = TsbTimeAxisType::calendar;
  waves.time.values = {0, 0.1};
  waves.axes = {{31, 0, 90, "m"}, {31, 0, 90, "m"}};
  Values heights;
  for (int i = 0; i < 2 * 31 * 31; ++i) heights.push_back(static_cast<float>(i));
  const std::string map = write("waves.tsb2", waves, {heights});
  const CoveringSeries run{start(), model->simulationPeriod->End()};
  ASSERT_TRUE(makeFix(*model, {"Hold", {}, {{map, folder.file("held.tsb2"), run}}}, path));
  EXPECT_THAT(definitionOf("held.tsb2").time.values,
              ::testing::ElementsAre(0, 0.1, ::testing::DoubleNear(120, 1e-6)));
  heights.insert(heights.end(), heights.begin() + 31 * 31, heights.end());
  EXPECT_EQ(read("held.tsb2"), heights);
}

// One that is read under a name of the other kind takes the new name, and what is written does not.
TEST_F(SeriesFixTest, ASeriesThatIsTheResultOfAnotherRun) {
  writeTide(with(smooth(kWhole), {{4, kNone}}), start());
  model->nhdResult->outputs.SetCount(1);
  model->nhdResult->outputs.GetItem(1)->file = folder.file("tide.tsb0");
  std::string text = saved();
  const std::string asInput = "(file)\"tide.tsb0\"";
  ASSERT_NE(text.find(asInput), std::string::npos);
  text.replace(text.find(asInput), asInput.size(), "(result)\"tide.tsb0\"");
  const KvsHandle file = test::fileOf(text);
  model->Load(&file->tree().root(), path);
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  EXPECT_TRUE(look().empty());
  EXPECT_EQ(model->nhdBoundary->GetItem(1)->dataFile.fileName.text(), "tide_filled.tsb0");
  EXPECT_EQ(model->nhdResult->outputs.GetItem(1)->file.text(), "tide.tsb0");
}

TEST_F(SeriesFixTest, WhatCantBeMadeLeavesNothing) {
  writeTide(with(smooth(2000), {{6, 9.0F}, {9, kNone}}), start());
  const std::string tide = folder.file("tide.tsb0");
  const CoveringSeries run{start(), start().plusDays(30)};
  const std::vector<FileMaking> makings{FilledSeries{}, SmoothedSeries{{1}}, run};
  const std::string whole = test::textOf(tide);
  folder.write("cut.tsb0", whole.substr(0, whole.size() / 2));
  folder.write("text.tsb0", "no data file");
  test::writeGrid(folder.file("map.tsb2"));
  std::filesystem::create_directory(folder.file("full"));
  const test::SmallDisk disk(folder.file("full"), 4096);
  for (const FileMaking& making : makings) {
    SCOPED_TRACE(making.index());
    leavesNothing(folder.file("none.tsb0"), making, "none.tsb0");
    leavesNothing(folder.file("cut.tsb0"), making, "cut.tsb0");
    leavesNothing(folder.file("text.tsb0"), making, "text.tsb0");
    leavesNothing(tide, making, "The fix was stopped", [](double) { return false; });
    leavesNothing(tide, making, "The fix was stopped", [](double done) { return done < 0.6; });
    if (!disk.mounted()) continue;
    const Outcome full = makeFix(*model, {"Make", {}, {{tide, folder.file("full/made.tsb0"), making}}}, path);
    ASSERT_FALSE(full);
    EXPECT_THAT(full.error(), AllOf(HasSubstr("full/made.tsb0"), HasSubstr("the disk is full")));
    EXPECT_TRUE(std::filesystem::is_empty(folder.file("full")));
  }
  leavesNothing(folder.file("map.tsb2"), FilledSeries{}, "map.tsb2 is no time series");
  TsbDefinition curve = every10Minutes(2, start());
  curve.time.type = TsbTimeAxisType::relativeEquidistant;
  curve.time.unit = "m";
  leavesNothing(write("curve.tsb0", curve, {{0, 1}}), run, "its time axis is none of time");
}

// Of axes with very many equal steps: the run's end is one value more.
TEST_F(SeriesFixTest, ALongRunTakesNoManySteps) {
  TsbDefinition file = every10Minutes(2, start());
  file.time.step = 1e-6;
  const std::string from = write("fine.tsb0", file, {{1, 2}});
  const CoveringSeries run{start(), start().plusDays(1), false, true};
  ASSERT_TRUE(makeFix(*model, {"Hold", {}, {{from, folder.file("held.tsb0"), run}}}, path));
  EXPECT_EQ(definitionOf("held.tsb0").time.type, TsbTimeAxisType::calendar);
  EXPECT_EQ(read("held.tsb0"), (Values{1, 2, 2}));
}

}  // namespace advice_series_test
}  // namespace gridbay
