#include "structures/dike.h"

#include <gmock/gmock.h>

#include <cmath>

#include "basic/simulation_period.h"
#include "core/edition.h"
#include "setup/edit_history.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace structures_dike_test {

using test::load;
using test::Model;
using test::savedText;
using Texts = std::vector<std::string>;

const std::string kDefaultDike =
    "name \"\"\n"
    "include 1\n"
    "formula 1\n"
    "critical_level_difference 0.01\n"
    "coefficient 1.838\n"
    "specification_of_crest_level 1.0\n"
    "crest_level 0.0\n"
    "coordinate_type \"UTM-32\"\n"
    "number_of_points 0\n"
    "CREST_LEVEL_FILE {\n"
    "    file_name (file)\"\"\n"
    "    item_number 1\n"
    "}\n";

const std::string kFilledDike =
    "name \"North\"\n"
    "include 0\n"
    "formula 1\n"
    "critical_level_difference 0.025\n"
    "coefficient 1.7\n"
    "specification_of_crest_level 3.7\n"
    "crest_level -2.25\n"
    "coordinate_type \"UTM-33\"\n"
    "number_of_points 2\n"
    "POINT_1 {\n"
    "    x 400100.5\n"
    "    y 6000100.25\n"
    "    z 3.5\n"
    "}\n"
    "POINT_2 {\n"
    "    x 0.0\n"
    "    y -1.0\n"
    "    z 1e-07\n"
    "}\n"
    "CREST_LEVEL_FILE {\n"
    "    file_name (file)\"data/crest.tsb1\"\n"
    "    item_number 3\n"
    "}\n";

std::string indented(const std::string& text, const std::string& blanks) {
  std::string result;
  for (std::size_t start = 0; start < text.size();) {
    const std::size_t end = text.find('\n', start) + 1;
    result += blanks + text.substr(start, end - start);
    start = end;
  }
  return result;
}

TEST(Dike, Defaults) {
  CNhdDikeObjectKvs dike(nullptr);
  EXPECT_EQ(dike.name, "");
  EXPECT_EQ(dike.include, 1);
  EXPECT_EQ(dike.coordinateType, "UTM-32");
  EXPECT_EQ(dike.dischargeCoefficient, 1.838);
  EXPECT_EQ(dike.deltaLevel, 0.01);
  EXPECT_EQ(dike.crestLevelSpecification, 1);
  EXPECT_EQ(dike.crestLevel, 0);
  EXPECT_EQ(dike.crestLevelFile.text(), "");
  EXPECT_EQ(dike.itemNumber, 1);
  EXPECT_TRUE(dike.points.empty());
  EXPECT_EQ(savedText(dike), kDefaultDike);
}

TEST(Dike, AFilledOneComesBack) {
  CNhdDikeObjectKvs dike(nullptr);
  load(dike, kFilledDike);
  EXPECT_EQ(dike.crestLevelFile.absolute(), "/case/data/crest.tsb1");
  EXPECT_EQ(dike.points[1].z, 1e-7);
  EXPECT_EQ(savedText(dike), kFilledDike);
  CNhdDikeObjectKvs copy(nullptr);
  copy.CopyFrom(dike);
  EXPECT_EQ(savedText(copy), kFilledDike);
  CNhdDikeObjectKvs state(nullptr);
  EXPECT_FALSE(state.SameState(dike));
  state.AssignState(dike);
  EXPECT_TRUE(state.SameState(dike));
  state.points.edit(1).x = -0.0;
  EXPECT_FALSE(state.SameState(dike));
}

TEST(Dike, WhatIsMissingKeepsItsDefault) {
  CNhdDikeObjectKvs dike(nullptr);
  load(dike, "formula 7\n");
  EXPECT_EQ(savedText(dike), kDefaultDike);
}

TEST(Dike, PointsAreFoundByTheirSections) {
  CNhdDikeObjectKvs dike(nullptr);
  const auto count = [&dike](const std::string& text) {
    load(dike, text);
    return dike.points.size();
  };
  EXPECT_EQ(count("number_of_points 9\nPOINT_1 { x 1.0 }\nPOINT_2 { x 2.0 }\n"), 2U);
  EXPECT_EQ(count("number_of_points 1\nPOINT_1 {}\nPOINT_2 {}\nPOINT_4 {}\n"), 2U);
  EXPECT_EQ(count("number_of_points 2147483647\n"), 0U);
  EXPECT_EQ(count("POINT_2 {}\n"), 0U);
  EXPECT_EQ(count("POINT_0 {}\nPOINT_01 {}\n"), 0U);
  EXPECT_EQ(count("POINT_1 7\n"), 0U);
  EXPECT_EQ(count("POINT_1 { x 1.0 }\npoint_2 { X 5 }\n"), 2U);
  EXPECT_EQ(dike.points[1].x, 5);
}

