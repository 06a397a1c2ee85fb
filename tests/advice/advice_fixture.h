#pragma once

#include <fmt/format.h>
#include <gmock/gmock.h>

#include <cmath>
#include <filesystem>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "advice/advisor.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "platform/cartography/cartography.h"
#include "platform/tsb/tsb_writer.h"
#include "setup/dlg_enumerator.h"
#include "setup/edit_history.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

// A sea in the west and land in the east, with a finer area of sea at point (6,6).
class AdviceTest : public ::testing::Test {
 protected:
  struct Area {
    std::string file;
    int points = 31;
    double spacing = 90;
    double easting = 480000;
    double northing = 6100000;
    std::string projection = "UTM-32";
    double axesOff = 0;
    float land = 6;
  };
  static constexpr double kInner = 480000 + 6 * 90;
  static constexpr double kInnerNorth = 6100000 + 6 * 90;

  static float coast(int j, int) { return j < 15 ? -5.0F : 8.0F; }
  static float sea(int, int) { return -5.0F; }

  void write(const Area& area, const test::Surface& surface) const {
    TsbDefinition file = test::definitionOf(
        {.noJ = area.points, .noK = area.points, .dx = area.spacing, .dy = area.spacing, .land = area.land});
    file.axes[0].first = area.easting + area.axesOff;
    file.axes[1].first = area.northing;
    file.geography = TsbGeography{area.projection, 0, 0, 0};
    CVdMapProjection(area.projection)
        .Proj2Geo(area.easting, area.northing, &file.geography->longitude, &file.geography->latitude);
    std::vector<float> values;
    for (int k = 0; k < area.points; ++k)
      for (int j = 0; j < area.points; ++j) values.push_back(surface(j, k));
    Result<TsbWriter> writer = TsbWriter::create(folder.file(area.file), file);
    ASSERT_TRUE(writer) << writer.error();
    ASSERT_TRUE(writer->write(1, 0, std::span<const float>(values)));
    ASSERT_TRUE(writer->commit());
    areFilesClean = false;
  }
  Area inner() const { return {"inner.tsb2", 10, 30, kInner, kInnerNorth}; }

  // A water level (m) every ten minutes from the start of the run.
  void writeTide(const std::vector<float>& values, const DateTime& start) const {
    TsbDefinition file;
    file.time.start = *start.parts();
    file.time.unit = "min";
    file.time.step = 10;
    file.time.count = values.size();
    file.items.push_back({"Tide", 100000, "m"});
    Result<TsbWriter> writer = TsbWriter::create(folder.file("tide.tsb0"), file);
    ASSERT_TRUE(writer) << writer.error();
    for (std::size_t step = 0; step < values.size(); ++step)
      ASSERT_TRUE(writer->write(1, step, std::span<const float>(&values[step], 1)));
    ASSERT_TRUE(writer->commit());
    model->nhdBoundary->GetItem(1)->SetDataFormat(CNhdBoundaryObjectKvs::kType0File);
    model->nhdBoundary->GetItem(1)->dataFile.fileName = folder.file("tide.tsb0");
  }
  static std::vector<float> smooth(std::size_t count) {
    std::vector<float> values;
    for (std::size_t i = 0; i < count; ++i) values.push_back(std::sin(static_cast<float>(i) / 12));
    return values;
  }
  DateTime start() const { return model->simulationPeriod->start; }

  void SetUp() override { clean(); }

  // A setup on which there is no advice.
  void clean() {
    model = std::make_unique<CGlobalKvs>();
    if (!areFilesClean) {
      write({"outer.tsb2"}, coast);
      write(inner(), sea);
      areFilesClean = true;
    }
    CBathymetryKvs& areas = *model->bathymetry;
    areas.SetNoAreas(2);
    areas.projection = "UTM-32";
    areas.GetArea(1)->fileName = folder.file("outer.tsb2");
    areas.GetArea(2)->fileName = folder.file("inner.tsb2");
    areas.GetArea(2)->origin = {6, 6};
    model->boundary->defaultPosition = 0;
    model->boundary->SetNoBoundaries(1);
    model->boundary->GetItem(1)->Set(0, 0, 0, 30);
    model->simulationPeriod->timeStepInterval = 20;
    model->simulationPeriod->noPointsInTime = 361;  // two hours
    model->sourceSink->SetNoSources(1);
    model->sourceSink->GetItem(1)->source = {12, 12};
  }
  std::vector<Advice> look() { return advisor.lookThoroughly(*model, path); }

