// Files from strangers: counts, depths, lengths and repetitions that no one would write in earnest.

#include <gmock/gmock.h>
#include <malloc.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <fstream>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "setup/setup_file.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace core_hostile_test {

using ::testing::HasSubstr;
using ::testing::SizeIs;

#if defined(__SANITIZE_ADDRESS__)
constexpr bool kMemoryIsPlain = false;
#else
constexpr bool kMemoryIsPlain = true;
#endif

// Memory that a process of its own comes to hold at most while it does something, in bytes beyond what it
// had.
std::size_t peakOf(const std::function<void()>& action) {
  int pipe[2];
  if (::pipe(pipe) != 0) return 0;
  const pid_t child = ::fork();
  if (child == 0) {
    const auto high = [] {
      std::ifstream status("/proc/self/status");
      std::size_t kilobytes = 0;
      for (std::string word; status >> word;) {
        if (word == "VmHWM:") status >> kilobytes;
      }
      return kilobytes * 1024;
    };
    ::malloc_trim(0);  // what earlier work has left would hide what this takes
    std::ofstream("/proc/self/clear_refs") << "5";
    const std::size_t before = high();
    action();
    const std::size_t peak = high() - before;
    const bool told = ::write(pipe[1], &peak, sizeof peak) == sizeof peak;
    ::_exit(told ? 0 : 1);
  }
  ::close(pipe[1]);
  std::size_t peak = 0;
  const bool told = ::read(pipe[0], &peak, sizeof peak) == sizeof peak;
  ::close(pipe[0]);
  ::waitpid(child, nullptr, 0);
  EXPECT_TRUE(told);
  return peak;
}

struct CountKeyword {
  const char* section;
  const char* keyword;
  int (*count)(CGlobalKvs&);
};

void PrintTo(const CountKeyword& row, std::ostream* out) {
  *out << row.keyword;
}

const CountKeyword kCounts[] = {
    {"BATHYMETRY_SELECTION", "No_Of_Areas", [](CGlobalKvs& root) { return root.bathymetry->GetCount(); }},
    {"OPEN_BOUNDARY", "Number_Of_Boundaries", [](CGlobalKvs& root) { return root.boundary->GetCount(); }},
    {"SOURCE_AND_SINK", "Number_Of_Sources", [](CGlobalKvs& root) { return root.sourceSink->GetCount(); }},
    {"MASS_BUDGET", "NoOfPolygons", [](CGlobalKvs& root) { return root.massBudget->GetCount(); }},
};

class HostileCounts : public ::testing::TestWithParam<CountKeyword> {
 protected:
  // The count after a load of a file that says it is `value`.
  int countFor(const std::string& value) {
    texts.clear();
    const std::string text = std::string("VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { ") +
                             GetParam().section + " { " + GetParam().keyword + " " + value + "; }; }; }";
    CollectingMessageHost host;
    const test::TemporaryFolder folder;
    Result<SetupFile> setup = SetupFile::open(folder.write("s.v27", text), &host);
    EXPECT_TRUE(setup) << value;
    texts = host.texts;
    ValidationList messages;
    setup->model().Validate(messages, 1);
    EXPECT_TRUE(setup->save(folder.file("t.v27"))) << value;
    return GetParam().count(setup->model());
  }
  // The Wetland Sweep Kit fixes some of the counts.
  bool isPinned() const {
    const std::string_view keyword = GetParam().keyword;
    return theEdition.wetlandSweepKit && (keyword == "No_Of_Areas" || keyword == "NoOfPolygons");
  }
  std::vector<std::string> texts;
};

TEST_P(HostileCounts, AreBelievedAsFarAsTheFileBearsThemOut) {
  if (isPinned()) GTEST_SKIP() << "this edition fixes the count";
  constexpr int kSlack = 2048;
  CGlobalKvs fresh;
  const int kept = GetParam().count(fresh);
  EXPECT_EQ(countFor("0"), 0);
  EXPECT_EQ(countFor("-1"), kept);
  EXPECT_EQ(countFor("-2147483648"), kept);
  for (const char* wrongKind : {"\"7\"", "#true", "(file)\"7\"", "#nan", "#inf", "-#inf"}) {
    if (wrongKind[0] == '-') continue;
    EXPECT_EQ(countFor(wrongKind), 0) << wrongKind;
  }
  EXPECT_EQ(countFor("3.9"), 3);
  EXPECT_THAT(texts, SizeIs(::testing::Le(1U)));
  EXPECT_EQ(countFor("2147483647"), kSlack);
  ASSERT_THAT(texts, SizeIs(1));  // all faults in one list
  EXPECT_THAT(texts[0], HasSubstr("2147483647"));
  const bool isTold =
      std::string_view(GetParam().keyword) != "NoOfPolygons";  // a polygon that is not there is no fault
  EXPECT_EQ(texts[0].find("(2048 times)") != std::string::npos, isTold) << texts[0];
  EXPECT_LT(texts[0].size(), 1000U);
  EXPECT_EQ(countFor("99999999999999999999"), 0);
}

