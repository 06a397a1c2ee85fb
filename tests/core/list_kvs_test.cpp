#include "core/list_kvs.h"

#include <gtest/gtest.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/source_sink.h"
#include "core/table_code.h"
#include "tests/support/model.h"

namespace gridbay {
namespace core_list_kvs_test {

using test::load;
using test::savedText;

// A list of the tests' own.
class Item : public TableKvs<Item> {
 public:
  using TableKvs::TableKvs;
  std::int32_t value = 7;
  bool faulty = false;
  static constexpr auto table() { return keywords(keyword("Value", &Item::value)); }
  using TableKvs::Validate;
  unsigned Validate(ValidationList& messages, int, int number) {
    return faulty ? report(messages, PageId::boundary, Severity::fault, Text{"item %d"}, number) : 0U;
  }
};

class List : public ListKvs<List, Item> {
 public:
  using ListKvs::ListKvs;
  std::int32_t other = 1;
  static constexpr auto table() {
    return section("LIST", count("Count"), keyword("Other", &List::other),
                   items("ITEM_%d", {"Error in the KVS-FILE\nmissing"}));
  }
  void initialise(Item& item, int number) { item.value = 10 * number; }
};

// A root that keeps who was told of which counts.
class Root final : public ModelRoot {
 public:
  Root() : ModelRoot(nullptr) {}
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
  void TellFollowers(const CKvsBase& leader, std::span<const int> counts) override {
    for (const int count : counts) told.emplace_back(&leader, count);
  }

  std::vector<std::pair<const CKvsBase*, int>> told;
  std::vector<std::string> texts;

 protected:
  void ShowMessage(const std::string& text) override { texts.push_back(text); }
};

// A leader that is no list, of two counts at once.
class Task final : public TableKvs<Task> {
 public:
  using TableKvs::TableKvs;
  static constexpr auto table() { return keywords(); }
  void SetCounts(int layers, int fractions) {
    const std::array counts{layers, fractions};
    parts<ModelRoot>()->TellFollowers(*this, counts);
  }
};

class ListKvsTest : public ::testing::Test {
 protected:
  Root root;
  List list{&root};
};

TEST_F(ListKvsTest, ALeaderOfSeveralCountsTellsThemTogether) {
  Task task(&root);
  task.SetCounts(3, 2);
  EXPECT_EQ(root.told, (std::vector<std::pair<const CKvsBase*, int>>{{&task, 3}, {&task, 2}}));
}

TEST_F(ListKvsTest, AnEmptyListSavesItsCountAndNoSection) {
  EXPECT_EQ(savedText(list), "LIST {\n    Count 0\n    Other 1\n}\n");
  EXPECT_TRUE(test::messagesOf(list).empty());
}

TEST_F(ListKvsTest, ItemsStandInOrderInNumberedSections) {
  list.SetCount(2);
  EXPECT_EQ(savedText(list),
            "LIST {\n    Count 2\n    Other 1\n    ITEM_1 {\n        Value 10\n    }\n    ITEM_2 {\n        "
            "Value 20\n"
            "    }\n}\n");
}

TEST_F(ListKvsTest, ANewCountKeepsTheHeadAndGrowsWithDefaults) {
  list.SetCount(3);
  list.GetItem(1)->value = 1;
  list.GetItem(3)->value = 3;
  list.SetCount(3);
  EXPECT_EQ(list.GetItem(3)->value, 3);
  list.SetCount(2);
  list.SetCount(3);
  EXPECT_EQ(list.GetItem(1)->value, 1);
  EXPECT_EQ(list.GetItem(3)->value, 30);
  list.SetCount(-1);
  EXPECT_EQ(list.GetCount(), 3);
  EXPECT_EQ(list.GetItem(0), nullptr);
  EXPECT_EQ(list.GetItem(4), nullptr);
}

TEST_F(ListKvsTest, FollowersAreToldEachCountInTheirOrder) {
  list.SetCount(2);
  list.SetCount(2);
  list.SetCount(-5);
  EXPECT_EQ(root.told, (std::vector<std::pair<const CKvsBase*, int>>{{&list, 2}, {&list, 2}}));
}

TEST_F(ListKvsTest, AListThatStandsAloneHasNobodyToTell) {
  List alone(nullptr);
  alone.SetCount(2);
  EXPECT_TRUE(root.told.empty());
}

TEST_F(ListKvsTest, AMissingSectionIsShownAndTheItemKeepsItsDefaults) {
  load(list, "LIST { Count 3; Other 5; ITEM_1 { Value 1 }; ITEM_3 { Value 3 } }");
  EXPECT_EQ(list.GetCount(), 3);
  EXPECT_EQ(list.GetItem(2)->value, 20);
  EXPECT_EQ(list.GetItem(3)->value, 3);
  EXPECT_EQ(list.other, 5);
  EXPECT_EQ(root.texts, std::vector<std::string>{"Error in the KVS-FILE\nmissing"});
}

TEST_F(ListKvsTest, CountsThatAreMissingOrNegativeOrNoNumbers) {
  list.SetCount(2);
  load(list, "LIST { Count -1; ITEM_1 {}; ITEM_2 {} }");
  EXPECT_EQ(list.GetCount(), 2);
  load(list, "LIST { Count \"3\" }");
  EXPECT_EQ(list.GetCount(), 0);
  list.SetCount(2);
  load(list, "LIST { Other 3 }");
  EXPECT_EQ(list.GetCount(), 0);
  list.SetCount(2);
  load(list, "OTHER { Count 1 }");
  EXPECT_EQ(list.GetCount(), 2);
  EXPECT_TRUE(root.texts.empty());
}

TEST_F(ListKvsTest, ACountIsBelievedOnlyAsFarAsTheFileBearsItOut) {
  load(list, "LIST { Count 2147483647; ITEM_1 { Value 1 } }");
  EXPECT_EQ(list.GetCount(), 1 + kCountSlack);
  ASSERT_EQ(root.texts.size(), std::size_t{1} + kCountSlack);
  EXPECT_EQ(root.texts.front(),
            "Error in the KVS-FILE\nSection LIST says 2147483647, which is far more than the 1 sections that "
            "follow; 2049 "
            "are kept");
}

TEST_F(ListKvsTest, ItemsAreCheckedWithTheirNumberAndOnlyDeep) {
  list.SetCount(3);
  list.GetItem(1)->faulty = true;
  list.GetItem(3)->faulty = true;
  ValidationList messages;
  EXPECT_EQ(list.Validate(messages, 0), 0U);
  EXPECT_TRUE(messages.empty());
  EXPECT_EQ(list.Validate(messages, 1), 2U);
  EXPECT_EQ(test::textsOf(messages), (std::vector<std::string>{"item 1", "item 3"}));
}

TEST_F(ListKvsTest, CopyingRebuildsTheList) {
  list.SetCount(2);
  list.GetItem(2)->value = 99;
  list.other = 4;
  List copy(&root);
  copy.SetCount(5);
  copy.CopyFrom(list);
  EXPECT_EQ(savedText(copy), savedText(list));
}

}  // namespace core_list_kvs_test
}  // namespace gridbay
