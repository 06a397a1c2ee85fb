#include <gmock/gmock.h>

#include <array>
#include <filesystem>
#include <iostream>
#include <string>

#include "core/kdl_reader.h"
#include "core/number_text.h"
#include "platform/files/read_file.h"

namespace gridbay {
namespace core_kdl_suite_test {

namespace fs = std::filesystem;

// What a setup does not have, by the words in which the reader refuses it.
constexpr std::array<std::string_view, 5> kLeftOut{
    "a property (name=value)", "#null, which a setup does not have", "type annotation",
    "has values, and so it cannot have a block", "a number of at most 64 bits"};

ReadText readDocument(const fs::path& path) {
  Result<FileText> text = readFile(path.string());
  return readKdl(std::move(*text));
}

bool isLeftOut(const std::string& error) {
  return std::ranges::any_of(kLeftOut,
                             [&](std::string_view words) { return error.find(words) != error.npos; });
}

// The suite writes numbers in its own way, so they are compared as numbers.
bool sameValue(const Value& a, const Value& b) {
  const auto isNumber = [](const Value& v) {
    return v.kind() == ValueKind::integer || v.kind() == ValueKind::real;
  };
  if (!isNumber(a) || !isNumber(b)) return a.kind() == b.kind() && a.text() == b.text();
  const double x = doubleOfText(a.text()).value_or(0);
  const double y = doubleOfText(b.text()).value_or(0);
  return a.kind() == b.kind() && (x == y || (x != x && y != y));
}

bool sameDocument(const Node* a, const Node* b) {
  for (; a != nullptr && b != nullptr; a = a->next(), b = b->next()) {
    if (a->name() != b->name()) return false;
    // The suite leaves out an empty block.
    const Node* inA = a->isSection() ? a->first() : nullptr;
    const Node* inB = b->isSection() ? b->first() : nullptr;
    if (!sameDocument(inA, inB)) return false;
    const auto valuesA = a->isSection() ? std::span<const Value>() : a->values();
    const auto valuesB = b->isSection() ? std::span<const Value>() : b->values();
    if (!std::ranges::equal(valuesA, valuesB, sameValue)) return false;
  }
  return a == nullptr && b == nullptr;
}

TEST(KdlSuite, ReadsWhatASetupCanHoldAndRefusesTheRest) {
  const fs::path folder = fs::path(GRIDBAY_SHARED_DATA) / "kdl" / "test_cases";
  if (!fs::exists(folder)) GTEST_SKIP() << "the suite is not here";
  int read = 0;
  int refused = 0;
  int leftOut = 0;
  for (const fs::directory_entry& entry : fs::directory_iterator(folder / "input")) {
    SCOPED_TRACE(entry.path().filename().string());
    const std::string name = entry.path().stem().string();
    const ReadText input = readDocument(entry.path());
    const std::string error = input.tree == nullptr ? input.error.text() : "";
    if (name.ends_with("_fail")) {
      EXPECT_NE(error, "");
      ++refused;
    } else if (isLeftOut(error)) {
      // The document really has it: its normalised form, which drops empty blocks and long numbers' bases, is
      // refused too.
      const ReadText expected = readDocument(folder / "expected_kdl" / entry.path().filename());
      const bool hasIt = expected.tree == nullptr && isLeftOut(expected.error.text());
      const bool isNormalisedAway = error.find("64 bits") != error.npos || input.error.found == "\"{\"";
      EXPECT_TRUE(hasIt || isNormalisedAway) << error;
      ++leftOut;
    } else {
      ASSERT_EQ(error, "");
      const ReadText expected = readDocument(folder / "expected_kdl" / entry.path().filename());
      ASSERT_NE(expected.tree, nullptr) << expected.error.text();
      EXPECT_TRUE(sameDocument(input.tree->root().first(), expected.tree->root().first()));
      ++read;
    }
  }
  std::cout << "KDL suite: " << read << " read, " << refused << " refused, " << leftOut
            << " hold what a setup does not\n";
  EXPECT_GT(read, 100);
  EXPECT_GT(refused, 50);
}

}  // namespace core_kdl_suite_test
}  // namespace gridbay
