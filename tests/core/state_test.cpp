// The exact state of objects, and the way from a path to a member, as they follow from tables.

#include <gmock/gmock.h>

#include <limits>

#include "core/list_kvs.h"
#include "core/table_code.h"
#include "tests/support/model.h"

namespace gridbay {
namespace core_state_test {

class Layer final : public TableKvs<Layer> {
 public:
  using TableKvs::TableKvs;
  std::int32_t format = 0;
  float constant = 1;
  static constexpr auto table() {
    return keywords(keyword("Data_Format", &Layer::format), keyword("Constant_Value", &Layer::constant));
  }
};

class Area final : public ListKvs<Area, Layer> {
 public:
  using ListKvs::ListKvs;
  static constexpr auto table() { return keywords(items("LAYER_%d")); }
};

// A row of each kind, two lists, and members that stand on no file.
class Holder final : public TableKvs<Holder> {
 public:
  explicit Holder(CKvsBase* parent) : TableKvs(parent), outputs(this, &numbered), areas(this) {}

  std::int32_t type = 0;
  std::int32_t isOn = 0;
  double hidden = 0;
  std::int32_t sizeOfFile = 0;
  std::int32_t steps = 10;
  float depth = 0.5F;
  std::string title;
  UResultFileName result;
  UTsbSelection selection{1};
  USubArea area;
  USubLine line;
  std::vector<double> points;
  std::vector<std::int32_t> itemNumbers;
  ItemList<Layer> outputs;
  ItemList<Area> areas;

  [[maybe_unused]] static constexpr bool kReadsOtherFiles = true;
  static void numbered(CKvsBase&, Layer& layer, int number) { layer.format = number; }

  struct LoadedName {
    void load(Holder& holder, KvsSection from, const std::string&) const {
      kvsGetParam(from, "First_Step", &holder.steps, 1, 1);
    }
  };

