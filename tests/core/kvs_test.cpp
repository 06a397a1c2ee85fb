#include "core/kvs.h"

#include <gmock/gmock.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <limits>

#include "core/kdl_reader.h"
#include "core/kdl_writer.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace core_kvs_test {

using test::TemporaryFolder;
using test::textOf;
using ::testing::HasSubstr;

// A file with every kind of value, in the order of the calls.
KvsHandle sample() {
  KvsHandle file = kvsCreate();
  kvsAddTarget(*file, "TARGET");
  kvsPutParam(*file, "Integer", -7);
  kvsPutParam(*file, "Float", 0.02F);
  kvsPutParam(*file, "Double", 0.02);
  kvsPutParam(*file, "Boolean", true);
  kvsPutParam(*file, "String", "a \"b\"\n c ");
  kvsPutParamFilename(*file, "File", "../data/grid.tsb2");
  kvsPutParamResultFilename(*file, "Result", "out put.tsb0");
  kvsPutListParam(*file, "Pair", "ii", 3, 4);
  kvsPutListParam(*file, "Date", "iiiiii", 1990, 1, 1, 12, 0, 0);
  kvsAddKeyword(*file, "Mixed");
  kvsAddInt(*file, 1);
  kvsAddFloat(*file, 1e10F);
  kvsAddDouble(*file, 1.0 / 3);
  kvsAddString(*file, "s");
  kvsAddBool(*file, false);
  kvsAddFilename(*file, "f");
  kvsAddResultFilename(*file, "r");
  kvsAddSection(*file, "SECTION");
  kvsAddSection(*file, "EMPTY");
  kvsEndSection(*file);
  kvsPutParam(*file, "Inner", 1);
  kvsEndSection(*file);
  kvsPutParam(*file, "After", 2);
  kvsEndSection(*file);
  return file;
}

TEST(Kvs, WritesTheWholeTreeAsText) {
  EXPECT_EQ(*sample()->text(),
            "TARGET {\n"
            "    Integer -7\n"
            "    Float 0.02\n"
            "    Double 0.02\n"
            "    Boolean #true\n"
            "    String \"a \\\"b\\\"\\n c \"\n"
            "    File (file)\"../data/grid.tsb2\"\n"
            "    Result (result)\"out put.tsb0\"\n"
            "    Pair 3 4\n"
            "    Date 1990 1 1 12 0 0\n"
            "    Mixed 1 10000000000.0 0.3333333333333333 \"s\" #false (file)\"f\" (result)\"r\"\n"
            "    SECTION {\n"
            "        EMPTY {}\n"
            "        Inner 1\n"
            "    }\n"
            "    After 2\n"
            "}\n");
}

TEST(Kvs, WhatIsWrittenIsReadBackEqual) {
  const TemporaryFolder folder;
  const std::string path = folder.file("a b ü.v27");
  KvsHandle file = sample();
  ASSERT_TRUE(kvsWrite(*file, path));
  KvsHandle back = kvsLoadFile(path, 0);
  ASSERT_EQ(kvsPeekErrorGlb(), kKvsNoError);
  EXPECT_TRUE(sameTree(file->tree().root(), back->tree().root()));
  kvsClose(&back);
  EXPECT_EQ(back, nullptr);
}

class KvsReading : public ::testing::Test {
 protected:
  KvsHandle file = sample();
  KvsSection target = kvsTargetByNameNum(*file, "target", 1);
};

TEST_F(KvsReading, FindsByNameWithoutRegardToCase) {
  ASSERT_NE(target, nullptr);
  EXPECT_EQ(kvsTargetByNameNum(*file, "TARGET", 2), nullptr);
  EXPECT_EQ(kvsTargetByNameNum(*file, "TARGET", 0), nullptr);
  const KvsSection section = kvsSectionByNameNum(target, "Section", 1);
  ASSERT_NE(section, nullptr);
  EXPECT_NE(kvsSectionByNameNum(section, "empty", 1), nullptr);
  EXPECT_EQ(kvsSectionByNameNum(target, "Integer", 1), nullptr);
  EXPECT_EQ(kvsKeywordByNameNum(target, "SECTION", 1), nullptr);
  EXPECT_EQ(kvsGetNoKeywords(target), 11);
}

