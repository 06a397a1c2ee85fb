// Sections beside each other, and what two make of a third, on small sections of the tests' own.

#include <gmock/gmock.h>

#include "compare/tree_difference.h"
#include "compare/tree_merge.h"
#include "tests/support/model.h"

namespace gridbay {
namespace compare_merge_test {

using test::fileOf;

KvsHandle setup(const std::string& body) {
  return fileOf("VANE27_NESTED_MODEL {\n" + body + "\n}\n");
}
std::string bodyOf(const KvsFile& file) {
  std::string text = *file.text();
  std::erase(text, '\n');
  std::string body;
  for (const char c : text.substr(text.find('{') + 1, text.rfind('}') - text.find('{') - 1)) {
    if (c != ' ' || (!body.empty() && body.back() != ' ')) body += c;
  }
  while (body.ends_with(' ')) body.pop_back();
  return body;
}
const Node& target(const KvsFile& file) {
  return *kvsTargetByNameNum(file, "VANE27_NESTED_MODEL", 1);
}

std::string textOf(const std::optional<std::string>& value) {
  return value ? "<" + *value + ">" : "none";
}
std::string textOf(const KeywordDifference& difference) {
  return difference.path + (difference.isSection ? "/ " : " ") + textOf(difference.own) + " " +
         textOf(difference.other);
}

struct DifferenceCase {
  const char* what;
  const char* own;
  const char* other;
  std::vector<std::string> differences;
};

const DifferenceCase kDifferences[] = {
    {"the same in another order", "a 1\nb 2\nS { c 3 }", "S { c 3 }\nb 2\na 1", {}},
    {"the same number written in other words", "a 1.0\nb 2", "a 1.00\nb 2.0", {}},
    {"a value of each kind",
     "a 1\nb 0.5\nc #true\nd \"x\"\ne (file)\"f.tsb2\"\nf (result)\"g.tsb0\"",
     "a 2\nb 0.25\nc #false\nd \"y\"\ne (file)\"h.tsb2\"\nf (result)\"i.tsb0\"",
     {"a <1> <2>", "b <0.5> <0.25>", "c <#true> <#false>", "d <x> <y>", "e <f.tsb2> <h.tsb2>",
      "f <g.tsb0> <i.tsb0>"}},
    {"a text and a number", "a \"1\"", "a 1", {"a <1> <1>"}},
    {"more values", "a 1 2", "a 1 2 3", {"a <1 2> <1 2 3>"}},
    {"a keyword of one", "a 1\nb 2", "b 2\nc 3", {"a <1> none", "c none <3>"}},
    {"a section of one is told as one", "S { a 1\nT { b 2 } }", "", {"S/ <> none"}},
    {"an entry of a list",
     "L { n 1\nE_1 { a 1 } }",
     "L { n 2\nE_1 { a 5 }\nE_2 { a 2 } }",
     {"L/n <1> <2>", "L/E_1/a <1> <5>", "L/E_2/ none <>"}},
    {"sections of one name",
     "W { x 1 }\nW { x 2 }",
     "W { x 1 }\nW { x 3 }\nW { x 4 }",
     {"W[2]/x <2> <3>", "W[3]/ none <>"}},
    {"a keyword and a section of one name", "E 1\nE { a 1 }", "E 2\nE { a 2 }", {"E <1> <2>", "E/a <1> <2>"}},
    {"names by letter", "Abc 1", "aBC 1", {}},
};

TEST(TreeDifference, TellsWhatDiffersAndTakesIt) {
  for (const DifferenceCase& each : kDifferences) {
    SCOPED_TRACE(each.what);
    const KvsHandle own = setup(each.own);
    const KvsHandle other = setup(each.other);
    std::vector<std::string> texts;
    const std::vector<KeywordDifference> found = differencesOf(target(*own), target(*other));
    for (const KeywordDifference& difference : found) texts.push_back(textOf(difference));
    EXPECT_EQ(texts, each.differences);

    const KvsHandle none = withTaken(*own, *other, [](const std::string&) { return false; });
    EXPECT_TRUE(differencesOf(target(*none), target(*own)).empty());
    const KvsHandle all = withTaken(*own, *other, [](const std::string&) { return true; });
    EXPECT_TRUE(differencesOf(target(*all), target(*other)).empty());
    for (const KeywordDifference& one : found) {
      const KvsHandle taken =
          withTaken(*own, *other, [&](const std::string& path) { return path == one.path; });
      const std::vector<KeywordDifference> left = differencesOf(target(*taken), target(*other));
      // Of several of one name the first that is left takes the number of one that is gone.
      EXPECT_EQ(left.size(), found.size() - 1) << one.path;
    }
  }
}

struct MergeCase {
  const char* what;
  const char* base;
  const char* own;
  const char* other;
  const char* merged;  // with conflicts as `own` has it
  std::vector<std::string> conflicts = {};
  std::size_t taken = 0;
};

const MergeCase kMerges[] = {
    {"nothing changed", "a 1", "a 1", "a 1", "a 1"},
    {"changed by one", "a 1\nb 1", "a 2\nb 1", "a 1\nb 1", "a 2 b 1"},
    {"changed by the other", "a 1\nb 1", "a 1\nb 1", "a 1\nb 2", "a 1 b 2", {}, 1},
    {"changed by both in different places",
     "S { a 1\nb 1 }",
     "S { a 2\nb 1 }",
     "S { a 1\nb 2 }",
     "S { a 2 b 2 }",
     {},
     1},
    {"changed alike", "a 1", "a 2", "a 2", "a 2"},
    {"changed differently", "a 1", "a 2", "a 3", "a 2", {"a <1> <2> <3>"}},
    {"removed by one", "S { a 1 }\nb 1", "b 1", "S { a 1 }\nb 1", "b 1"},
    {"removed by the other", "S { a 1 }\nb 1", "S { a 1 }\nb 1", "b 1", "b 1", {}, 1},
    {"removed by both", "a 1\nb 1", "b 1", "b 1", "b 1"},
    {"removed and changed", "S { a 1 }", "", "S { a 2 }", "", {"S/ <> none <>"}},
    {"changed and removed", "S { a 1 }", "S { a 2 }", "", "S { a 2 }", {"S/ <> <> none"}},
    {"added by one each", "a 1", "a 1\nb 2", "a 1\nc 3", "a 1 b 2 c 3", {}, 1},
    {"added alike", "", "S { a 1 }", "S { a 1 }", "S { a 1 }"},
    {"a section added differently",
     "",
     "S { a 1\nb 1 }",
     "S { a 1\nb 2 }",
     "S { a 1 b 1 }",
     {"S/b none <1> <2>"}},
    {"entries of a list by their numbers",
     "L { E_1 { a 1 }\nE_2 { a 1 } }",
     "L { E_1 { a 2 }\nE_2 { a 1 } }",
     "L { E_1 { a 1 }\nE_2 { a 3 } }",
     "L { E_1 { a 2 } E_2 { a 3 } }",
     {},
     1},
    {"new entries of a list that others refer to",
     "No_Of_Areas 1\nAREA_1 { a 1 }",
     "No_Of_Areas 2\nAREA_1 { a 1 }\nAREA_2 { a 2 }",
     "No_Of_Areas 2\nAREA_1 { a 1 }\nAREA_2 { a 3 }",
     "No_Of_Areas 2 AREA_1 { a 1 } AREA_2 { a 2 }",
     {"AREA_2/ none <> <>"}},
    {"new entries of both, by number",
     "number_of_dikes 1\nDIKE_1 { a 1 }\nz 1",
     "number_of_dikes 2\nDIKE_1 { a 1 }\nDIKE_2 { a 2 }\nz 1",
     "number_of_dikes 3\nDIKE_1 { a 9 }\nDIKE_2 { a 3 }\nDIKE_3 { a 4 }\nz 2",
     "number_of_dikes 4 DIKE_1 { a 9 } z 2 DIKE_2 { a 2 } DIKE_3 { a 3 } DIKE_4 { a 4 }",
     {},
     4},
    {"new entries of both, of one name",
     "number_of_weirs 0",
     "number_of_weirs 1\nweir_data { a 1 }",
     "number_of_weirs 1\nweir_data { a 2 }",
     "number_of_weirs 2 weir_data { a 1 } weir_data { a 2 }",
     {},
     1},
    {"the same new entry",
     "number_of_weirs 0",
     "number_of_weirs 1\nweir_data { a 1 }",
     "number_of_weirs 2\nweir_data { a 1 }\nweir_data { a 2 }",
     "number_of_weirs 2 weir_data { a 1 } weir_data { a 2 }",
     {},
     1},
    {"new entries with no count",
     "",
     "DIKE_1 { a 1 }",
     "DIKE_1 { a 2 }",
     "DIKE_1 { a 1 }",
     {"DIKE_1/ none <> <>"}},
};

TEST(TreeMerge, TakesWhatOneHasChanged) {
  for (const MergeCase& each : kMerges) {
    SCOPED_TRACE(each.what);
    const KvsHandle base = setup(each.base);
    const KvsHandle own = setup(each.own);
    const KvsHandle other = setup(each.other);
    const MergedTree merged =
        mergeTrees(*base, *own, *other, [](const MergeConflict&) { return MergeSide::own; });
    EXPECT_EQ(bodyOf(*merged.file), each.merged);
    EXPECT_EQ(merged.takenFromOther, each.taken);
    std::vector<std::string> conflicts;
    for (const MergeConflict& conflict : merged.conflicts)
      conflicts.push_back(conflict.path + (conflict.isSection ? "/ " : " ") + textOf(conflict.base) + " " +
                          textOf(conflict.own) + " " + textOf(conflict.other));
    EXPECT_EQ(conflicts, each.conflicts);
  }
}

TEST(TreeMerge, AConflictIsAsChosen) {
  const KvsHandle base = setup("a 1\nb 1\nS { c 1 }");
  const KvsHandle own = setup("a 2\nb 2");
  const KvsHandle other = setup("a 3\nb 3\nS { c 2 }");
  const MergedTree merged = mergeTrees(*base, *own, *other, [](const MergeConflict& conflict) {
    return conflict.path == "b" ? MergeSide::own : MergeSide::other;
  });
  EXPECT_EQ(bodyOf(*merged.file), "a 3 b 2 S { c 2 }");
  EXPECT_EQ(merged.conflicts.size(), 3U);
}

}  // namespace compare_merge_test
}  // namespace gridbay