TEST(Dike, APointIsZeroBeforeItIsRead) {
  CNhdDikeObjectKvs dike(nullptr);
  load(dike, "POINT_1 { x 1.0; y 2.0; z 3.0 }\n");
  load(dike, "POINT_1 {}\nPOINT_2 { y \"no number\"; z 4 }\nPOINT_1 { x 9.0 }\n");
  ASSERT_EQ(dike.points.size(), 2U);
  EXPECT_EQ(dike.points[0].x, 0);
  EXPECT_EQ(dike.points[0].z, 0);
  EXPECT_EQ(dike.points[1].y, 0);
  EXPECT_EQ(dike.points[1].z, 4);
}

TEST(Dike, ManyPointsInAnyOrder) {
  constexpr int kPoints = 3000;
  std::string text;
  for (int n = kPoints; n > 0; --n)
    text += "POINT_" + std::to_string(n) + " { x " + std::to_string(n) + ".5 }\n";
  CNhdDikeObjectKvs dike(nullptr);
  load(dike, text);
  ASSERT_EQ(dike.points.size(), static_cast<std::size_t>(kPoints));
  for (int n = 1; n <= kPoints; ++n) ASSERT_EQ(dike.points[static_cast<std::size_t>(n) - 1].x, n + 0.5);
  dike.SetNoPoints(-1);
  EXPECT_EQ(dike.points.size(), static_cast<std::size_t>(kPoints));
  dike.SetNoPoints(2);
  EXPECT_EQ(dike.points.size(), 2U);
}

TEST(Dike, NumbersThatAreNoneComeBack) {
  CNhdDikeObjectKvs dike(nullptr);
  dike.SetNoPoints(1);
  dike.points.edit(0) = {NAN, INFINITY, -INFINITY};
  const std::string text = savedText(dike);
  EXPECT_THAT(text, ::testing::HasSubstr("    x #nan\n    y #inf\n    z #-inf\n"));
  CNhdDikeObjectKvs other(nullptr);
  load(other, text);
  EXPECT_EQ(other.points, dike.points);
}

TEST(Dike, TheSpecificationIsTruncated) {
  CNhdDikeObjectKvs dike(nullptr);
  const auto crest = [&dike](double specification) {
    dike.crestLevelSpecification = specification;
    return dike.crest();
  };
  EXPECT_EQ(crest(1), 1);
  EXPECT_EQ(crest(1.999), 1);
  EXPECT_EQ(crest(2), 2);
  EXPECT_EQ(crest(3.7), 3);
  for (const double none : {0.0, 0.999, 4.0, -3.0, 1e300, -1e300, double{INFINITY}, double{NAN}})
    EXPECT_EQ(crest(none), 0) << none;
}

class Dikes : public ::testing::Test {
 protected:
  Model model;
  CNhdDikeKvs& list = *model.root.nhdDike;
};

TEST_F(Dikes, AreWrittenInFileOrder) {
  EXPECT_EQ(savedText(list), "DIKES {\n    number_of_dikes 0\n}\n");
  list.SetCount(2);
  load(*list.GetItem(2), kFilledDike);
  std::string first = kDefaultDike;
  first.replace(first.find("\"\""), 2, "\"Dike 1\"");
  EXPECT_EQ(savedText(list), "DIKES {\n    number_of_dikes 2\n    DIKE_1 {\n" + indented(first, "        ") +
                                 "    }\n    DIKE_2 {\n" + indented(kFilledDike, "        ") + "    }\n}\n");
  Model other;
  load(*other.root.nhdDike, savedText(list));
  EXPECT_EQ(savedText(*other.root.nhdDike), savedText(list));
  EXPECT_FALSE(other.root.nhdDike->SameState(list));  // its files start from another folder
  other.root.nhdDike->CopyFrom(list);
  EXPECT_TRUE(other.root.nhdDike->SameState(list));
}

