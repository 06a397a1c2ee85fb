#include "core/section_index.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

#include "core/kdl_reader.h"
#include "core/kvs.h"

namespace gridbay {
namespace core_section_index_test {

const Node* walk(const Node& section, std::string_view name, std::uint32_t occurrence, bool wantSection) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (node->isSection() == wantSection && sameName(node->name(), name) && --occurrence == 0) return node;
  }
  return nullptr;
}

// Asks for every name there is, in any case, with one occurrence too many, of either kind, and for some that
// are not there.
void expectAsAWalkFinds(const Node& section) {
  std::vector<std::string> names{"", "1", "POINT_", "POINT_0", "POINT_01", "POINT_4294967297", "x"};
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    names.emplace_back(node->name());
    std::string other(node->name());
    for (char& c : other) c = static_cast<char>(std::isupper(c) ? std::tolower(c) : std::toupper(c));
    names.push_back(other);
  }
  std::ranges::sort(names);
  names.erase(std::unique(names.begin(), names.end()), names.end());
  for (const std::string& name : names) {
    for (const std::uint32_t occurrence : {0U, 1U, 2U, 3U, 7U}) {
      const Node* expectedSection = occurrence == 0 ? nullptr : walk(section, name, occurrence, true);
      const Node* expectedKeyword = occurrence == 0 ? nullptr : walk(section, name, occurrence, false);
      ASSERT_EQ(section.section(name, occurrence), expectedSection) << name << " " << occurrence;
      ASSERT_EQ(section.keyword(name, occurrence), expectedKeyword) << name << " " << occurrence;
    }
  }
}

std::string run(std::string_view prefix, int first, int last, std::string_view ending) {
  std::string text;
  for (int i = first; i <= last; ++i) text.append(prefix).append(std::to_string(i)).append(ending);
  return text;
}

void expectAsAWalkFinds(const std::string& text) {
  const ReadText read = readKdl(FileText(text));
  ASSERT_NE(read.tree, nullptr) << read.error.text();
  expectAsAWalkFinds(read.tree->root());
}

TEST(SectionIndex, NumberedRuns) {
  expectAsAWalkFinds(run("POINT_", 1, 200, " {}\n"));
  expectAsAWalkFinds("Count 3\n" + run("POINT_", 0, 150, " {}\n") + "Other 1\n" +
                     run("Corner", 95, 300, " 1 2\n"));
  expectAsAWalkFinds(run("P", 99999930, 100000050, " 1\n"));
  expectAsAWalkFinds(run("\"", 1, 120, "\" 1\n"));
}

TEST(SectionIndex, ANameInARunAndElsewhere) {
  expectAsAWalkFinds(run("POINT_", 1, 200, " {}\n") + "POINT_7 {}\nPOINT_7 1\n");
  expectAsAWalkFinds("point_9 {}\n" + run("POINT_", 1, 200, " {}\n"));
  expectAsAWalkFinds(run("POINT_", 1, 100, " {}\n") + run("POINT_", 50, 150, " {}\n"));
  expectAsAWalkFinds(run("POINT_", 1, 100, " {}\n") + run("POINT_", 1, 100, " 1\n"));
  expectAsAWalkFinds(run("POINT_", 1, 100, " {}\n") + "POINT_01 {}\nPOINT_001 {}\n");
}

TEST(SectionIndex, ManyRunsAndShortOnes) {
  std::string text;
  for (char c = 'A'; c < 'J'; ++c) text += run(std::string(1, c) + "_", 1, 70, " 1\n");
  expectAsAWalkFinds(text);
  text.clear();
  for (char c = 'A'; c < 'Z'; ++c) text += run(std::string(1, c), 1, 5, " {}\n");
  expectAsAWalkFinds(text);
}

TEST(SectionIndex, RepeatedNames) {
  std::string text;
  for (int i = 0; i < 300; ++i) text += i % 3 == 0 ? "Same {}\n" : i % 3 == 1 ? "same 1\n" : "Other 1\n";
  expectAsAWalkFinds(text);
}

