#include "platform/tsb/known_files.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <vector>

#include "platform/tsb/tsb_file.h"
#include "tests/support/grids.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_known_files_test {

class Known : public ::testing::Test {
 protected:
  // Whether the check is made again.
  bool isAsked(const std::string& file, bool holds = true) {
    bool asked = false;
    const bool held = files.hold({&file, 1}, [&](std::span<const std::string> paths) {
      asked = true;
      return std::vector<bool>(paths.size(), holds);
    })[0];
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

TEST_F(Known, OfSeveralFilesThoseNotKnownAreCheckedAtOnce) {
  const std::vector<std::string> paths{path, folder.write("b", "text"), folder.write("c", "text")};
  waitAMoment();
  EXPECT_TRUE(isAsked(paths[1]));
  const std::vector<std::string> unknown{paths[0], paths[2]};
  EXPECT_EQ(files.hold(paths,
                       [&unknown](std::span<const std::string> asked) {
                         EXPECT_TRUE(std::ranges::equal(asked, unknown));
                         return std::vector<bool>{true, false};
                       }),
            (std::vector<bool>{true, true, false}));
  EXPECT_FALSE(isAsked(paths[0]));
  EXPECT_TRUE(isAsked(paths[2]));
}

TEST_F(Known, AMissingFileIsLeftToTheCheck) {
  EXPECT_TRUE(isAsked(folder.file("none"), false));
}

TEST_F(Known, AFileIsKnownInOneState) {
  EXPECT_FALSE(files.known(path));
  waitAMoment();
  EXPECT_FALSE(files.known(path));
  EXPECT_TRUE(isAsked(path));
  EXPECT_TRUE(files.known(path));
  EXPECT_EQ(files.known(path), files.known((folder.path() / "." / "a").string()));
  folder.write("a", "tend");
  EXPECT_FALSE(files.known(path));
  EXPECT_FALSE(files.known(folder.file("none")));
}

TEST_F(Known, AStampTellsTheContentFromTheRest) {
  const std::optional<FileStamp> before = fileStamp(path);
  ASSERT_TRUE(before);
  EXPECT_EQ(fileStamp(path), before);
  waitAMoment();
  std::filesystem::permissions(path, std::filesystem::perms::owner_all);
  ASSERT_TRUE(fileStamp(path));
  EXPECT_NE(fileStamp(path), before);
  EXPECT_TRUE(fileStamp(path)->isOfSameContent(*before));
  folder.write("a", "tend");
  EXPECT_FALSE(fileStamp(path)->isOfSameContent(*before));
  EXPECT_FALSE(fileStamp(folder.file("none")));
  EXPECT_FALSE(fileStamp(""));
}

TEST_F(Known, ADataFileIsReadAnewOnceItIsWrittenTo) {
  const std::string grid = folder.file("g.tsb2");
  test::writeGrid(grid, {.noJ = 10});
  waitAMoment();
  for (int i = 0; i < 3; ++i) {
    const Result<TsbFile> file = TsbFile::open(grid);
    ASSERT_TRUE(file) << file.error();
    EXPECT_EQ(file->definition().pointCount(), 80U);
    std::vector<float> values(80);
    EXPECT_TRUE(file->read(1, 0, std::span(values)));
    EXPECT_EQ(values[79], -5.0F);
  }
  const Result<TsbFile> before = TsbFile::open(grid);
  test::writeGrid(grid, {.noJ = 12}, [](int, int) { return -7.0F; });
  std::vector<float> values(80);
  const Outcome read = before->read(1, 0, std::span(values));
  ASSERT_FALSE(read);
  EXPECT_EQ(read.error(), "cannot read \"" + grid + "\": it has been written to since it was opened");
  for (int i = 0; i < 3; ++i) {
    const Result<TsbFile> file = TsbFile::open(grid);
    ASSERT_TRUE(file) << file.error();
    EXPECT_EQ(file->definition().pointCount(), 96U);
    if (i == 0) waitAMoment();
  }
}

}  // namespace platform_known_files_test
}  // namespace gridbay