INSTANTIATE_TEST_SUITE_P(Counts, HostileCounts, ::testing::ValuesIn(kCounts),
                         [](const auto& row) { return std::string(row.param.keyword); });

TEST(HostileCounts, TheCornersOfAPolygon) {
  for (const char* value : {"-2147483648", "-1", "0", "2147483647", "\"4\"", "4.5", "#true"}) {
    test::Model model;
    test::load(*model.root.massBudget,
               std::string("MASS_BUDGET { NoOfPolygons 1; POLYGON_1 { NoOfCornerPoints ") + value +
                   "; CornerPoint_1 1 2; CornerPoint_2 3 4; }; }");
    if (theEdition.wetlandSweepKit) continue;
    ASSERT_EQ(model.root.massBudget->GetCount(), 1) << value;
    EXPECT_LE(model.root.massBudget->GetItem(1)->corners.size(), 16U) << value;
  }
}

struct Shape {
  const char* name;
  std::string (*text)();
  bool readable;
};

void PrintTo(const Shape& shape, std::ostream* out) {
  *out << shape.name;
}

std::string repeated(std::string_view piece, int times) {
  std::string text;
  text.reserve(piece.size() * static_cast<std::size_t>(times));
  for (int i = 0; i < times; ++i) text += piece;
  return text;
}

const Shape kShapes[] = {
    {"AMillionNestedBlocks", [] { return repeated("A {\n", 1'000'000); }, false},
    {"AMillionNestedBlocksClosed", [] { return repeated("A {", 1'000'000) + repeated("}", 1'000'000); },
     false},
    {"OneLineOf100MB", [] { return "Name \"" + std::string(100'000'000, 'x') + "\"\n"; }, true},
    {"OneNameOf100MB", [] { return std::string(100'000'000, 'x') + " 1\n"; }, true},
    {"OneNumberOf10MB", [] { return "Name " + std::string(10'000'000, '1') + "\n"; }, true},
    {"OneCommentOf100MB", [] { return "/*" + std::string(100'000'000, '*') + "*/ A 1\n"; }, true},
    {"EscapesOf20MB", [] { return "Name \"" + repeated("\\n", 10'000'000) + "\"\n"; }, true},
    {"AMillionRepeatsOfOneName", [] { return repeated("Drying_Depth 0.5\n", 1'000'000); }, true},
    {"AMillionRepeatsOfOneSection", [] { return repeated("POINT_1 {}\n", 1'000'000); }, true},
    {"AKeywordWithTenMillionValues", [] { return "Corner" + repeated(" 7", 10'000'000) + "\n"; }, true},
    {"AMillionEmptyLines", [] { return repeated("\n", 1'000'000) + "A 1\n"; }, true},
    {"AMillionSlashdashes", [] { return repeated("/-A 1\n", 1'000'000); }, true},
};

class HostileShapes : public ::testing::TestWithParam<Shape> {};

TEST_P(HostileShapes, AreReadOrRefusedInBoundedMemory) {
  const std::string text = GetParam().text();
  {
    const ReadText read = readKdl(FileText(text));
    EXPECT_EQ(read.tree != nullptr, GetParam().readable) << read.error.text();
    if (read.tree == nullptr) EXPECT_THAT(read.error.text(), HasSubstr("512 blocks"));
  }
  if (!kMemoryIsPlain) return;
  constexpr std::size_t kMost = 10;
  constexpr std::size_t kGround = std::size_t{4} << 20;  // what any process takes
  const std::size_t peak = peakOf([&text] {
    const ReadText read = readKdl(FileText(text));
    if (read.tree == nullptr) return;
    // Looking names up, and the last of repeated ones, is a part of reading.
    const Node& root = read.tree->root();
    for (const char* name : {"Drying_Depth", "POINT_1", "nothing"}) {
      root.keyword(name, 1'000'000);
      root.section(name, 1'000'000);
    }
  });
  std::printf("%.1f times the file of %zu bytes\n",
              static_cast<double>(peak) / static_cast<double>(text.size()), text.size());
  EXPECT_LT(peak, kMost * text.size() + kGround);
}

INSTANTIATE_TEST_SUITE_P(Shapes, HostileShapes, ::testing::ValuesIn(kShapes),
                         [](const auto& shape) { return std::string(shape.param.name); });

TEST(HostileModel, AMillionSectionsThatNothingCountsAreNotTaken) {
  const test::TemporaryFolder folder;
  const std::string path = folder.write(
      "s.v27", "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { OPEN_BOUNDARY { Number_Of_Boundaries 2\n" +
                   repeated("BOUNDARY_3 {}\n", 1'000'000) + "} } }");
  CollectingMessageHost host;
  Result<SetupFile> setup = SetupFile::open(path, &host);
  ASSERT_TRUE(setup);
  EXPECT_EQ(setup->model().boundary->GetCount(), 2);
}

}  // namespace core_hostile_test
}  // namespace gridbay
