#include "core/file_name.h"

#include <gtest/gtest.h>

#include "core/kdl_writer.h"
#include "core/selections.h"

namespace gridbay {
namespace core_file_name_test {

UFileName loaded(const std::string& name, const std::string& documentPath) {
  KvsHandle file = kvsCreate();
  kvsPutParamFilename(*file, "FILE_NAME", name);
  UFileName fileName;
  fileName.Load(&file->tree().root(), documentPath);
  return fileName;
}

std::string saved(const UFileName& name, const std::string& documentPath) {
  KvsHandle file = kvsCreate();
  name.Save(*file, documentPath);
  return *file->text();
}

TEST(FileName, IsShownAsGivenAndOpenedFromTheSetupsFolder) {
  const UFileName name = loaded("../data/grid.tsb2", "/home/m/case/setup.v27");
  EXPECT_EQ(name.text(), "../data/grid.tsb2");
  EXPECT_EQ(name.absolute(), "/home/m/data/grid.tsb2");
  EXPECT_EQ(saved(name, "/home/m/case/other.v27"), "FILE_NAME (file)\"../data/grid.tsb2\"\n");
}

TEST(FileName, IsRelativeOnFileSoThatAFolderCanMove) {
  UFileName name;
  name = "/home/m/case/grids/a b.tsb2";
  EXPECT_EQ(name.text(), "/home/m/case/grids/a b.tsb2");
  EXPECT_EQ(saved(name, "/home/m/case/setup.v27"), "FILE_NAME (file)\"grids/a b.tsb2\"\n");
  EXPECT_EQ(saved(name, "/home/m/other/setup.v27"), "FILE_NAME (file)\"../case/grids/a b.tsb2\"\n");
  // Two trees that share nothing: only the absolute name would go on working.
  EXPECT_EQ(saved(name, "/mnt/disk/setup.v27"), "FILE_NAME (file)\"/home/m/case/grids/a b.tsb2\"\n");
}

TEST(FileName, FollowsASetupThatIsSavedElsewhere) {
  const UFileName name = loaded("grid.tsb2", "/home/m/case/setup.v27");
  EXPECT_EQ(saved(name, "/home/m/copy/setup.v27"), "FILE_NAME (file)\"../case/grid.tsb2\"\n");
}

TEST(FileName, AMissingKeywordLeavesTheName) {
  const KvsHandle file = kvsCreate();
  UFileName name;
  name = "/x/grid.tsb2";
  name.Load(&file->tree().root(), "/home/setup.v27");
  EXPECT_EQ(name.text(), "/x/grid.tsb2");
  EXPECT_EQ(saved(UFileName(), "/home/setup.v27"), "FILE_NAME (file)\"\"\n");
  EXPECT_EQ(UFileName().absolute(), "");
}

TEST(FileName, ResultFilesAreAKindOfTheirOwn) {
  KvsHandle file = kvsCreate();
  UResultFileName name;
  name = "out.tsb0";
  name.Save(*file, "setup.v27", "File_Name");
  EXPECT_EQ(*file->text(), "File_Name (result)\"out.tsb0\"\n");
  UFileName input;
  input.Load(&file->tree().root(), "setup.v27", "File_Name");
  EXPECT_TRUE(input.empty());
  UResultFileName back;
  back.Load(&file->tree().root(), "setup.v27", "file_name");
  EXPECT_EQ(back.text(), "out.tsb0");
}

TEST(Selection, KeepsTheFileAndItsItems) {
  UTsbSelection selection(2);
  EXPECT_EQ(selection.items, (std::vector<std::uint32_t>{1, 2}));
  selection.items = {4, 7};
  selection.fileName = "/d/series.tsb0";
  KvsHandle file = kvsCreate();
  selection.Save(*file, "/d/setup.v27");
  EXPECT_EQ(*file->text(), "File_Name (file)\"series.tsb0\"\nItem_Numbers 4 7\n");
  UTsbSelection back(1);
  back.Load(&file->tree().root(), "/d/setup.v27", 2);
  EXPECT_EQ(back.items, selection.items);
  EXPECT_EQ(back.fileName.absolute(), "/d/series.tsb0");
  back.Load(&file->tree().root(), "/d/setup.v27", 1);
  EXPECT_EQ(back.items, (std::vector<std::uint32_t>{4}));
  UTsbSelection copy;
  copy.UpdateData(back);
  EXPECT_EQ(copy.items, back.items);
  copy.SetNoItems(-1);
  EXPECT_EQ(copy.items.size(), 1U);
  copy.SetNoItems(0);
  EXPECT_TRUE(copy.items.empty());
}

TEST(Selection, AreasAndLines) {
  USubArea area{{0, 9, 2}, {1, 5, 1}};
  USubArea copy;
  copy.UpdateData(area);
  EXPECT_EQ(copy, area);
  USubLine line{0, 100, 10};
  USubLine lineCopy;
  lineCopy.UpdateData(line);
  EXPECT_EQ(lineCopy, line);
}

}  // namespace core_file_name_test
}  // namespace gridbay
