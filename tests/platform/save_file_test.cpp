#include "platform/files/save_file.h"

#include <gmock/gmock.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <functional>

#include "core/kvs.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"
#include "tests/support/grids.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_save_file_test {

namespace fs = std::filesystem;
using test::SmallDisk;
using test::TemporaryFolder;
using test::textOf;
using ::testing::HasSubstr;

std::ptrdiff_t filesIn(const fs::path& folder) {
  return std::distance(fs::directory_iterator(folder), {});
}

TEST(SaveFile, MakesAndReplacesAFile) {
  const TemporaryFolder folder;
  const std::string path = folder.file("ä b.v27");
  ASSERT_TRUE(saveFile(path, "one"));
  EXPECT_EQ(textOf(path), "one");
  ASSERT_TRUE(saveFile(path, std::string(1 << 20, 'x')));
  EXPECT_EQ(textOf(path).size(), std::size_t{1} << 20);
  EXPECT_EQ(filesIn(folder.path()), 1);
}

TEST(SaveFile, WithoutACommitNothingIsLeftAndTheOldFileStays) {
  const TemporaryFolder folder;
  const std::string path = folder.write("s", "old");
  {
    Result<FileSave> save = FileSave::begin(path);
    ASSERT_TRUE(save);
    ASSERT_TRUE(save->write("new"));
  }
  EXPECT_EQ(textOf(path), "old");
  EXPECT_EQ(filesIn(folder.path()), 1);
}

TEST(SaveFile, ALinkToADataFileStaysALink) {
  const TemporaryFolder folder;
  fs::create_directory(folder.path() / "sub");
  fs::create_symlink("sub/grid.tsb2", folder.path() / "link.tsb2");
  for (int time = 0; time < 2; ++time) {  // at first the link leads to nothing
    test::writeGrid(folder.file("link.tsb2"), {});
    EXPECT_TRUE(fs::is_symlink(folder.path() / "link.tsb2"));
    EXPECT_TRUE(TsbFile::open(folder.file("sub/grid.tsb2")));
  }
}

TEST(SaveFile, ALinkStaysALink) {
  const TemporaryFolder folder;
  fs::create_directory(folder.path() / "sub");
  const std::string target = folder.write("sub/target", "old");
  fs::create_symlink("sub/target", folder.path() / "link");
  ASSERT_TRUE(saveFile(folder.file("link"), "new"));
  EXPECT_TRUE(fs::is_symlink(folder.path() / "link"));
  EXPECT_EQ(textOf(target), "new");
}

TEST(SaveFile, PermissionsAndOwnerStay) {
  const TemporaryFolder folder;
  const std::string path = folder.write("s", "old");
  ASSERT_EQ(::chmod(path.c_str(), 0640), 0);
  const bool given = ::chown(path.c_str(), 12, 34) == 0;
  ASSERT_TRUE(saveFile(path, "new"));
  struct stat status {};
  ASSERT_EQ(::stat(path.c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 07777U, 0640U);
  if (given) {
    EXPECT_EQ(status.st_uid, 12U);
    EXPECT_EQ(status.st_gid, 34U);
  }
}

TEST(SaveFile, AFullDiskLeavesTheOldFile) {
  const TemporaryFolder folder;
  const SmallDisk disk(folder.path() / "disk", 64 << 10);
  if (!disk.mounted()) GTEST_SKIP() << "no file system can be mounted here";
  const std::string path = folder.write("disk/s.v27", "old");
  const Outcome saved = saveFile(path, std::string(1 << 20, 'x'));
  ASSERT_FALSE(saved);
  EXPECT_EQ(saved.error(),
            "cannot save \"" + path + "\": No space left on device. The old file is unchanged.");
  EXPECT_EQ(textOf(path), "old");
  EXPECT_EQ(filesIn(folder.path() / "disk"), 1);

  const Result<TsbWriter> writer =
      TsbWriter::create(folder.file("disk/g.tsb2"), test::definitionOf({.noJ = 900, .noK = 900}));
  if (writer) {
    std::vector<float> values(900 * 900, 1.0F);
    TsbWriter& open = const_cast<TsbWriter&>(*writer);
    const Outcome written = open.write(1, 0, std::span<const float>(values));
    const Outcome committed = written ? open.commit() : written;
    ASSERT_FALSE(committed);
    EXPECT_THAT(committed.error(), HasSubstr("the disk is full"));
  } else {
    EXPECT_THAT(writer.error(), HasSubstr("cannot write"));
  }
  EXPECT_FALSE(fs::exists(folder.file("disk/g.tsb2")));
}

TEST(SaveFile, PlacesThatCannotBeWritten) {
  const TemporaryFolder folder;
  EXPECT_THAT(saveFile(folder.path().string(), "x").error(), HasSubstr("a folder or a device has that name"));
  EXPECT_THAT(saveFile(folder.file("no/s"), "x").error(), HasSubstr("No such file or directory"));
  EXPECT_THAT(saveFile("/proc/s", "x").error(), HasSubstr("cannot save \"/proc/s\""));
}

// A process with no privileges, as a user is.
int asUser(const std::function<int()>& action) {
  const pid_t child = ::fork();
  if (child == 0) {
    if (::geteuid() == 0 && (::setgid(65534) != 0 || ::setuid(65534) != 0)) ::_exit(99);
    ::_exit(action());
  }
  int status = 0;
  ::waitpid(child, &status, 0);
  return WEXITSTATUS(status);
}

TEST(SaveFile, AReadOnlyFolderAndAReadOnlyFile) {
  const TemporaryFolder folder;
  const std::string path = folder.write("s", "old");
  ASSERT_EQ(::chmod(path.c_str(), 0444), 0);
  fs::permissions(folder.path(), fs::perms::owner_all | fs::perms::group_all | fs::perms::others_all);
  EXPECT_EQ(asUser([&] {
              const Outcome saved = saveFile(path, "new");
              return !saved && saved.error() == "cannot save \"" + path + "\": the file is read-only" ? 7 : 1;
            }),
            7);
  ASSERT_EQ(::chmod(path.c_str(), 0666), 0);
  ASSERT_EQ(::chmod(folder.path().c_str(), 0555), 0);
  EXPECT_EQ(asUser([&] {
              const Outcome saved = saveFile(path, "new");
              return !saved && saved.error().find("Permission denied") != std::string::npos ? 7 : 1;
            }),
            7);
  EXPECT_EQ(textOf(path), "old");
}

}  // namespace platform_save_file_test
}  // namespace gridbay
