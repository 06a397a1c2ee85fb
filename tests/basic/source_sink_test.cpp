#include "basic/source_sink.h"

#include <gtest/gtest.h>

#include "basic/bathymetry.h"
#include "tests/support/model.h"

namespace gridbay {
namespace basic_source_sink_test {

using test::load;
using test::Model;
using test::savedText;

TEST(SourceSink, DefaultsInFileOrder) {
  Model model;
  EXPECT_EQ(savedText(*model.root.sourceSink), "SOURCE_AND_SINK {\n    Number_Of_Sources 0\n}\n");
  model.root.sourceSink->SetNoSources(1);
  EXPECT_EQ(savedText(*model.root.sourceSink),
            "SOURCE_AND_SINK {\n    Number_Of_Sources 1\n    SOURCE_SINK_1 {\n        Type 0\n        "
            "Source_Point 0 0\n"
            "        Sink_Point 0 0\n        Source_Area 1\n        Sink_Area 1\n    }\n}\n");
}

TEST(SourceSink, LoadEmptiesTheListFirst) {
  Model model;
  CSourceSinkKvs& list = *model.root.sourceSink;
  load(list,
       "SOURCE_AND_SINK { Number_Of_Sources 2; SOURCE_SINK_2 { Type 2; Source_Point 1 2; Sink_Point 3 4\n"
       " Source_Area 5; Sink_Area 6 } }");
  ASSERT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(2)->Text(), "(1,2)->(3,4) ");
  EXPECT_EQ(list.GetItem(2)->sourceArea, 5);
  EXPECT_EQ(list.GetItem(2)->sinkArea, 6);
  EXPECT_EQ(model.host.texts,
            std::vector<std::string>{"Error in the KVS-FILE\nThe number of Source Sink sections does not "
                                     "correspond to the given number"});
  Model other;
  other.root.sourceSink->CopyFrom(list);
  EXPECT_EQ(savedText(*other.root.sourceSink), savedText(list));
  load(list, "SOURCE_AND_SINK { Number_Of_Sources -1 }");
  EXPECT_EQ(list.GetCount(), 0);
  list.SetNoSources(3);
  load(list, "OTHER {}");
  EXPECT_EQ(list.GetCount(), 0);
  list.SetNoSources(3);
  list.SetNoSources(-1);
  EXPECT_EQ(list.GetCount(), 3);
}

TEST(SourceSink, TextsOfTheTypes) {
  CSourceSinkObjectKvs entry(nullptr);
  entry.source = {1, 2};
  entry.sink = {3, 4};
  const auto textOf = [&entry](int type) {
    entry.type = type;
    return entry.Text();
  };
  EXPECT_EQ(textOf(0), "(1,2)->");
  EXPECT_EQ(textOf(1), "->(3,4)");
  EXPECT_EQ(textOf(2), "(1,2)->(3,4) ");
  EXPECT_EQ(textOf(3), "");
}

// Area 1 of 10 x 8 points with an area under it from (3,3) to (5,5), and land in column 9 and at (4,4).
class SourceSinkChecks : public ::testing::Test {
 protected:
  SourceSinkChecks() {
    CBathymetryKvs& areas = *model.root.bathymetry;
    areas.SetNoAreas(2);
    shape(*areas.GetArea(1), 10, 8);
    shape(*areas.GetArea(2), 7, 7);
    for (std::size_t k = 0; k < 8; ++k) areas.GetArea(1)->grid.values()[k * 10 + 9] = 10;
    areas.GetArea(1)->grid.values()[7 * 10 + 9] = -1;
    areas.GetArea(1)->grid.values()[4 * 10 + 4] = 10;
    model.root.sourceSink->SetNoSources(2);
  }
  static void shape(CBathymetryObjectKvs& area, int noJ, int noK) {
    area.noJ = noJ;
    area.noK = noK;
    area.landValue = 10;
    area.grid = CVdArray2D<float>(noJ, noK);
    std::ranges::fill(area.grid.values(), -1.0F);
  }
  std::vector<std::string> faults(int type, GridPoint source, GridPoint sink, int sourceArea = 1,
                                  int sinkArea = 1) {
    CSourceSinkObjectKvs& entry = *model.root.sourceSink->GetItem(2);
    entry.type = type;
    entry.source = source;
    entry.sink = sink;
    entry.sourceArea = sourceArea;
    entry.sinkArea = sinkArea;
    const ValidationList messages = test::messagesOf(*model.root.sourceSink);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::sourceAndSink);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  using Texts = std::vector<std::string>;
  static constexpr GridPoint good{1, 1};
  Model model;
};

TEST_F(SourceSinkChecks, EachTestOfASource) {
  EXPECT_EQ(faults(0, good, {-9, -9}), Texts{});
  for (const int area : {0, 3, -1})
    EXPECT_EQ(faults(0, good, {}, area), Texts{"Source no.2 is not embedded in a valid area"});
  for (const GridPoint point : {GridPoint{-1, 0}, {0, -1}, {10, 0}, {0, 8}}) {
    EXPECT_EQ(faults(0, point, {}), Texts{"Source no.2 is outside of grid"});
  }
  EXPECT_EQ(faults(0, {3, 3}, {}), Texts{"Source no.2 is in a point that is covered by an embedded area"});
  EXPECT_EQ(faults(0, {4, 4}, {}),
            Texts{"Source no.2 is in a point that is covered by an embedded area"});  // and land
  EXPECT_EQ(faults(0, {9, 0}, {}), Texts{"Source no.2 is on land"});
  EXPECT_EQ(faults(0, {9, 7}, {}), Texts{});  // the last point, on water
  EXPECT_EQ(faults(0, {6, 6}, {}, 2), Texts{});
}

TEST_F(SourceSinkChecks, EachTestOfASink) {
  EXPECT_EQ(faults(1, {-9, -9}, good), Texts{});
  EXPECT_EQ(faults(1, {}, good, 1, 3), Texts{"Sink no.2 is not embedded in a valid area"});
  EXPECT_EQ(faults(1, {}, {10, 0}), Texts{"Sink no.2 is outside of grid"});
  EXPECT_EQ(faults(1, {}, {5, 5}), Texts{"Sink no.2 is in a point that is covered by an embedded area"});
  EXPECT_EQ(faults(1, {}, {9, 1}), Texts{"Sink no.2 is on land"});
}

TEST_F(SourceSinkChecks, APairAndAnUnknownType) {
  EXPECT_EQ(faults(2, {9, 0}, {-1, 0}), (Texts{"Source no.2 is on land", "Sink no.2 is outside of grid"}));
  EXPECT_EQ(faults(3, {-1, -1}, {-1, -1}), Texts{});
}

TEST_F(SourceSinkChecks, AGridThatHasNotBeenReadHasNoInside) {
  model.root.bathymetry->GetArea(1)->grid = {};
  EXPECT_EQ(faults(2, good, good).size(), 3U);  // both points here, and the first entry's source
}

TEST(SourceSink, TheCountAndTheTextThatSpeaksOfAnother) {
  Model model;
  CSourceSinkKvs& list = *model.root.sourceSink;
  list.SetNoSources(1024);
  EXPECT_TRUE(test::messagesOf(list, 0).empty());
  load(list, "SOURCE_AND_SINK { Number_Of_Sources 1025 }");
  EXPECT_EQ(list.GetCount(), 1025);
  EXPECT_EQ(test::messagesOf(list, 0),
            (ValidationList{{PageId::bathymetry, "Number of source/sinks should be between 0 and 256",
                             Severity::dependedUpon}}));
}

}  // namespace basic_source_sink_test
}  // namespace gridbay
