// What a control edits: members of an object, and values worked out.

#include <gmock/gmock.h>

#include <cmath>
#include <cstdint>
#include <string>

#include "platform/units/units.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace pages_binding_test {

struct Thing {
  std::int32_t count = 3;
  float depth = 1;
  double width = 2;
  bool on = false;
  std::int32_t features = 1;
  std::int32_t scheme = 7;
  std::string name = "a";
  UFileName file;
  DateTime start = DateTime::of({2000, 1, 2, 3, 4, 5});
  std::int32_t points = 101;
};

class Bound : public test::ShapeTest {
 protected:
  void open() {
    const auto thing = [this]() -> Thing& { return *held; };
    ShapeTest::open([thing](test::OwnPage&, Form& form) {
      form.Number("Count:", thing, &Thing::count);
      form.Number("Depth:", thing, &Thing::depth, item::kFloodDepth);
      form.Number("Width:", thing, &Thing::width);
      form.Check("On", thing, &Thing::on);
      form.Check("Off", thing, &Thing::features, 0, 1);
      form.List("Scheme:", Choices{{1, "one"}, {5, "five"}}.Otherwise(0), thing, &Thing::scheme);
      form.Radio("Kept:", Choices{{1, "one"}, {5, "five"}}, thing, &Thing::scheme);
      form.Text("Name:", thing, &Thing::name);
      form.DateTimeEdit("Start:", thing, &Thing::start);
      form.Number("Last:", lastOf(memberOf(thing, &Thing::points)));
      form.Shown("Sum:", [thing] { return std::to_string(std::int64_t{thing().count} + thing().points); });
    });
  }
  Thing first;
  Thing* held = &first;
};

TEST_F(Bound, MembersAreShownAndStoredByTheirKind) {
  open();
  EXPECT_EQ(text("Count:"), "3");
  EXPECT_EQ(text("Depth:"), "1");
  EXPECT_EQ(text("Start:"), "2000-01-02 03:04:05");
  EXPECT_EQ(control("Start:").kind, ControlKind::dateTime);
  edit("Count:", "4");
  edit("Depth:", "0.25");
  edit("Width:", "1e-3");
  choose("On", 1);
  edit("Name:", " b ");
  edit("Start:", "2001-01-01 00:00");
  EXPECT_EQ(first.count, 4);
  EXPECT_EQ(first.depth, 0.25F);
  EXPECT_EQ(first.width, 1e-3);
  EXPECT_TRUE(first.on);
  EXPECT_EQ(first.name, " b ");
  EXPECT_EQ(dateTimeText(first.start), "2001-01-01 00:00:00");
  EXPECT_TRUE(document.IsModified());
}

TEST_F(Bound, TheObjectIsLookedUpEachTime) {
  open();
  Thing other;
  other.count = 8;
  held = &other;
  page->SetData();
  EXPECT_EQ(text("Count:"), "8");
  edit("Count:", "9");
  EXPECT_EQ(other.count, 9);
  EXPECT_EQ(first.count, 3);
}

TEST_F(Bound, ACheckBoxMayStandForAnyTwoValues) {
  open();
  EXPECT_EQ(control("Off").index, 0);
  choose("Off", 1);
  EXPECT_EQ(first.features, 0);
  choose("Off", 0);
  EXPECT_EQ(first.features, 1);
  first.features = 4;  // neither: kept until the box is used
  page->SetData();
  EXPECT_EQ(control("Off").index, 0);
  page->UpdateDoc();
  EXPECT_EQ(first.features, 4);
}

TEST_F(Bound, AValueThatIsNoChoiceFallsBackOrIsKept) {
  held->scheme = 7;
  open();
  EXPECT_EQ(control("Scheme:").index, 0);
  EXPECT_EQ(control("Kept:").index, -1);
  page->UpdateDoc();
  EXPECT_EQ(first.scheme, 1);
  choose("Kept:", 1);
  EXPECT_EQ(first.scheme, 5);
}