TEST(Kvs, BlanksAtTheEndOfANameAreWrittenAndMakeNoDifference) {
  for (const int others : {0, 30, 200}) {
    const KvsHandle file = kvsCreate();
    kvsAddTarget(*file, "T");
    for (int i = 0; i < others; ++i) kvsPutParam(*file, "Other" + std::to_string(i * 3), i);
    kvsPutParam(*file, "Kind ", 1);
    kvsPutParam(*file, "kind", 2);
    kvsAddSection(*file, "Section  ");
    kvsEndSection(*file);
    kvsPutParam(*file, " Kind", 3);
    const std::string text = *file->text();
    EXPECT_NE(text.find("    \"Kind \" 1\n    kind 2\n    \"Section  \" {}\n    \" Kind\" 3\n"), text.npos);
    const ReadText read = readKdl(FileText(text));
    for (const Node* target : {read.tree->root().section("T"), file->tree().root().section("T ")}) {
      for (const char* name : {"Kind", "KIND ", "kind   "}) {
        std::int32_t value = 0;
        kvsGetParam(target, name, &value, 1, 1);
        EXPECT_EQ(value, 1) << name << others;
        kvsGetParam(target, name, &value, 2, 1);
        EXPECT_EQ(value, 2) << name << others;
        EXPECT_EQ(kvsKeywordByNameNum(target, name, 3), nullptr) << name << others;
      }
      EXPECT_NE(kvsSectionByNameNum(target, "SECTION", 1), nullptr);
      EXPECT_EQ(kvsSectionByNameNum(target, "Section x", 1), nullptr);
      EXPECT_EQ(kvsKeywordByNameNum(target, "Kin", 1), nullptr);
      EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(target, " Kind", 1), 1)), 3);
    }
  }
}

TEST_F(KvsReading, FillsVariablesOfTheirKind) {
  std::int32_t integer = 0;
  float single = 0;
  double twice = 0;
  bool flag = false;
  std::string text;
  std::string name;
  std::string result;
  kvsGetParam(target, "INTEGER", &integer, 1, 1);
  kvsGetParam(target, "Float", &single, 1, 1);
  kvsGetParam(target, "Double", &twice, 1, 1);
  kvsGetParam(target, "Boolean", &flag, 1, 1);
  kvsGetParam(target, "String", &text, 1, 1);
  kvsGetParamFilename(target, "File", &name, 1, 1);
  kvsGetParamResultFilename(target, "Result", &result, 1, 1);
  EXPECT_EQ(integer, -7);
  EXPECT_EQ(single, 0.02F);
  EXPECT_EQ(twice, 0.02);
  EXPECT_TRUE(flag);
  EXPECT_EQ(text, "a \"b\"\n c ");
  EXPECT_EQ(name, "../data/grid.tsb2");
  EXPECT_EQ(result, "out put.tsb0");
  std::int32_t j = 0;
  std::int32_t k = 0;
  kvsGetListParam(target, "Pair", 1, "ii", &j, &k);
  EXPECT_EQ(j, 3);
  EXPECT_EQ(k, 4);
}

TEST_F(KvsReading, AMissingKeywordLeavesTheVariableAlone) {
  std::int32_t integer = 42;
  kvsGetParam(target, "Nothing", &integer, 1, 1);
  kvsGetParam(target, "Integer", &integer, 2, 1);
  kvsGetParam(target, "Integer", &integer, 1, 2);
  EXPECT_EQ(integer, 42);
  EXPECT_EQ(kvsPeekErrorGlb(), kKvsNoError);
}

TEST_F(KvsReading, NumbersConvertAndOtherKindsLeaveTheVariableAlone) {
  double twice = 0;
  kvsGetParam(target, "Integer", &twice, 1, 1);
  EXPECT_EQ(twice, -7);
  std::int32_t integer = 42;
  kvsGetParam(target, "Float", &integer, 1, 1);
  EXPECT_EQ(integer, 0);
  integer = 42;
  kvsGetParam(target, "Boolean", &integer, 1, 1);
  kvsGetParam(target, "String", &integer, 1, 1);
  kvsGetParam(target, "Mixed", &integer, 1, 2);  // 1e10 is out of range
  EXPECT_EQ(integer, 42);
  bool flag = true;
  kvsGetParam(target, "Integer", &flag, 1, 1);
  EXPECT_TRUE(flag);
  std::string text = "stays";
  kvsGetParam(target, "File", &text, 1, 1);
  kvsGetParamFilename(target, "String", &text, 1, 1);
  kvsGetParamResultFilename(target, "File", &text, 1, 1);
  EXPECT_EQ(text, "stays");
}

