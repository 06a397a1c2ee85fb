#include "platform/files/paths.h"

#include <gtest/gtest.h>

#include <filesystem>

namespace gridbay {
namespace platform_paths_test {

TEST(Paths, Absolute) {
  EXPECT_EQ(absolutePath("../a/b.x", "/c/d"), "/c/a/b.x");
  EXPECT_EQ(absolutePath("/a/./b", "/c"), "/a/b");
  EXPECT_EQ(absolutePath("", "/c"), "");
  EXPECT_EQ(absolutePath("a", ""), (std::filesystem::current_path() / "a").string());
  EXPECT_EQ(folderOfFile("/a/b/c.v27"), "/a/b");
}

TEST(Paths, OnFile) {
  EXPECT_EQ(pathOnFile("/a/b/c", "/a/b"), "c");
  EXPECT_EQ(pathOnFile("/a/c", "/a/b"), "../c");
  EXPECT_EQ(pathOnFile("/a/ü ö/c", "/a"), "ü ö/c");
  EXPECT_EQ(pathOnFile("/x/c", "/a/b"), "/x/c");
}

TEST(Paths, ReadableFiles) {
  EXPECT_TRUE(isReadableFile("/etc/passwd"));
  EXPECT_FALSE(isReadableFile("/etc"));
  EXPECT_FALSE(isReadableFile("/etc/none"));
}

}  // namespace platform_paths_test
}  // namespace gridbay