TEST_F(Bound, APageShowsWhatFollowsFromItsOwnEdits) {
  open();
  EXPECT_EQ(text("Sum:"), "104");
  edit("Count:", "10");
  EXPECT_EQ(text("Sum:"), "111");
}

TEST_F(Bound, TheLastOfAsManyPointsAsThereCanBe) {
  open();
  EXPECT_EQ(text("Last:"), "100");
  edit("Last:", "2147483646");
  EXPECT_EQ(first.points, 2147483647);
  edit("Last:", "2147483647");
  EXPECT_EQ(first.points, 2147483647);
  EXPECT_EQ(host.texts, Labels{"Last: must be below 2147483647"});
}

TEST_F(Bound, NumbersThatDoNotFitAreToldApart) {
  open();
  for (const auto& [typed, fault] : {std::pair{"x", "\"x\" is not a number"},
                                     {"1.5", "\"1.5\" is not a whole number"},
                                     {"99999999999", "\"99999999999\" is too large"},
                                     {"nan", "\"nan\" is not a number"},
                                     {"", "\"\" is not a number"}}) {
    edit("Count:", typed);
    EXPECT_EQ(control("Count:").fault, fault);
  }
  for (const char* typed : {"1e60", "inf", "nan"}) {
    edit("Depth:", typed);
    EXPECT_NE(control("Depth:").fault, "") << typed;
  }
  EXPECT_EQ(first.count, 3);
  EXPECT_EQ(first.depth, 1.0F);
}

TEST_F(Bound, NothingIsShownOfAnObjectThatIsNotThere) {
  Thing* none = nullptr;
  const auto thing = [&none] { return none; };
  ShapeTest::open([thing](test::OwnPage&, Form& form) {
    form.Number("Count:", thing, &Thing::count);
    form.List("Scheme:", Choices{{1, "one"}}, thing, &Thing::scheme);
  });
  EXPECT_EQ(text("Count:"), "");
  EXPECT_FALSE(control("Count:").usable());
  EXPECT_EQ(page->UpdateDoc(), 1);
  none = &first;
  page->SetData();
  EXPECT_EQ(text("Count:"), "3");
  EXPECT_TRUE(control("Count:").usable());
}

TEST_F(Bound, CaptionsFollowTheModel) {
  ShapeTest::open([this](test::OwnPage&, Form& form) {
    const auto thing = [this]() -> Thing& { return first; };
    form.Number("Count:", thing, &Thing::count);
    form.Group("Results", [] {}).Caption([this] { return "Results of " + std::to_string(first.count); });
  });
  EXPECT_NE(page->form().find("Results of 3"), nullptr);
  edit("Count:", "5");
  EXPECT_NE(page->form().find("Results of 5"), nullptr);
}

TEST_F(Bound, RulesOfAFrameHoldForAllInIt) {
  ShapeTest::open([this](test::OwnPage&, Form& form) {
    const auto thing = [this]() -> Thing& { return first; };
    form.Check("On", thing, &Thing::on);
    form.Group("More",
               [&] {
                 form.Number("Count:", thing, &Thing::count);
                 form.Number("Depth:", thing, &Thing::depth).EnabledIf([this] { return first.count > 3; });
               })
        .EnabledIf([this] { return first.on; })
        .VisibleIf([this] { return first.features != 0; });
  });
  EXPECT_FALSE(control("Count:").enabled);
  choose("On", 1);
  EXPECT_TRUE(control("Count:").enabled);
  EXPECT_FALSE(control("Depth:").enabled);
  edit("Count:", "4");
  EXPECT_TRUE(control("Depth:").enabled);
  EXPECT_EQ(control("Depth:").group, page->form().find("More"));
  first.features = 0;
  page->SetData();
  EXPECT_FALSE(control("Count:").visible);
}