TEST_F(KvsReading, AListOfMixedItems) {
  const KvsKeyword mixed = kvsKeywordByNameNum(target, "mixed", 1);
  ASSERT_NE(mixed, nullptr);
  ASSERT_EQ(kvsGetNoParams(mixed), 7);
  EXPECT_EQ(kvsParamByNum(mixed, 0), nullptr);
  EXPECT_EQ(kvsParamByNum(mixed, 8), nullptr);
  EXPECT_EQ(kvsGetInt(kvsParamByNum(mixed, 1)), 1);
  EXPECT_EQ(kvsGetFloat(kvsParamByNum(mixed, 2)), 1e10F);
  EXPECT_EQ(kvsGetDouble(kvsParamByNum(mixed, 3)), 1.0 / 3);
  EXPECT_EQ(kvsGetString(kvsParamByNum(mixed, 4)), "s");
  EXPECT_FALSE(kvsGetBool(kvsParamByNum(mixed, 5)));
  EXPECT_EQ(kvsGetFilename(kvsParamByNum(mixed, 6)), "f");
  EXPECT_EQ(kvsGetResultFilename(kvsParamByNum(mixed, 7)), "r");
}

TEST(Kvs, RepeatedNamesAreToldApartByOccurrence) {
  const TemporaryFolder folder;
  std::string text = "T { A 1; a 2; S { X 1 }; s { X 2 } }\nT { A 3 }\n";
  KvsHandle file = kvsLoadFile(folder.write("f", text), 0);
  const KvsSection first = kvsTargetByNameNum(*file, "T", 1);
  std::int32_t value = 0;
  kvsGetParam(first, "A", &value, 2, 1);
  EXPECT_EQ(value, 2);
  kvsGetParam(kvsSectionByNameNum(first, "S", 2), "X", &value, 1, 1);
  EXPECT_EQ(value, 2);
  kvsGetParam(kvsTargetByNameNum(*file, "T", 2), "A", &value, 1, 1);
  EXPECT_EQ(value, 3);
}

TEST(Kvs, LookupsAmongManySiblings) {
  constexpr int kMany = 3000;
  KvsHandle file = kvsCreate();
  kvsAddTarget(*file, "T");
  for (int i = 1; i <= kMany; ++i) {
    kvsAddSection(*file, "Point_" + std::to_string(i));
    kvsPutParam(*file, "N", i);
    kvsEndSection(*file);
    kvsPutParam(*file, i % 2 == 0 ? "SAME" : "same", i);
  }
  kvsEndSection(*file);
  const KvsSection target = kvsTargetByNameNum(*file, "T", 1);
  for (int i = 1; i <= kMany; ++i) {
    std::int32_t value = 0;
    const KvsSection section = kvsSectionByNameNum(target, "POINT_" + std::to_string(i), 1);
    ASSERT_NE(section, nullptr);
    kvsGetParam(section, "n", &value, 1, 1);
    ASSERT_EQ(value, i);
    kvsGetParam(target, "Same", &value, i, 1);
    ASSERT_EQ(value, i);
  }
  EXPECT_EQ(kvsSectionByNameNum(target, "Point_3001", 1), nullptr);
  EXPECT_EQ(kvsKeywordByNameNum(target, "Same", kMany + 1), nullptr);
}

TEST(Kvs, AFileInWritingCanBeReadAtAnyMoment) {
  KvsHandle file = kvsCreate();
  EXPECT_EQ(*file->text(), "");
  kvsAddTarget(*file, "T");
  EXPECT_EQ(*file->text(), "T {}\n");
  EXPECT_NE(kvsTargetByNameNum(*file, "T", 1), nullptr);
  kvsAddSection(*file, "S");
  EXPECT_EQ(*file->text(), "T {\n    S {}\n}\n");
  kvsAddKeyword(*file, "K");
  EXPECT_EQ(*file->text(), "T {\n    S {\n        K\n    }\n}\n");
  kvsAddInt(*file, 1);
  const KvsSection section = kvsSectionByNameNum(kvsTargetByNameNum(*file, "T", 1), "S", 1);
  ASSERT_NE(section, nullptr);
  EXPECT_EQ(kvsGetNoParams(kvsKeywordByNameNum(section, "K", 1)), 1);
  kvsAddInt(*file, 2);
  kvsEndSection(*file);
  EXPECT_EQ(*file->text(), "T {\n    S {\n        K 1 2\n    }\n}\n");
  kvsPutParam(*file, "Last", 3);
  kvsEndSection(*file);
  kvsEndSection(*file);  // one too many
  EXPECT_EQ(*file->text(), "T {\n    S {\n        K 1 2\n    }\n    Last 3\n}\n");
}

TEST(Kvs, WhatIsWrittenToAFileThatWasReadGoesBehindAllThereIs) {
  const TemporaryFolder folder;
  KvsHandle file = kvsLoadFile(folder.write("f", "T { A 1 }"), 0);
  kvsAddTarget(*file, "U");
  kvsPutParam(*file, "B", 2);
  kvsEndSection(*file);
  EXPECT_EQ(*file->text(), "T {\n    A 1\n}\nU {\n    B 2\n}\n");
  ASSERT_TRUE(kvsWrite(*file, folder.file("g")));
  EXPECT_EQ(textOf(folder.file("g")), *file->text());
}

