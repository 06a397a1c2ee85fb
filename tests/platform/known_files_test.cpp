#include "platform/tsb/known_files.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>

#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace {

class Known : public ::testing::Test {
 protected:
  // Whether the check is made again.
  bool isAsked(const std::string& file, bool holds = true) {
    bool asked = false;
    const bool held = files.holds(file, [&] {
      asked = true;
      return holds;
    });
    EXPECT_EQ(held, !asked || holds);
    return asked;
  }
  static void waitAMoment() { ::usleep(2'100'000); }

  test::TemporaryFolder folder;
  std::string path = folder.write("a", "text");
  KnownFiles files;
};

TEST_F(Known, AFileIsCheckedOnceUntilItIsWrittenTo) {
  waitAMoment();
  EXPECT_TRUE(isAsked(path));
  EXPECT_FALSE(isAsked(path));
  EXPECT_FALSE(isAsked(folder.path() / "." / "a"));
  folder.write("a", "tend");
  EXPECT_TRUE(isAsked(path));
}

TEST_F(Known, AFileThatWasJustWrittenIsNotKept) {
  EXPECT_TRUE(isAsked(path));
  EXPECT_TRUE(isAsked(path));
}

TEST_F(Known, AFileThatFailsIsNotKept) {
  waitAMoment();
  EXPECT_TRUE(isAsked(path, false));
  EXPECT_TRUE(isAsked(path));
  EXPECT_FALSE(isAsked(path));
}

TEST_F(Known, AnotherFileOfTheSameNameIsChecked) {
  folder.write("b", "text");
  waitAMoment();
  EXPECT_TRUE(isAsked(path));
  std::filesystem::rename(folder.path() / "b", path);
  EXPECT_TRUE(isAsked(path));
}

TEST_F(Known, AMissingFileIsLeftToTheCheck) {
  EXPECT_TRUE(isAsked(folder.file("none"), false));
}

}  // namespace
}  // namespace gridbay