TEST_F(Bound, ACountComesBackFromBeyondItsLimits) {
  struct List {
    int count = 20;
    int GetCount() const { return count; }
    void SetCount(int n) { count = n; }
  } list;
  ShapeTest::open([&list](test::OwnPage&, Form& form) {
    form.Count("Number", countOf([&list]() -> List& { return list; }), 14, 12, 1);
  });
  spin("Number", 1);
  EXPECT_EQ(list.count, 20);
  spin("Number", -1);
  EXPECT_EQ(list.count, 19);
  edit("Number", "18");
  EXPECT_EQ(list.count, 18);
  edit("Number", "19");
  EXPECT_EQ(list.count, 18);
  EXPECT_EQ(text("Number"), "18");
  edit("Number", "14");
  EXPECT_EQ(list.count, 14);
  edit("Number", "1");
  spin("Number", -1);
  EXPECT_EQ(list.count, 1);
  edit("Number", "0");
  EXPECT_EQ(list.count, 1);
  spin("Number", 11);
  EXPECT_EQ(list.count, 12);
  spin("Number", 1);  // the spin button ends before the edit
  EXPECT_EQ(list.count, 12);
}

TEST_F(Bound, AFileHasTwoButtonsBesideIt) {
  const test::TemporaryFolder folder;
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  ShapeTest::open([this](test::OwnPage& own, Form& form) {
    const auto thing = [this](GridRow) { return &first; };
    own.AddFile(form, "&Data file:",
                fileOf(thing, &Thing::file, FileKind{"tsb0", "Time series (*.tsb0)|*.tsb0||"},
                       [](CVdFileSelectorDlg& selector, GridRow) { selector.SetNoItems(1); }));
  });
  EXPECT_TRUE(control("&Data file:").isFile);
  EXPECT_TRUE(control("...").beside);
  EXPECT_FALSE(control("View...").enabled);
  edit("&Data file:", "later.tsb0");
  EXPECT_EQ(first.file.absolute(), folder.file("later.tsb0"));
  host.chosenFile = folder.write("now.tsb0", "");
  press("...");
  EXPECT_EQ(host.filters, Labels{"Time series (*.tsb0)|*.tsb0||"});
  EXPECT_EQ(text("&Data file:"), *host.chosenFile);
  press("View...");
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(Bound, AFileThatIsToBeWrittenIsAskedForByItsExtent) {
  struct Output {
    std::int32_t extent = 2;
    UResultFileName file;
  } output;
  ShapeTest::open([&output](test::OwnPage& own, Form& form) {
    own.AddFile(form, "File",
                resultFileOf([&output](GridRow) { return &output; }, &Output::file,
                             [&output](GridRow) {
                               return output.extent == 2 ? FileKind{"tsb2", "Maps (*.tsb2)|*.tsb2||"}
                                                         : FileKind{"tsb0", "Time series (*.tsb0)|*.tsb0||"};
                             }));
  });
  host.chosenFile = "depth.tsb2";
  press("...");
  output.extent = 0;
  press("...");
  EXPECT_EQ(host.extensions, (Labels{"tsb2", "tsb0"}));
  EXPECT_EQ(text("File"), "depth.tsb2");
  EXPECT_TRUE(document.IsModified());
}

TEST_F(Bound, ANameThatIsNotTypedAnewStaysWhereItWasRelativeTo) {
  const test::TemporaryFolder folder;
  std::filesystem::create_directory(folder.path() / "sub");
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  first.file.Set("a.tsb0", document.path());
  ASSERT_TRUE(document.OnSaveDocument(folder.file("sub/s.v27")));
  ShapeTest::open([this](test::OwnPage& own, Form& form) {
    own.AddFile(form, "File",
                fileOf([this](GridRow) { return &first; }, &Thing::file, FileKind{"tsb0", ""},
                       [](CVdFileSelectorDlg&, GridRow) {}));
    form.Number(
        "Count:", [this]() -> Thing& { return first; }, &Thing::count);
  });
  edit("Count:", "4");
  EXPECT_EQ(first.file.absolute(), folder.file("a.tsb0"));
}

TEST_F(Bound, LeavingAPageIsAnEvent) {
  open();
  auto& own = static_cast<test::OwnPage&>(*page);
  page->OnLeave();
  EXPECT_EQ(own.left, 1);
}

}  // namespace pages_binding_test
}  // namespace gridbay