  CNhdWeirObjectKvs& weir(std::vector<double> x, std::vector<double> y) {
    model->nhdWeir->SetCount(1);
    CNhdWeirObjectKvs& made = *model->nhdWeir->GetItem(1);
    made.coordinateType = "UTM-32";
    made.x = std::move(x);
    made.y = std::move(y);
    return made;
  }
  CNhdDikeObjectKvs& dike(const std::vector<DikePoint>& points) {
    model->nhdDike->SetCount(1);
    CNhdDikeObjectKvs& made = *model->nhdDike->GetItem(1);
    for (const DikePoint& point : points) made.points.push_back(point);
    return made;
  }

  struct Speaks {
    std::string_view kind;
    std::string doubt;
    std::string fix;  // its name
    std::function<void()> edit;
  };
  std::string saved() {
    const KvsHandle file = kvsCreate();
    model->Save(*file, path);
    return *file->text();
  }

  // The fix leaves no advice, is one step whose undo brings the exact state back, and is the same on the
  // file.
  void mends(const Advice& advice) {
    const std::string before = saved();
    CGlobalKvs state;
    state.AssignState(*model);
    EditHistory history;
    history.start(*model, {});
    const Outcome made = makeFix(*model, advice.fix, path);
    ASSERT_TRUE(made) << made.error();
    for (const Advice& left : look()) ADD_FAILURE() << left.kind << ": " << left.doubt;
    EXPECT_TRUE(history.record(*model, advice.place.page, advice.fix.name, false, {}));
    const std::string mended = saved();
    EditHistory::Touched touched;
    history.undo(*model, touched);
    EXPECT_TRUE(model->SameState(state));
    EXPECT_EQ(history.undoStep(), nullptr);
    for (const AdviceFile& file : advice.fix.files) EXPECT_TRUE(std::filesystem::remove(file.to));
    if (!fixesByTool) return;
    folder.write("setup.v27", before);
    const test::ProgramRun run = test::runTool({"fix", path, "1"});
    EXPECT_EQ(run.status, 0) << run.err;
    EXPECT_THAT(run.out, ::testing::StartsWith(advice.fix.name + "\n"));
    EXPECT_EQ(test::textOf(folder.file("setup.v27")), mended);
    for (const AdviceFile& file : advice.fix.files) EXPECT_TRUE(std::filesystem::remove(file.to));
  }

  // Each case has one advice, whose fix mends it.
  void speaks(const std::vector<Speaks>& cases) {
    for (const Speaks& each : cases) {
      SCOPED_TRACE(each.doubt);
      clean();
      each.edit();
      const std::vector<Advice> found = look();
      std::string all;
      for (const Advice& advice : found) all += fmt::format("{}: {}\n", advice.kind, advice.doubt);
      ASSERT_EQ(found.size(), 1U) << all;
      const Advice& advice = found[0];
      EXPECT_EQ(advice.kind, each.kind);
      EXPECT_THAT(advice.doubt, ::testing::HasSubstr(each.doubt));
      EXPECT_FALSE(advice.reason.empty());
      EXPECT_NE(CDlgEnumerator().GetCaption(static_cast<std::int32_t>(advice.place.page)), "");
      EXPECT_EQ(advice.fix.name, each.fix);
      EXPECT_FALSE(advice.fix.settings.empty() && advice.fix.files.empty() && !advice.fix.removal);
      if (!theEdition.wetlandSweepKit) mends(advice);
    }
  }
  void isSilent(const std::vector<std::function<void()>>& edits) {
    for (std::size_t i = 0; i < edits.size(); ++i) {
      SCOPED_TRACE(i);
      clean();
      edits[i]();
      for (const Advice& advice : look()) ADD_FAILURE() << advice.kind << ": " << advice.doubt;
    }
  }

  test::TemporaryFolder folder;
  std::string path = folder.file("setup.v27");
  std::unique_ptr<CGlobalKvs> model;
  Advisor advisor;
  mutable bool areFilesClean = false;
  bool fixesByTool = true;
};

}  // namespace gridbay::test