TEST(SectionIndex, BlanksAtTheEndsOfNames) {
  expectAsAWalkFinds(run("\"POINT_", 1, 200, " \" {}\n"));
  expectAsAWalkFinds(run("POINT_", 1, 200, " {}\n") + "\"POINT_7  \" {}\n\"POINT_8 \" 1\n\"\" 1\n\" \" 2\n");
  expectAsAWalkFinds(run("Same", 1, 40, " 1\n") + run("\"same", 1, 40, " \" 1\n"));
  const ReadText read = readKdl(FileText(run("\"P_", 1, 99, " \" 1\n") + "\"P_5\" 2\nTail 1\n\"tail \" 2\n"));
  const Node& root = read.tree->root();
  EXPECT_EQ(root.keyword("p_5")->name(), "P_5 ");
  EXPECT_EQ(root.keyword("P_5  ", 2)->name(), "P_5");
  EXPECT_EQ(root.keyword("tail ")->name(), "Tail");
  EXPECT_EQ(root.keyword("tail", 2)->name(), "tail ");
}

TEST(SectionIndex, NamesAsChanceMakesThem) {
  std::mt19937 random(20261121);
  const auto any = [&random](int most) { return static_cast<int>(random() % static_cast<unsigned>(most)); };
  for (int round = 0; round < 200; ++round) {
    std::string text;
    const int count = 1 + any(260);
    for (int i = 0; i < count; ++i) {
      std::string name(static_cast<std::size_t>(1 + any(10)), static_cast<char>('a' + any(2)));
      if (any(2) == 0) name += std::to_string(any(120));
      if (any(3) == 0) name = "N" + std::to_string(i);
      if (any(8) == 0) name = '"' + name + " \"";
      text += name + (any(2) == 0 ? " {}\n" : " 1\n");
    }
    expectAsAWalkFinds(text);
  }
}

TEST(SectionIndex, GrowsWithAFileInWriting) {
  KvsFile file;
  kvsAddTarget(file, "T");
  for (int i = 1; i <= 300; ++i) {
    kvsPutParam(file, "N" + std::to_string(i), i);
    const Node& target = *file.tree().root().first();
    ASSERT_NE(target.keyword("n" + std::to_string(i)), nullptr) << i;
    ASSERT_EQ(target.keyword("N" + std::to_string(i + 1)), nullptr) << i;
  }
  kvsPutParam(file, "N5", 0);
  const Node& target = *file.tree().root().first();
  ASSERT_NE(target.keyword("N5", 2), nullptr);
  EXPECT_EQ(kvsGetInt(&target.keyword("N5", 2)->values().front()), 0);
  EXPECT_EQ(kvsGetInt(&target.keyword("N5", 1)->values().front()), 5);
  expectAsAWalkFinds(target);
}

TEST(SectionIndex, GrowsBetweenLookups) {
  ParameterTree tree;
  std::mt19937 random(20261122);
  Node* last = nullptr;
  for (int i = 0; i < 400; ++i) {
    const bool isNumbered = random() % 2 == 0;
    const std::string name = isNumbered ? "N_" + std::to_string(i) : "Same" + std::to_string(random() % 9);
    Node* node = random() % 3 == 0
                     ? tree.makeKeyword(tree.keep(name), tree.makeValue(ValueKind::integer, "1"))
                     : tree.makeSection(tree.keep(name));
    ParameterTree::append(tree.root(), last, *node);
    last = node;
    if (i % 20 == 0) expectAsAWalkFinds(tree.root());
  }
  expectAsAWalkFinds(tree.root());
}

TEST(Values, LongTextsAndAllKinds) {
  ParameterTree tree;
  for (const std::size_t length : {0U, 1U, 8189U, 8190U, 8191U, 8192U, 100000U}) {
    const std::string text(length, 'x');
    for (const ValueKind kind : {ValueKind::boolean, ValueKind::integer, ValueKind::real, ValueKind::string,
                                 ValueKind::fileName, ValueKind::resultFileName}) {
      const Value value = tree.makeValue(kind, tree.keep(text));
      EXPECT_EQ(value.kind(), kind);
      EXPECT_EQ(value.text(), text) << length;
    }
  }
}

TEST(Values, MoreOfThemThanOnePieceHolds) {
  std::string text = "A";
  constexpr int kCount = 200000;
  for (int i = 0; i < kCount; ++i) text.append(" ").append(std::to_string(i));
  const ReadText read = readKdl(FileText(text));
  ASSERT_NE(read.tree, nullptr);
  const std::span<const Value> values = read.tree->root().first()->values();
  ASSERT_EQ(values.size(), std::size_t{kCount});
  for (int i = 0; i < kCount; ++i) ASSERT_EQ(kvsGetInt(&values[static_cast<std::size_t>(i)]), i);
}

}  // namespace core_section_index_test
}  // namespace gridbay