TEST_F(Dikes, AreFoundByTheirSections) {
  load(list, "DIKES { number_of_dikes 5; DIKE_1 { name \"A\" }; DIKE_2 { name \"B\" } }");
  ASSERT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(2)->name, "B");
  load(list, "DIKES { number_of_dikes 0; DIKE_3 { name \"C\" }; DIKE_1 { include 0 } }");
  ASSERT_EQ(list.GetCount(), 1);
  EXPECT_EQ(list.GetItem(1)->name, "");
  EXPECT_EQ(list.GetItem(1)->include, 0);
  load(list, "DIKES { number_of_dikes 2147483647 }");
  EXPECT_EQ(list.GetCount(), 0);
  EXPECT_EQ(model.host.texts, Texts{});
}

TEST_F(Dikes, AMissingSectionLeavesThem) {
  list.SetCount(1);
  load(list, "OTHER {}");
  EXPECT_EQ(list.GetCount(), 1);
}

TEST_F(Dikes, ANewOneIsNamedByTheCount) {
  list.SetCount(2);
  list.GetItem(2)->name = "Mine";
  list.GetItem(2)->SetNoPoints(4);
  list.SetCount(1);
  list.SetCount(3);
  EXPECT_EQ(list.GetItem(1)->name, "Dike 1");
  EXPECT_EQ(list.GetItem(2)->name, "Dike 2");
  EXPECT_TRUE(list.GetItem(2)->points.empty());
  EXPECT_EQ(list.GetItem(3)->name, "Dike 3");
}

TEST_F(Dikes, StandInTheirPlaceOfTheModel) {
  load(model.root,
       "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { STRUCTURES { DIKES { DIKE_1 { name \"A\" } } } } }");
  EXPECT_EQ(list.GetCount(), 1);
  const std::string saved = savedText(model.root);
  const std::size_t weirs = saved.find("STRUCTURE_MODULE");
  const std::size_t dikes =
      saved.find("        STRUCTURES {\n            DIKES {\n                number_of_dikes 1");
  EXPECT_NE(dikes, saved.npos);
  EXPECT_LT(weirs, dikes);
  EXPECT_EQ(static_cast<int>(PageId::dikes), 31);
}