TEST(Kvs, AValueWithNoKeywordIsNotWritten) {
  KvsFile file;
  kvsAddInt(file, 1);
  kvsPutParam(file, "A", 2);
  kvsAddInt(file, 3);
  kvsAddSection(file, "S");
  kvsAddInt(file, 4);
  EXPECT_EQ(*file.text(), "A 2\nS {}\n");
}

TEST(Kvs, ATextThatIsNotUtf8IsToldWithItsKeyword) {
  KvsFile file;
  kvsPutParam(file, "Good", "x");
  kvsAddKeyword(file, "Bad");
  kvsAddString(file, "\xFF");
  ASSERT_FALSE(file.text());
  EXPECT_EQ(file.text().error(), "a name or text of \"Bad\" is not UTF-8");
  EXPECT_EQ(file.tree().root().first(), nullptr);
}

TEST(Kvs, ATextOfManyPiecesIsWrittenWhole) {
  const TemporaryFolder folder;
  KvsFile file;
  std::string expected;
  const std::string longText(100'000, 'x');
  for (int i = 0; i < 150; ++i) {
    const std::string name = "Name_" + std::to_string(i);
    kvsPutParam(file, name, i % 3 == 0 ? std::string_view(longText) : std::string_view("short"));
    expected += name + " \"" + (i % 3 == 0 ? longText : "short") + "\"\n";
  }
  EXPECT_TRUE(*file.text() == expected);
  ASSERT_TRUE(kvsWrite(file, folder.file("f")));
  EXPECT_TRUE(textOf(folder.file("f")) == expected);
}

TEST(Kvs, ASyntaxErrorIsPendingWithItsText) {
  const TemporaryFolder folder;
  const std::string path = folder.write("bad.v27", "T {\n  A 1.x\n}\n");
  KvsHandle file = kvsLoadFile(path, 0);
  ASSERT_NE(file, nullptr);
  EXPECT_EQ(file->tree().root().first(), nullptr);
  EXPECT_NE(kvsPeekErrorGlb(), 0);
  EXPECT_NE(kvsPeekErrorGlb(), 0);
  int line = 0;
  int column = 0;
  std::string text;
  EXPECT_EQ(kvsGetErrorGlb(), 1003);
  EXPECT_EQ(kvsPeekErrorGlb(), 0);
  kvsGetSyntaxErr(file.get(), &line, &column, &text);
  EXPECT_EQ(line, 2);
  EXPECT_EQ(column, 7);
  EXPECT_EQ(text, "Syntax error in \"" + path + "\", line 2, column 7: found \"x\", expected a digit");
}

TEST(Kvs, AFileThatCannotBeReadIsNamed) {
  const TemporaryFolder folder;
  kvsLoadFile(folder.file("none.v27"), 0);
  EXPECT_EQ(kvsGetErrorGlb(), kKvsCannotRead);
  EXPECT_EQ(kvsGetErrorText(), "cannot open \"" + folder.file("none.v27") + "\": No such file or directory");
  kvsLoadFile(folder.path().string(), 0);
  EXPECT_EQ(kvsGetErrorGlb(), kKvsCannotRead);
  EXPECT_THAT(kvsGetErrorText(), HasSubstr("it is not a file"));
  ASSERT_EQ(::mkfifo(folder.file("pipe").c_str(), 0600), 0);
  kvsLoadFile(folder.file("pipe"), 0);
  EXPECT_EQ(kvsGetErrorGlb(), kKvsCannotRead);
}

TEST(Kvs, AWriteThatFailsLeavesTheOldFile) {
  const TemporaryFolder folder;
  KvsHandle file = sample();
  EXPECT_FALSE(kvsWrite(*file, folder.file("no/such/folder.v27")));
  EXPECT_EQ(kvsGetErrorGlb(), kKvsCannotWrite);

  const std::string path = folder.write("old.v27", "old");
  KvsHandle bad = kvsCreate();
  kvsPutParam(*bad, "Name", "\xFF");
  EXPECT_FALSE(kvsWrite(*bad, path));
  EXPECT_EQ(kvsGetErrorGlb(), kKvsCannotWrite);
  EXPECT_EQ(textOf(path), "old");
  EXPECT_EQ(std::distance(std::filesystem::directory_iterator(folder.path()), {}), 1);
}

}  // namespace core_kvs_test
}  // namespace gridbay
