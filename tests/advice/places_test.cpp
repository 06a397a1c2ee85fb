// What is placed in the areas, with its fixes: boundaries, sources, structures.

#include <gmock/gmock.h>

#include <functional>
#include <stdexcept>
#include <utility>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/source_sink.h"
#include "advice/advisor.h"
#include "advice/removal.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "ecology/boundary.h"
#include "ecology/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/source_sink.h"
#include "mud_transport/boundary.h"
#include "mud_transport/source_sink.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/sources.h"
#include "platform/cartography/cartography.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"
#include "tests/advice/advice_fixture.h"

namespace gridbay {
namespace advice_places_test {

using test::AdviceTest;

// The point that a boundary tilts about comes along to what is left of it.
TEST_F(AdviceTest, AShorterBoundaryKeepsItsTiltingPoint) {
  model->boundary->GetItem(1)->Set(0, 0, 0, 40);
  CNhdBoundaryObjectKvs& flow = *model->nhdBoundary->GetItem(1);
  flow.tiltType = 1;
  flow.tiltingPoint = 38;
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  EXPECT_EQ(model->boundary->GetItem(1)->last, (GridPoint{0, 30}));
  EXPECT_EQ(model->nhdBoundary->GetItem(1)->tiltingPoint, 30);
}

TEST_F(AdviceTest, WhatIsPlaced) {
  const auto boundary = [this](int n, int firstJ, int firstK, int lastJ, int lastK) {
    if (model->boundary->GetCount() < n) model->boundary->SetNoBoundaries(n);
    model->boundary->GetItem(n)->Set(firstJ, firstK, lastJ, lastK);
  };
  const auto noGrid = [this] { model->bathymetry->GetArea(1)->fileName = folder.file("none.tsb2"); };
  const auto culvert = [this](std::vector<double> x, std::vector<double> y) {
    model->nhdCulvert->SetCount(1);
    CNhdCulvertObjectKvs& made = *model->nhdCulvert->GetItem(1);
    made.coordinateType = "UTM-32";
    made.x = std::move(x);
    made.y = std::move(y);
  };
  const auto source = [this](GridPoint point) { model->sourceSink->GetItem(1)->source = point; };
  const auto pair = [this](GridPoint sink) {
    CSourceSinkObjectKvs& made = *model->sourceSink->GetItem(1);
    made.type = CSourceSinkObjectKvs::kPair;
    made.sink = sink;
    made.sinkArea = 2;
  };
  const auto eastEdge = [](int j, int) { return j == 9 ? -5.0F : 8.0F; };
  speaks({
      {"boundary", "Boundary 1 from (0,0) to (0,40) goes beyond area 1, whose last point is (30,30).",
       "Boundary 1 from (0,0) to (0,30)", [=] { boundary(1, 0, 0, 0, 40); }},
      {"boundary", "Boundary 1 is a single point, (0,4).", "Boundary 1 from (0,0) to (0,30)",
       [=] { boundary(1, 0, 4, 0, 4); }},
      {"boundary", "Boundary 1 from (5,0) to (5,30) does not lie on the border of area 1.",
       "Boundary 1 from (0,0) to (0,30)", [=] { boundary(1, 5, 0, 5, 30); }},
      {"boundary", "Boundary 1 from (30,0) to (30,30) lies wholly on land.", "Boundary 1 out",
       [=] { boundary(1, 30, 0, 30, 30); }},
      {"boundary", "Boundary 1 from (20,0) to (0,0) ends on land: 6 of its 21 points are land.",
       "Boundary 1 from (14,0) to (0,0)", [=] { boundary(1, 20, 0, 0, 0); }},
      {"boundary", "Boundaries 1 and 2 have 11 points in common.", "Boundary 2 from (0,30) to (0,21)",
       [=] {
         boundary(1, 0, 0, 0, 20);
         boundary(2, 0, 30, 0, 10);
       }},
      {"boundary", "Boundary 1 from (40,40) to (50,40) goes beyond area 1", "Boundary 1 out",
       [=] { boundary(1, 40, 40, 50, 40); }},
      // A diagonal runs along the edge beside it.
      {"boundary", "Boundary 1 from (0,0) to (40,30) goes beyond area 1", "Boundary 1 from (0,0) to (14,0)",
       [=] { boundary(1, 0, 0, 40, 30); }},
      {"boundary", "Boundary 1 from (3,28) to (-5,2) goes beyond area 1", "Boundary 1 from (0,28) to (0,2)",
       [=] { boundary(1, 3, 28, -5, 2); }},
      {"boundary", "Boundary 1 from (35,2) to (28,20) goes beyond area 1", "Boundary 1 out",
       [=] { boundary(1, 35, 2, 28, 20); }},
      {"boundary", "Boundary 1 from (40,40) to (50,60) goes beyond area 1", "Boundary 1 out",
       [=] { boundary(1, 40, 40, 50, 60); }},
      {"boundary", "Boundary 2 from (-3,5) to (4,20) goes beyond area 1", "Boundary 2 from (0,11) to (0,20)",
       [=] {
         boundary(1, 0, 0, 0, 10);
         boundary(2, -3, 5, 4, 20);
       }},
      // Where no grid is known, the points alone tell.
      {"boundary", "Boundaries 1 and 2 have 11 points in common.", "Boundary 2 from (0,30) to (0,21)",
       [=] {
         noGrid();
         boundary(1, 0, 0, 0, 20);
         boundary(2, 0, 30, 0, 10);
       }},
      {"boundary", "Boundaries 1 and 2 have 6 points in common.", "Boundary 2 from (0,11) to (0,30)",
       [=] {
         noGrid();
         boundary(1, 0, 5, 0, 10);
         boundary(2, 0, 0, 0, 30);
       }},
      {"boundary", "Boundaries 1 and 2 have 2 points in common.", "Boundary 2 out",
       [=] {
         noGrid();
         boundary(1, 0, 0, 0, 20);
         boundary(2, 0, 19, 0, 21);
       }},
      {"boundary", "Boundaries 1 and 2 have 11 points in common.", "Boundary 2 from (2147483647,0) to (11,0)",
       [=] {
         noGrid();
         boundary(1, 0, 0, 10, 0);
         boundary(2, 2147483647, 0, 0, 0);
       }},
      {"boundary", "Boundaries 1 and 2 have 6 points in common.", "Boundary 2 out",
       [=] { boundary(2, 0, 5, 0, 10); }},
      {"boundary", "Boundary 1 from (0,0) to (0,40) goes beyond area 1", "Boundary 1 from (0,0) to (0,30)",
       [=, this] {
         boundary(1, 0, 0, 0, 40);
         model->boundary->defaultPosition = 1;  // found by the program in another grid
       }},
      {"source", "Source 1 at (30,5) lies on the edge of area 1.", "Move source 1 to (14,5), 1440 m away",
       [=] {
         source({30, 5});
       }},
      {"source", "Source 1 at (5,0) lies on the edge of area 1.", "Move source 1 to (5,1), 90 m away",
       [=] {
         source({5, 0});
       }},
      {"source", "Source 1 at (0,10) lies in boundary 1.", "Move source 1 to (1,10), 90 m away",
       [=] {
         source({0, 10});
       }},
      {"source", "Sink 1 at (9,3) lies on the edge of area 2.", "Move sink 1 to (8,3), 30 m away",
       [=] {
         pair({9, 3});
       }},
      // Water that the inner area covers is not free.
      {"source", "Source 1 at (0,8) lies in boundary 1.", "Move source 1 to (10,8), 900 m away",
       [=, this] {
         write({"outer.tsb2"},
               [](int j, int k) { return j == 0 || (j >= 6 && j <= 10 && k >= 6 && k <= 9) ? -5.0F : 8.0F; });
         source({0, 8});
       }},
      {"source", "Sink 1 at (9,3) lies on the edge of area 2.", "Source 1 without its sink",
       [=, this] {
         write(inner(), eastEdge);
         pair({9, 3});
       }},
      {"source", "Source 1 at (9,3) lies on the edge of area 2.", "Sink 1 without its source",
       [=, this] {
         write(inner(), eastEdge);
         pair({12, 12});
         CSourceSinkObjectKvs& turned = *model->sourceSink->GetItem(1);
         std::swap(turned.source, turned.sink);
         std::swap(turned.sourceArea, turned.sinkArea);
         turned.source = {9, 3};
       }},
      {"source", "Source 1 at (9,3) lies on the edge of area 2.", "Source 1 out",
       [=, this] {
         write(inner(), eastEdge);
         source({9, 3});
         model->sourceSink->GetItem(1)->sourceArea = 2;
       }},
      {"structure", "Weir 1 lies outside of all areas.", "Weir 1 out",
       [this] {
         weir({400000, 400100}, {6100100, 6100200});
       }},
      {"structure", "Points 2 and 3 of weir 1 are equal.", "Point 3 of weir 1 out",
       [this] {
         weir({480100, 480200, 480200, 480300}, {6100100, 6100200, 6100200, 6100200});
       }},
      {"structure", "Weir 1 lies outside of all areas.", "Projection of weir 1: WGS 84 / UTM zone 32N",
       [this] {
         weir({480100, 480200}, {6100100, 6100200}).coordinateType = "UTM-33";
       }},
      {"structure", "Points 1 and 2 of weir 1 are equal.", "Weir 1 out",
       [this] {
         weir({480100, 480100}, {6100100, 6100100});
       }},
      {"structure", "Points 1 and 2 of weir 1 are equal, and 1 further ones like them.", "Weir 1 out",
       [this] {
         weir({480100, 480100, 480100}, {6100100, 6100100, 6100100});
       }},
      {"structure", "Points 1 and 2 of weir 1 are equal, and 2 further ones like them.",
       "3 equal points of weir 1 out",
       [this] {
         weir({480100, 480100, 480300, 480300, 480300}, {6100100, 6100100, 6100100, 6100100, 6100100});
       }},
      {"structure", "Culvert 1 lies outside of all areas.", "Culvert 1 out",
       [=] {
         culvert({400000, 400100}, {6100100, 6100200});
       }},
      {"structure", "Points 2 and 3 of culvert 1 are equal.", "Point 3 of culvert 1 out",
       [=] {
         culvert({480100, 480200, 480200}, {6100100, 6100200, 6100200});
       }},
      {"structure", "Weir 1 has 1 point.", "Weir 1 out", [this] { weir({480100}, {6100100}); }},
      {"structure", "Points 1 and 2 of dike 1 are equal.", "Point 2 of dike 1 out",
       [this] {
         dike({{480100, 6100100, 1}, {480100, 6100100, 2}, {480300, 6100100, 3}});
       }},
      {"structure", "Dike 1 lies outside of all areas.", "Dike 1 out of use",
       [this] {
         dike({{480100, 5100100, 1}, {480300, 5100100, 3}});
       }},
  });
  isSilent({
      [=] {
        boundary(2, 0, 0, 14, 0);  // they meet in a corner
      },
      [=] {
        boundary(1, 0, 0, 14, 30);  // a fault
      },
      [=] {
        boundary(1, 0, 0, 0, 10);
        boundary(2, 0, 11, 0, 30);
      },
      [=] {
        source({1, 1});
      },
      [this] {
        CSourceSinkObjectKvs& sink = *model->sourceSink->GetItem(1);
        sink.type = CSourceSinkObjectKvs::kIsolatedSink;
        sink.sink = {3, 3};
        sink.source = {0, 0};  // not in use
      },
      [this] {
        weir({470000, 490000}, {6100100, 6100200});
      },  // through the area
      [this] {
        dike({{480100, 6100100, 1}, {480300, 6100100, 3}});
      },
      [this] {
        dike({{480100, 5100100, 1}, {480300, 5100100, 3}}).include = 0;
      },
      [this] {
        double x = 0, y = 0, longitude = 0, latitude = 0;
        CVdMapProjection("UTM-32").Proj2Geo(480500, 6100500, &longitude, &latitude);
        CVdMapProjection("UTM-33").Geo2Proj(longitude, latitude, &x, &y);
        weir({x, x + 100}, {y, y + 100}).coordinateType = "UTM-33";
      },
  });
}

// Of a large grid a block is known to be water throughout, or to have a point that is.
TEST_F(AdviceTest, ASourceInALargeGridFindsWater) {
  const auto fixWith = [this](const test::Surface& surface) {
    write({"outer.tsb2", 1201, 90}, surface);
    return look().at(0).fix.name;
  };
  model->bathymetry->SetNoAreas(1);
  model->boundary->SetNoBoundaries(0);
  model->sourceSink->GetItem(1)->source = {0, 501};
  EXPECT_EQ(fixWith([](int j, int) { return j < 600 ? -5.0F : 8.0F; }),
            "Move source 1 to (1,501), 90 m away");
  EXPECT_EQ(fixWith([](int j, int k) { return j == 0 || (j == 701 && k == 501) ? -5.0F : 8.0F; }),
            "Move source 1 to (701,501), 63090 m away");
  EXPECT_EQ(fixWith([](int j, int k) { return j == 0 || (j == 31 && k == 541) ? -5.0F : 8.0F; }),
            "Move source 1 to (31,541), 4554.57 m away");
  EXPECT_EQ(fixWith([](int j, int k) { return j == 0 && k != 501 ? -5.0F : 8.0F; }), "Source 1 out");
}

// However many they are, and in a line however long, in one step.
TEST_F(AdviceTest, AllEqualPointsOfALongLineGo) {
  std::vector<DikePoint> points;
  for (int i = 0; i < 5000; ++i) {
    points.push_back({480100.0 + i / 4, 6100100, static_cast<double>(i)});
    if (i % 1000 == 7) points.push_back({480100.0 + i / 4, 6100100, -1});
  }
  speaks({{"structure", "Points 1 and 2 of dike 1 are equal, and 3754 further ones like them.",
           "3755 equal points of dike 1 out", [&, this] { dike(points); }}});
  clean();
  const SharedArray<DikePoint>& made = dike(points).points;
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_LE(found[0].site.mapPoints.size(), 1001U);
  EXPECT_EQ(found[0].site.mapPoints.front(), (AdviceSite::MapPoint{480100, 6100100}));
  EXPECT_EQ(found[0].site.mapPoints.back(), (AdviceSite::MapPoint{480100 + 1249, 6100100}));
  EXPECT_TRUE(found[0].fix.settings.empty());
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  ASSERT_EQ(made.size(), 1250U);
  for (std::size_t i = 0; i < made.size(); ++i) {
    EXPECT_EQ(made[i].x, 480100.0 + static_cast<double>(i));
    EXPECT_EQ(made[i].z, 4.0 * static_cast<double>(i));
  }
}

TEST_F(AdviceTest, WhatIsNotThereDoesNotGo) {
  using List = AdviceRemoval::List;
  const std::string before = saved();
  for (const AdviceRemoval& removal :
       {AdviceRemoval{List::boundary, 2}, AdviceRemoval{List::source, 0}, AdviceRemoval{List::weir, 1},
        AdviceRemoval{List::culvert, -1}, AdviceRemoval{List::dike, 1, AdviceRemoval::What::equalPoints}}) {
    const AdviceFix fix{"Out", {{"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth", "0.03"}}, {}, removal};
    EXPECT_THROW(makeFix(*model, fix, path), std::invalid_argument) << textOf(removal);
    EXPECT_EQ(saved(), before);
  }
}

TEST_F(AdviceTest, TheEqualPointOfADikeGoesWithItsLevel) {
  CNhdDikeObjectKvs& made = dike({{480100, 6100100, 1}, {480100, 6100100, 2}, {480300, 6100100, 3}});
  const std::vector<Advice> found = look();
  ASSERT_EQ(found.size(), 1U);
  EXPECT_EQ(found[0].site.mapPoints.size(), 3U);
  ASSERT_TRUE(makeFix(*model, found[0].fix, path));
  ASSERT_EQ(made.points.size(), 2U);
  EXPECT_EQ(std::as_const(made.points)[0].z, 1);
  EXPECT_EQ(std::as_const(made.points)[1].x, 480300);
  EXPECT_EQ(std::as_const(made.points)[1].z, 3);
}

// What all modules say of the entries behind it stays with them.
TEST_F(AdviceTest, AnEntryThatGoesTakesItsOwnAlong) {
  const auto named = [](auto& list) {
    for (int number = 1; number <= list.GetCount(); ++number) list.GetItem(number)->format = number;
  };
  const auto namesOf = [](auto& list) {
    std::string names;
    for (int number = 1; number <= list.GetCount(); ++number)
      names += std::to_string(list.GetItem(number)->format);
    return names;
  };
  const auto fill = [&](int count) {
    model->boundary->SetNoBoundaries(count);
    model->sourceSink->SetNoSources(count);
    for (int number = 1; number <= count; ++number) {
      model->boundary->GetItem(number)->Set(number, 0, number, 0);
      model->sourceSink->GetItem(number)->source = {number, number};
      model->nhdBoundary->GetItem(number)->value = static_cast<float>(number);
    }
    named(*model->nadBoundary);
    named(*model->nmtBoundary);
    named(*model->nmtExpBoundary);
    named(*model->wqsAdBoundary);
    named(*model->nadSourceSink);
    named(*model->nmtSourceSink);
    named(*model->nmtExpSources);
    named(*model->wqsAdSourceSink);
  };
  fill(3);
  using List = AdviceRemoval::List;
  ASSERT_TRUE(makeFix(*model, {"Out", {}, {}, AdviceRemoval{List::boundary, 2}}, path));
  ASSERT_EQ(model->boundary->GetCount(), 2);
  EXPECT_EQ(model->boundary->GetItem(2)->first.j, 3);
  EXPECT_FLOAT_EQ(model->nhdBoundary->GetItem(2)->value, 3);
  EXPECT_EQ(namesOf(*model->nadBoundary) + namesOf(*model->nmtBoundary) + namesOf(*model->nmtExpBoundary) +
                namesOf(*model->wqsAdBoundary),
            "13131313");
  fill(3);
  for (int number = 1; number <= 3; ++number)
    model->nhdSourceSink->GetItem(number)->constantMagnitude = static_cast<float>(number);
  ASSERT_TRUE(makeFix(*model, {"Out", {}, {}, AdviceRemoval{List::source, 2}}, path));
  ASSERT_EQ(model->sourceSink->GetCount(), 2);
  EXPECT_EQ(model->sourceSink->GetItem(2)->source, (GridPoint{3, 3}));
  EXPECT_FLOAT_EQ(model->nhdSourceSink->GetItem(2)->constantMagnitude, 3);
  EXPECT_EQ(namesOf(*model->nadSourceSink) + namesOf(*model->nmtSourceSink) + namesOf(*model->nmtExpSources) +
                namesOf(*model->wqsAdSourceSink),
            "13131313");
  EXPECT_EQ(model->boundary->GetCount(), 3);
  model->nhdWeir->SetCount(3);
  ASSERT_TRUE(makeFix(*model, {"Out", {}, {}, AdviceRemoval{List::weir, 2}}, path));
  ASSERT_EQ(model->nhdWeir->GetCount(), 2);
  EXPECT_EQ(model->nhdWeir->GetItem(2)->name, "Weir 3");
}

}  // namespace advice_places_test
}  // namespace gridbay