TEST_F(Dikes, PathsLeadToTheirPoints) {
  list.SetCount(1);
  const std::string documentPath = "/case/setup.v27";
  const auto set = [&](const std::string& path, const std::string& keyword) {
    const KvsHandle file = test::fileOf(keyword);
    PathAccess access{
        .what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
    return model.root.AccessPath("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/" + path, access);
  };
  EXPECT_TRUE(set("number_of_dikes", "number_of_dikes 2"));
  EXPECT_EQ(list.GetCount(), 2);
  EXPECT_EQ(list.GetItem(2)->name, "Dike 2");
  EXPECT_TRUE(set("DIKE_2/number_of_points", "number_of_points 3"));
  EXPECT_TRUE(set("DIKE_2/number_of_points", "number_of_points -1"));
  EXPECT_TRUE(set("DIKE_2/number_of_points", "number_of_points 2000000000"));
  ASSERT_EQ(list.GetItem(2)->points.size(), 3U);
  EXPECT_TRUE(set("DIKE_2/POINT_3/y", "y 7.5"));
  EXPECT_EQ(list.GetItem(2)->points[2].y, 7.5);
  EXPECT_FALSE(set("DIKE_2/POINT_4/y", "y 7.5"));
  EXPECT_FALSE(set("DIKE_2/POINT_0/y", "y 7.5"));
  EXPECT_FALSE(set("DIKE_2/POINT_1/w", "w 7.5"));
  EXPECT_TRUE(set("DIKE_2/CREST_LEVEL_FILE/item_number", "item_number 4"));
  EXPECT_EQ(list.GetItem(2)->itemNumber, 4);

  KvsFile out;
  PathAccess access{.what = PathAccess::What::write, .out = &out, .documentPath = &documentPath};
  EXPECT_TRUE(list.AccessPath("DIKES/DIKE_2/POINT_3", access));
  EXPECT_TRUE(access.isSection);
  EXPECT_TRUE(list.AccessPath("DIKES/DIKE_2/POINT_3/y", access));
  EXPECT_TRUE(list.AccessPath("DIKES/DIKE_2/number_of_points", access));
  EXPECT_TRUE(list.AccessPath("DIKES/number_of_dikes", access));
  EXPECT_EQ(*out.text(),
            "POINT_3 {\n    x 0.0\n    y 7.5\n    z 0.0\n}\ny 7.5\nnumber_of_points 3\nnumber_of_dikes 2\n");
  EXPECT_TRUE(model.root.KnowsSection("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_2/POINT_3"));
  EXPECT_FALSE(model.root.KnowsSection("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_2/POINT_4"));
  EXPECT_FALSE(model.root.KnowsSection("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_3"));
}

class DikeChecks : public Dikes {
 protected:
  // The texts of all checks of one dike with such a specification and file.
  Texts faults(double specification, const std::string& file) {
    list.SetCount(1);
    list.GetItem(1)->crestLevelSpecification = specification;
    list.GetItem(1)->crestLevelFile.Set(file, folder.file("setup.v27"));
    ValidationList messages;
    const unsigned counted = list.Validate(messages, 0);  // with and without depth
    EXPECT_EQ(counted, messages.size());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::dikes);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  test::TemporaryFolder folder;
};

TEST_F(DikeChecks, TheCrestLevelFileMustExistWhereItIsUsed) {
  const Texts missing{"Data file  \" none.tsb1\"  is not valid"};
  EXPECT_EQ(faults(3, "none.tsb1"), missing);
  EXPECT_EQ(faults(3.7, "none.tsb1"), missing);
  EXPECT_EQ(faults(3, ""), Texts{"Data file  \" \"  is not valid"});
  for (const double other : {1.0, 2.0, 2.9, 4.1, 0.0, -3.0}) EXPECT_EQ(faults(other, "none.tsb1"), Texts{});
  folder.write("there.tsb1", "anything");
  EXPECT_EQ(faults(3, "there.tsb1"), Texts{});
  EXPECT_EQ(faults(3, folder.path().string()).size(), 1U);
}

TEST_F(DikeChecks, FaultsOfAllDikesAddUp) {
  list.SetCount(3);
  list.GetItem(1)->crestLevelSpecification = 3;
  list.GetItem(3)->crestLevelSpecification = 3;
  list.GetItem(3)->include = 0;
  list.GetItem(2)->coordinateType = "nowhere";
  list.GetItem(2)->dischargeCoefficient = -1;
  EXPECT_EQ(test::messagesOf(list).size(), 2U);
  ValidationList messages;
  model.root.Validate(messages, 1);
  EXPECT_EQ(std::ranges::count(messages, PageId::dikes, &CMessage::page), 2);
}

TEST_F(Dikes, TheCrestLevelFileIsAProfileOfLevelsOverTheSimulation) {
  list.SetCount(1);
  CVdFileSelectorDlg selector;
  list.GetItem(1)->RequestCrestLevelFile(selector);
  ASSERT_EQ(selector.requests().size(), 1U);
  EXPECT_EQ(selector.requests()[0]->types(), (std::vector<int>{100069, 110033}));
  EXPECT_TRUE(selector.pluginEnabled());
}

// What an edit of one point costs: its block, however many points and dikes there are.
TEST_F(Dikes, AnEditKeepsOneBlockOfPoints) {
  constexpr int kPoints = 100'000;
  list.SetCount(3);
  for (int n = 1; n <= 3; ++n) list.GetItem(n)->SetNoPoints(kPoints);
  Model twin;
  twin.root.nhdDike->AssignState(list);
  list.GetItem(2)->points.edit(70'000).z = 1;
  const std::unique_ptr<StateChange> change = list.TakeChange(*twin.root.nhdDike);
  ASSERT_NE(change, nullptr);
  EXPECT_TRUE(twin.root.nhdDike->SameState(list));
  constexpr std::size_t kBlockBytes = SharedArray<DikePoint>::kBlock * sizeof(DikePoint);
  EXPECT_GT(change->bytes(), 2 * kBlockBytes);
  EXPECT_LT(change->bytes(), 3 * kBlockBytes);
  EXPECT_EQ(twin.root.nhdDike->GetItem(2)->points.block(0).data(), list.GetItem(2)->points.block(0).data());
  change->apply(list, false);
  EXPECT_EQ(list.GetItem(2)->points[70'000].z, 0);
  change->apply(list, true);
  EXPECT_EQ(list.GetItem(2)->points[70'000].z, 1);

  list.SetCount(2);
  const std::unique_ptr<StateChange> removal = list.TakeChange(*twin.root.nhdDike);
  EXPECT_GT(removal->bytes(), kPoints * sizeof(DikePoint));
  removal->apply(list, false);
  EXPECT_EQ(list.GetItem(3)->points.size(), static_cast<std::size_t>(kPoints));
  EXPECT_EQ(list.GetItem(3)->name, "Dike 3");
}

}  // namespace structures_dike_test
}  // namespace gridbay
