// Lists whose sections have one name, and keywords with several numbers.

#include <gmock/gmock.h>

#include <limits>

#include "core/keyword_rows.h"
#include "core/list_kvs.h"
#include "core/table_code.h"
#include "tests/support/model.h"

namespace gridbay {
namespace core_repeated_items_test {

using test::savedText;

class Gate final : public TableKvs<Gate> {
 public:
  using TableKvs::TableKvs;

  std::int32_t type = 0;
  double height = 1.5;
  std::array<double, 3> losses{1, 2, 3};

  static constexpr auto table() {
    return keywords(values("Attributes", &Gate::type, &Gate::height), keyword("Losses", &Gate::losses));
  }
};

class Gates final : public ListKvs<Gates, Gate> {
 public:
  using ListKvs::ListKvs;
  static constexpr auto table() { return section("GATES", repeatedItems("No_Of_Gates", "gate")); }

  void completeLoaded(Gate& gate, KvsSection section) {
    if (section == nullptr) gate.height = 9;
  }
  std::vector<std::string> told;

 protected:
  void ShowMessage(const std::string& text) override { told.push_back(text); }
};

TEST(RepeatedItems, TheCountThenTheSectionsOfOneName) {
  Gates gates(nullptr);
  gates.SetCount(2);
  gates.at(2).type = 7;
  EXPECT_EQ(savedText(gates),
            "GATES {\n"
            "    No_Of_Gates 2\n"
            "    gate {\n        Attributes 0 1.5\n        Losses 1.0 2.0 3.0\n    }\n"
            "    gate {\n        Attributes 7 1.5\n        Losses 1.0 2.0 3.0\n    }\n"
            "}\n");
}

TEST(RepeatedItems, AreFoundByTheirOrder) {
  Gates gates(nullptr);
  gates.SetCount(5);
  gates.at(1).type = 4;
  test::load(gates,
             "GATES { gate { Attributes 1 }; Other {}; GATE { Losses 5.0 6.0 }; No_Of_Gates 3\n"
             " Gate {} ; gate { Attributes 9 } }");
  ASSERT_EQ(gates.GetCount(), 3);
  EXPECT_EQ(gates.at(1).type, 1);
  EXPECT_EQ(gates.at(1).height, 1.5);
  EXPECT_EQ(gates.at(2).losses, (std::array<double, 3>{5, 6, 3}));
  EXPECT_EQ(gates.at(3).type, 0);
}

TEST(RepeatedItems, ASectionThatIsMissingIsADefaultItemAndTold) {
  Gates gates(nullptr);
  test::load(gates, "GATES { No_Of_Gates 2; gate { Attributes 1 2.0 } }");
  ASSERT_EQ(gates.GetCount(), 2);
  EXPECT_EQ(gates.at(1).height, 2);
  EXPECT_EQ(gates.at(2).height, 9);
}

TEST(RepeatedItems, CountsThatAreNone) {
  Gates gates(nullptr);
  gates.SetCount(3);
  test::load(gates, "GATES { gate {} }");
  EXPECT_EQ(gates.GetCount(), 0);
  test::load(gates, "GATES { No_Of_Gates -4; gate {} }");
  EXPECT_EQ(gates.GetCount(), 0);
  EXPECT_TRUE(gates.told.empty());
  test::load(gates, "GATES { No_Of_Gates 2147483647; gate {} }");
  EXPECT_EQ(gates.GetCount(), 1 + kCountSlack);
  EXPECT_EQ(gates.told.size(), 1U);
}

TEST(RepeatedItems, APathHasTheNumberInBrackets) {
  Gates gates(nullptr);
  gates.SetCount(3);
  gates.at(3).height = 4;
  const std::string place;
  const auto text = [&](std::string_view path) {
    KvsFile file;
    PathAccess access{PathAccess::What::write, &file, nullptr, &place};
    return gates.AccessPath(path, access) ? *file.text() : "none";
  };
  EXPECT_EQ(text("GATES/gate[3]/Attributes"), "Attributes 0 4.0\n");
  EXPECT_EQ(text("gates/GATE/attributes"), "Attributes 0 1.5\n");
  EXPECT_EQ(text("GATES/gate[2]"), "gate {\n    Attributes 0 1.5\n    Losses 1.0 2.0 3.0\n}\n");
  EXPECT_EQ(text("GATES/No_Of_Gates"), "No_Of_Gates 3\n");
  for (const char* none : {"GATES/gate[4]", "GATES/gate[0]", "GATES/gate[-1]", "GATES/gate[]",
                           "GATES/gate[1x]", "GATES/gate[1", "GATES/gate1", "GATES/gate[99999999999]"})
    EXPECT_EQ(text(none), "none") << none;
}

TEST(RepeatedItems, ANumberThatIsNoneIsTheSameAsItself) {
  Gate gate(nullptr);
  gate.losses[1] = std::numeric_limits<double>::quiet_NaN();
  Gate other(nullptr);
  EXPECT_FALSE(gate.SameState(other));
  other.AssignState(gate);
  EXPECT_TRUE(gate.SameState(other));
  EXPECT_EQ(gate.TakeChange(other), nullptr);
}

}  // namespace core_repeated_items_test
}  // namespace gridbay
