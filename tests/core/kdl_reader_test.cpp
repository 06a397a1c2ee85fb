#include "core/kdl_reader.h"

#include <gmock/gmock.h>

#include "core/kdl_writer.h"

namespace gridbay {
namespace core_kdl_reader_test {

using ::testing::HasSubstr;

std::string errorOf(std::string_view text) {
  const ReadText read = readKdl(FileText(text));
  return read.tree == nullptr ? read.error.text() : "";
}

// Reads a text and writes it again.
std::string normalised(std::string_view text) {
  const ReadText read = readKdl(FileText(text));
  return read.tree == nullptr ? read.error.text() : *kdlText(read.tree->root());
}

TEST(KdlReader, SectionsKeywordsAndAllKindsOfValues) {
  EXPECT_EQ(
      normalised(
          "T {A 1 -2 +3 1_000\nB 1.5 -2e3 0x1F #inf #-inf\nC #true #false; D (file)\"a\" (result)b \"c d\"\n"
          "  E {}; F\n}"),
      "T {\n"
      "    A 1 -2 3 1000\n"
      "    B 1.5 -2e3 31 #inf #-inf\n"
      "    C #true #false\n"
      "    D (file)\"a\" (result)\"b\" \"c d\"\n"
      "    E {}\n"
      "    F\n"
      "}\n");
}

TEST(KdlReader, AnEmptySectionIsToldFromAKeywordWithNoValues) {
  const ReadText read = readKdl(FileText("A {}\nB\n"));
  ASSERT_NE(read.tree, nullptr);
  EXPECT_TRUE(read.tree->root().first()->isSection());
  EXPECT_FALSE(read.tree->root().first()->next()->isSection());
}

TEST(KdlReader, EscapesAndTextsOfSeveralLines) {
  EXPECT_EQ(normalised("A \"q\\\" b\\\\ n\\n t\\t u\\u{e9} s\\s e\\   \n  nd\"\n"),
            "A \"q\\\" b\\\\ n\\n t\\t ué s  end\"\n");
  EXPECT_EQ(normalised("A \"\"\"\n    one\n      two\n\n    \"\"\"\n"), "A \"one\\n  two\\n\"\n");
  EXPECT_EQ(normalised("A #\"raw \\n \"quoted\"\"#\n"), "A \"raw \\\\n \\\"quoted\\\"\"\n");
}

TEST(KdlReader, CommentsAndSlashdashes) {
  EXPECT_EQ(normalised(
                "// one\nA 1 /* two /* three */ */ 2 /- 3\n/- B { C 1; D { E } }\nF /- { G } { H } /- { I }\n"
                "J \\ // goes on\n 7\n/- K x=1 #null\n"),
            "A 1 2\nF {\n    H\n}\nJ 7\n");
}

TEST(KdlReader, ErrorsNameLineColumnWhatWasFoundAndWhatWasExpected) {
  EXPECT_EQ(errorOf("A {\n  B 1\n"),
            "line 3, column 1: found the end of the file, expected \"}\" to close the block of \"A\"");
  EXPECT_EQ(errorOf("A 1\n}\n"),
            "line 2, column 1: found \"}\", expected a section or keyword; no block is open here");
  EXPECT_EQ(errorOf("A 1 ]\n"), "line 1, column 5: found \"]\", expected a value");
  EXPECT_EQ(errorOf("A \"ü\" 1.x\n"), "line 1, column 9: found \"x\", expected a digit");
  EXPECT_EQ(errorOf("A \"open\nB\n"),
            "line 1, column 8: found the end of the line, expected a closing quote on the same line (a text "
            "of several "
            "lines stands between \"\"\")");
  EXPECT_EQ(errorOf("A true\n"), "line 1, column 3: found \"true\", expected #true (or the word in quotes)");
  EXPECT_EQ(errorOf("A \"\\q\"\n"),
            "line 1, column 4: found an unknown escape in this text, expected \\n, \\r, \\t, \\b, \\f, \\s, "
            "\\\", \\\\ or "
            "\\u{...}");
}

TEST(KdlReader, WhatASetupCannotHoldIsRefusedAndNamed) {
  EXPECT_THAT(errorOf("A x=1\n"), HasSubstr("found a property (name=value), which a setup does not have"));
  EXPECT_THAT(errorOf("A #null\n"), HasSubstr("found #null, which a setup does not have"));
  EXPECT_THAT(errorOf("A (i32)1\n"), HasSubstr("found the type annotation (i32)"));
  EXPECT_THAT(errorOf("(t)A 1\n"), HasSubstr("found a type annotation, which a name here cannot have"));
  EXPECT_THAT(errorOf("A 1 { B }\n"), HasSubstr("\"A\" has values, and so it cannot have a block"));
  EXPECT_THAT(errorOf("A 0x1_0000_0000_0000_0000\n"), HasSubstr("a number of at most 64 bits"));
}

TEST(KdlReader, TextThatIsNotUtf8) {
  EXPECT_EQ(errorOf("A 1\nB \"\xFF\"\n"),
            "line 2, column 4: found a byte that is not UTF-8 text, expected readable UTF-8 text");
  EXPECT_EQ(errorOf(std::string_view("A\0B", 3)),
            "line 1, column 2: found a zero byte: this is not a text file, expected readable UTF-8 text");
  EXPECT_THAT(errorOf("\xFF\xFE"
                      "A"),
              HasSubstr("found UTF-16 text"));
  EXPECT_THAT(errorOf("A \x1B\n"), HasSubstr("found a control character"));
  EXPECT_EQ(normalised("\xEF\xBB\xBF"
                       "A 1\n"),
            "A 1\n");
}

TEST(KdlReader, NestingIsBounded) {
  const auto nested = [](std::size_t depth) {
    std::string text;
    for (std::size_t i = 0; i < depth; ++i) text += "A {\n";
    for (std::size_t i = 0; i < depth; ++i) text += "}\n";
    return text;
  };
  EXPECT_EQ(errorOf(nested(kDeepestBlock)), "");
  EXPECT_THAT(errorOf(nested(kDeepestBlock + 1)), HasSubstr("no more than 512 blocks inside each other"));
  EXPECT_THAT(errorOf(nested(1000000)), HasSubstr("no more than 512 blocks inside each other"));
  EXPECT_THAT(errorOf("/- " + nested(1000000)), HasSubstr("no more than 512 blocks inside each other"));
}

TEST(KdlReader, EveryTruncationOfAFileIsReadOrRefused) {
  const std::string whole =
      "T { // c\n A 1 -2.5e3 \"t\\u{41}\" (file)\"f\" #true\n /* x */ S { B \"\"\"\n  m\n  \"\"\"; C #\"r\"# "
      "} }\n";
  for (std::size_t length = 0; length <= whole.size(); ++length) {
    const ReadText read = readKdl(FileText(std::string_view(whole).substr(0, length)));
    EXPECT_TRUE(read.tree != nullptr || !read.error.expected.empty()) << length;
  }
}

TEST(KdlWriter, NamesAndTextsThatNeedQuotes) {
  ParameterTree tree;
  Node* last = nullptr;
  ValueList none;
  for (const char* name : {"plain-Name_1", "two words", "1st", "true", "a=b", "", "-5", ".5", "ö"}) {
    Node* node = tree.makeKeyword(name, none);
    ParameterTree::append(tree.root(), last, *node);
    last = node;
  }
  EXPECT_EQ(*kdlText(tree.root()),
            "plain-Name_1\n\"two words\"\n\"1st\"\n\"true\"\n\"a=b\"\n\"\"\n\"-5\"\n\".5\"\nö\n");
}

TEST(KdlWriter, ATextThatIsNotUtf8IsNotWritten) {
  ParameterTree tree;
  ParameterTree::append(tree.root(), nullptr,
                        *tree.makeKeyword("Name", tree.makeValue(ValueKind::string, "\xFF")));
  const Result<std::string> text = kdlText(tree.root());
  ASSERT_FALSE(text);
  EXPECT_EQ(text.error(), "a name or text of \"Name\" is not UTF-8");
}

}  // namespace core_kdl_reader_test
}  // namespace gridbay