  static constexpr auto table() {
    using Self = Holder;
    return section(
        "HOLDER", keyword("Type", &Self::type), flag("Is_On", &Self::isOn),
        writtenOnly("Is_Off", [](const Self& holder) { return holder.isOn == 0; }),
        onlyIf([](const Self& holder) { return holder.type > 0; }, keyword("Depth", &Self::depth)),
        loadedAs(keyword("Steps", &Self::steps), LoadedName{}), keyword("Title", &Self::title),
        keyword("Result_File", &Self::result), section("FILE", gridbay::selection(&Self::selection, 2)),
        subArea("X_Range", "Y_Range", &Self::area), subLine("First", "Last", "Interval", &Self::line),
        numbers("Points", &Self::points), numbers("Items", &Self::itemNumbers),
        count("No_Of_Outputs", &Self::outputs), items("OUTPUT_%d", &Self::outputs, {"There is no output"}),
        items("AREA_%d", &Self::areas), offFile(&Self::hidden), fromOtherFiles(&Self::sizeOfFile));
  }
};

const std::string kPath = "/case/setup.v27";

std::unique_ptr<Holder> filled() {
  auto holder = std::make_unique<Holder>(nullptr);
  holder->type = 2;
  holder->isOn = 1;
  holder->hidden = 4.5;
  holder->title = "tide";
  holder->result.Set("out.tsb2", kPath);
  holder->selection.fileName.Set("in.tsb0", kPath);
  holder->area.y = {1, 9, 2};
  holder->line = {3, 8, 1};
  holder->points = {1, 2.5};
  holder->itemNumbers = {1, 4};
  holder->outputs.SetCount(2);
  holder->areas.SetCount(2);
  holder->areas.GetItem(2)->SetCount(3);
  holder->areas.GetItem(2)->GetItem(3)->constant = 7;
  return holder;
}

TEST(State, RowsOfAllKindsAreWrittenInTheirOrder) {
  EXPECT_EQ(test::savedText(*filled()),
            "HOLDER {\n    Type 2\n    Is_On #true\n    Is_Off #false\n    Depth 0.5\n    Steps 10\n"
            "    Title \"tide\"\n    Result_File (result)\"out.tsb2\"\n    FILE {\n"
            "        File_Name (file)\"in.tsb0\"\n        Item_Numbers 1\n    }\n    X_Range 0 0 1\n"
            "    Y_Range 1 9 2\n    First 3\n    Last 8\n    Interval 1\n    Points 1.0 2.5\n    Items 1 4\n"
            "    No_Of_Outputs 2\n    OUTPUT_1 {\n        Data_Format 1\n        Constant_Value 1.0\n    }\n"
            "    OUTPUT_2 {\n        Data_Format 2\n        Constant_Value 1.0\n    }\n    AREA_1 {}\n"
            "    AREA_2 {\n        LAYER_1 {\n            Data_Format 0\n            Constant_Value 1.0\n"
            "        }\n        LAYER_2 {\n            Data_Format 0\n            Constant_Value 1.0\n"
            "        }\n        LAYER_3 {\n            Data_Format 0\n            Constant_Value 7.0\n"
            "        }\n    }\n}\n");
  Holder plain(nullptr);
  EXPECT_THAT(test::savedText(plain), ::testing::Not(::testing::HasSubstr("Depth")));
}

TEST(State, WhatIsWrittenIsReadButForWhatIsToldOtherwise) {
  auto holder = filled();
  holder->steps = 77;
  Holder read(nullptr);
  read.areas.SetCount(2);
  read.areas.GetItem(2)->SetCount(3);
  test::load(read, test::savedText(*holder));
  EXPECT_EQ(read.steps, 10);
  EXPECT_EQ(read.hidden, 0);
  read.steps = 77;
  read.hidden = 4.5;
  EXPECT_TRUE(read.SameState(*holder));
  test::load(read, "HOLDER { First_Step 5; Is_On #false; Points 3.0; Depth 9.0; Type 0 }");
  EXPECT_EQ(read.steps, 5);
  EXPECT_EQ(read.isOn, 0);
  EXPECT_EQ(read.points, std::vector<double>{3});
  EXPECT_EQ(read.depth, 0.5F) << "the condition is asked when its turn comes, behind the type";
}

TEST(State, AnExactCopyHasWhatStandsOnNoFile) {
  const auto holder = filled();
  Holder copy(nullptr);
  EXPECT_FALSE(copy.SameState(*holder));
  copy.AssignState(*holder);
  EXPECT_TRUE(copy.SameState(*holder));
  EXPECT_EQ(copy.hidden, 4.5);
  copy.hidden = 4.6;
  EXPECT_FALSE(copy.SameState(*holder));
  copy.hidden = 4.5;
  copy.sizeOfFile = 3;
  EXPECT_TRUE(copy.SameState(*holder)) << "what was read from other files is no difference";
  copy.areas.GetItem(2)->GetItem(1)->format = 1;
  EXPECT_FALSE(copy.SameState(*holder));
}

TEST(State, NotANumberIsTheSameAsItself) {
  auto a = filled();
  Holder b(nullptr);
  a->depth = std::numeric_limits<float>::quiet_NaN();
  a->points = {std::numeric_limits<double>::quiet_NaN()};
  b.AssignState(*a);
  EXPECT_TRUE(a->SameState(b));
  EXPECT_EQ(a->TakeChange(b), nullptr);
  a->hidden = 0.0;
  b.hidden = -0.0;
  EXPECT_FALSE(a->SameState(b));
}

TEST(State, AChangeGoesBackAndForth) {
  auto holder = filled();
  auto before = filled();
  Holder twin(nullptr);
  twin.AssignState(*holder);
  EXPECT_EQ(holder->TakeChange(twin), nullptr);
  const std::vector<std::function<void(Holder&)>> edits{
      [](Holder& h) { h.hidden = -1; },
      [](Holder& h) { h.outputs.SetCount(5); },
      [](Holder& h) { h.outputs.SetCount(0); },
      [](Holder& h) { h.outputs.InsertHead().constant = 9; },
      [](Holder& h) { h.outputs.RemoveHead(); },
      [](Holder& h) { h.areas.GetItem(2)->GetItem(2)->constant = 3; },
      [](Holder& h) { h.areas.GetItem(1)->SetCount(4); },
      [](Holder& h) {
        h.areas.SetCount(1);
        h.title = "ebb";
        h.outputs.GetItem(2)->format = 0;
      },
  };
  for (std::size_t i = 0; i < edits.size(); ++i) {
    edits[i](*holder);
    Holder after(nullptr);
    after.AssignState(*holder);
    const auto change = holder->TakeChange(twin);
    ASSERT_NE(change, nullptr) << i;
    EXPECT_TRUE(twin.SameState(after)) << i;
    EXPECT_GT(change->bytes(), 0U);
    change->apply(*holder, false);
    EXPECT_TRUE(holder->SameState(*before)) << i;
    change->apply(*holder, true);
    EXPECT_TRUE(holder->SameState(after)) << i;
    change->apply(*holder, false);
    change->apply(twin, false);
  }
}

TEST(State, WhatWasReadFromFilesGoesAlong) {
  auto holder = filled();
  Holder twin(nullptr);
  twin.AssignState(*holder);
  holder->sizeOfFile = 12;
  EXPECT_EQ(holder->TakeChange(twin), nullptr);
  EXPECT_EQ(twin.sizeOfFile, 12);
}

TEST(ItemList, TheHeadAndTheTail) {
  Holder holder(nullptr);
  holder.outputs.SetCount(2);
  Layer* first = holder.outputs.GetItem(1);
  holder.outputs.InsertHead();
  EXPECT_EQ(holder.outputs.GetItem(2), first) << "items stay where they are";
  EXPECT_EQ(holder.outputs.GetItem(1)->format, 1);
  holder.outputs.RemoveHead();
  EXPECT_EQ(holder.outputs.GetItem(1), first);
  holder.outputs.SetCount(-1);
  EXPECT_EQ(holder.outputs.GetCount(), 2);
  EXPECT_EQ(holder.outputs.GetItem(3), nullptr);
  EXPECT_THROW(holder.outputs.at(3), std::invalid_argument);
  EXPECT_EQ(&holder.outputs.at(1), first);
}

TEST(ItemList, AMissingSectionIsToldOrPassedOver) {
  test::Model model;
  Holder holder(&model.root);
  holder.areas.SetCount(2);
  test::load(holder, "HOLDER { No_Of_Outputs 2; OUTPUT_2 { Data_Format 9 } }");
  EXPECT_EQ(model.host.texts, std::vector<std::string>{"There is no output"});
  EXPECT_EQ(holder.outputs.GetItem(1)->format, 1);
  EXPECT_EQ(holder.outputs.GetItem(2)->format, 9);
}

// A list whose items are checked always, as with no depth, and one whose items are told apart on file.
class Checked final : public TableKvs<Checked> {
 public:
  using TableKvs::TableKvs;
  std::int32_t value = 0;
  static constexpr auto table() { return keywords(keyword("Value", &Checked::value)); }
  using TableKvs::Validate;
  unsigned Validate(ValidationList& messages, int deep, int number) {
    return report(messages, PageId::none, Severity::fault, Text{"%d at depth %d"}, number, deep);
  }
  using TableKvs::Load;
  using TableKvs::Save;
  void Save(KvsFile& file, const std::string& path, bool isThick) {
    if (isThick) kvsPutParam(file, "Thick", true);
    Save(file, path);
  }
  void Load(KvsSection from, const std::string& path, bool isThick) {
    if (isThick) Load(from, path);
  }
};

class AlwaysChecked final : public ListKvs<AlwaysChecked, Checked> {
 public:
  using ListKvs::ListKvs;
  static constexpr bool kChecksItemsAlways = true;
  static constexpr auto table() { return keywords(items("ITEM_%d")); }
};

class Thick final : public TableKvs<Thick> {
 public:
  explicit Thick(CKvsBase* parent) : TableKvs(parent), thick(this), thin(this) {}
  ItemList<Checked> thick;
  ItemList<Checked> thin;
  static constexpr auto table() {
    return keywords(itemsWith(true, "LAYER_%d", &Thick::thick), itemsWith(false, "AREA_%d", &Thick::thin));
  }
};

TEST(ItemList, ItemsThatAreCheckedAlwaysAreCheckedWithNoDepth) {
  AlwaysChecked list(nullptr);
  list.SetCount(1);
  for (const int deep : {0, 1})
    EXPECT_EQ(test::textsOf(test::messagesOf(list, deep)), std::vector<std::string>{"1 at depth 0"});
}

TEST(ItemList, ItemsMaySaveAndLoadWithAnArgument) {
  Thick holder(nullptr);
  holder.thick.SetCount(1);
  holder.thin.SetCount(1);
  EXPECT_EQ(test::savedText(holder),
            "LAYER_1 {\n    Thick #true\n    Value 0\n}\nAREA_1 {\n    Value 0\n}\n");
  test::load(holder, "LAYER_1 { Value 3 }\nAREA_1 { Value 4 }\n");
  EXPECT_EQ(holder.thick.GetItem(1)->value, 3);
  EXPECT_EQ(holder.thin.GetItem(1)->value, 0);
}

class MemberPaths : public ::testing::Test {
 protected:
  std::string at(const std::string& path) {
    KvsFile file;
    PathAccess access{PathAccess::What::write, &file, nullptr, &kPath};
    if (!holder->AccessPath(path, access)) return "none";
    return *file.text();
  }
  bool set(const std::string& path, const std::string& keyword) {
    const KvsHandle file = test::fileOf(keyword);
    PathAccess access{PathAccess::What::set, nullptr, &file->tree().root(), &kPath};
    return holder->AccessPath(path, access);
  }
  std::unique_ptr<Holder> holder = filled();
};

TEST_F(MemberPaths, LeadToMembers) {
  EXPECT_EQ(at("HOLDER/Type"), "Type 2\n");
  EXPECT_EQ(at("holder/type"), "Type 2\n");
  EXPECT_EQ(at("HOLDER/FILE/Item_Numbers"), "Item_Numbers 1\n");
  EXPECT_EQ(at("HOLDER/Y_Range"), "Y_Range 1 9 2\n");
  EXPECT_EQ(at("HOLDER/Last"), "Last 8\n");
  EXPECT_EQ(at("HOLDER/AREA_2/LAYER_3/Constant_Value"), "Constant_Value 7.0\n");
  EXPECT_EQ(at("HOLDER/AREA_2/LAYER_3"), "LAYER_3 {\n    Data_Format 0\n    Constant_Value 7.0\n}\n");
  for (const char* path : {"Type", "HOLDER/Typ", "HOLDER/AREA_3", "HOLDER/AREA_0", "HOLDER/AREA_2/LAYER_4",
                           "HOLDER/AREA_x", "HOLDER/AREA_2x", "HOLDER/FILE/Type", "OTHER", ""})
    EXPECT_EQ(at(path), "none") << path;
}

TEST_F(MemberPaths, SetMembersAlsoWhereALoadDoesNot) {
  EXPECT_TRUE(set("HOLDER/Steps", "Steps 3"));
  EXPECT_EQ(holder->steps, 3);
  EXPECT_TRUE(set("HOLDER/Is_On", "Is_On #false"));
  EXPECT_EQ(holder->isOn, 0);
  holder->type = 0;
  EXPECT_TRUE(set("HOLDER/Depth", "Depth 4.0"));
  EXPECT_EQ(holder->depth, 4);
  EXPECT_TRUE(set("HOLDER/No_Of_Outputs", "No_Of_Outputs 3"));
  EXPECT_EQ(holder->outputs.GetCount(), 3);
  EXPECT_TRUE(set("HOLDER/No_Of_Outputs", "No_Of_Outputs 2147483647"));
  EXPECT_EQ(holder->outputs.GetCount(), 3);
  EXPECT_TRUE(set("HOLDER/OUTPUT_3/Constant_Value", "Constant_Value 0.25"));
  EXPECT_EQ(holder->outputs.GetItem(3)->constant, 0.25F);
  EXPECT_TRUE(set("HOLDER/Points", "Points 1.0 2.0 3.0"));
  EXPECT_EQ(holder->points.size(), 3U);
  EXPECT_TRUE(set("HOLDER/FILE/File_Name", "File_Name (file)\"other.tsb0\""));
  EXPECT_EQ(holder->selection.fileName.text(), "other.tsb0");
  EXPECT_FALSE(set("HOLDER/Steps_", "Steps_ 3"));
}

TEST_F(MemberPaths, WhatFollowsFromOtherValuesIsToldApart) {
  PathAccess access{PathAccess::What::look};
  EXPECT_TRUE(holder->AccessPath("HOLDER/Is_Off", access));
  EXPECT_TRUE(access.isWrittenOnly);
  PathAccess list{PathAccess::What::look};
  EXPECT_TRUE(holder->AccessPath("HOLDER/Points", list));
  EXPECT_TRUE(list.takesAnyNumber);
  EXPECT_FALSE(list.isWrittenOnly);
}

// What one edition fixes, on file and after a load, or after a load alone.
class Fixed final : public TableKvs<Fixed> {
 public:
  using TableKvs::TableKvs;
  std::int32_t both = 3;
  std::int32_t loaded = 3;
  std::int32_t isOn = 1;
  static constexpr auto table() {
    return keywords(pinned(keyword("Both", &Fixed::both), 0),
                    pinned(keyword("Loaded", &Fixed::loaded), 1, Pin::onLoad),
                    pinned(flag("Is_On", &Fixed::isOn), 0));
  }
};

TEST(Pinned, IsFixedOnFileOrAfterALoad) {
  Fixed object(nullptr);
  const bool sweep = theEdition.wetlandSweepKit;
  EXPECT_EQ(test::savedText(object),
            sweep ? "Both 0\nLoaded 3\nIs_On #false\n" : "Both 3\nLoaded 3\nIs_On #true\n");
  test::load(object, "Both 5\nLoaded 6\nIs_On #true\n");
  EXPECT_EQ(object.both, sweep ? 0 : 5);
  EXPECT_EQ(object.loaded, sweep ? 1 : 6);
  EXPECT_EQ(object.isOn, sweep ? 0 : 1);
  const KvsHandle file = test::fileOf("Loaded 8");
  PathAccess access{PathAccess::What::set, nullptr, &file->tree().root(), &kPath};
  EXPECT_TRUE(object.AccessPath("Loaded", access));
  EXPECT_EQ(access.isPinned, sweep);
  EXPECT_EQ(object.loaded, sweep ? 1 : 8);
}

TEST(SelectionFileName, BothKindsAreReadAndTheKindIsKept) {
  Holder holder(nullptr);
  test::load(holder, "HOLDER { FILE { File_Name (result)\"r.tsb2\" } }");
  EXPECT_EQ(holder.selection.fileName.text(), "r.tsb2");
  EXPECT_THAT(test::savedText(holder), ::testing::HasSubstr("File_Name (result)\"r.tsb2\""));
  test::load(holder, "HOLDER { FILE { File_Name (file)\"f.tsb2\" } }");
  EXPECT_THAT(test::savedText(holder), ::testing::HasSubstr("File_Name (file)\"f.tsb2\""));
  test::load(holder, "HOLDER { FILE { File_Name \"plain\" } }");
  EXPECT_EQ(holder.selection.fileName.text(), "f.tsb2");
}

}  // namespace core_state_test
}  // namespace gridbay
