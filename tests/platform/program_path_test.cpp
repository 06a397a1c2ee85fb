// Programs and plug-ins that lie where an installation puts them, under a prefix that could be anywhere.

#include "platform/files/program_path.h"

#include <dlfcn.h>
#include <gmock/gmock.h>

#include "plugin/entry_points.h"
#include "tests/support/pages.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_program_path_test {

namespace fs = std::filesystem;
using ::testing::ElementsAre;
using ::testing::HasSubstr;

class Installed : public ::testing::Test {
 protected:
  Installed() {
    fs::create_directories(prefix / "bin");
    fs::create_directories(prefix / GRIDBAY_PLUGIN_FOLDER);
    fs::create_directories(prefix / "share/gridbay-setup/Templates/BIORig");
  }
  std::string install(const std::string& program, const std::string& path) {
    fs::copy_file(test::programPath(program), prefix / path);
    return (prefix / path).string();
  }

  test::TemporaryFolder folder;
  fs::path prefix = fs::canonical(folder.path()) / "a prefix";
};

TEST_F(Installed, ThePartsOfABuildLieBesideEachOther) {
  EXPECT_EQ(pluginFolder() + "/", CKTOConfigFiles::GetProgramPath(1));
  EXPECT_TRUE(fs::exists(pluginFolder() + "/v27raster.so"));
}

TEST_F(Installed, AProgramLooksBelowItsPrefix) {
  const std::string tool = install("v27setup", "bin/v27setup");
  const std::string raster = folder.write("a.asc",
                                          "ncols 2\nnrows 2\nxllcorner 0\nyllcorner 0\ncellsize 1\n"
                                          "1 2\n3 4\n");
  const std::vector<std::string> words{
      "convert", "raster", raster, folder.file("a.tsb2"), "--crs", "UTM-32", "--land", "9", "--force"};
  const test::ProgramRun without = test::runProgram(tool, words);
  EXPECT_EQ(without.status, 2);
  EXPECT_THAT(without.err, HasSubstr((prefix / GRIDBAY_PLUGIN_FOLDER / "v27raster.so").string()));
  install("v27raster.so", GRIDBAY_PLUGIN_FOLDER "/v27raster.so");
  const test::ProgramRun with = test::runProgram(tool, words);
  EXPECT_EQ(with.status, 0) << with.err;

  // By another name that leads to it, too.
  fs::create_symlink(tool, folder.file("linked"));
  fs::remove(prefix / GRIDBAY_PLUGIN_FOLDER / "v27raster.so");
  EXPECT_THAT(test::runProgram(folder.file("linked"), words).err,
              HasSubstr((prefix / GRIDBAY_PLUGIN_FOLDER).string()));

  // A prefix without data is none: what is loaded lies beside the program then.
  fs::remove_all(prefix / "share");
  EXPECT_THAT(test::runProgram(tool, words).err, HasSubstr((prefix / "bin/v27raster.so").string()));
}

TEST_F(Installed, APlugInLooksBelowItsOwnPrefix) {
  const std::string plugin = install("v27nested.so", GRIDBAY_PLUGIN_FOLDER "/v27nested.so");
  folder.write(
      "a prefix/share/gridbay-setup/Templates/BIORig/bed.biorig",
      "BIO_RIG_SETUP { DESCRIPTION \"Bed\"; STATE_VARIABLES { STATE_VARIABLE_1 { SYMBOL \"BED\"; ID 5 } } }");
  void* library = ::dlopen(plugin.c_str(), RTLD_NOW | RTLD_LOCAL);
  ASSERT_NE(library, nullptr) << ::dlerror();
  const auto make = reinterpret_cast<CVdDocTemplate* (*)(int)>(::dlsym(library, "VdGetDocTemplatePtr"));
  {
    test::TestHost host;
    const std::unique_ptr<CVdDocTemplate> documents(make(0));
    const std::unique_ptr<SetupEditor> editor = documents->CreateNewDocument(host);
    const std::string setup = folder.write(
        "s.v27", "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { MODULE_SELECTION { Simulation_Type 9 } } }");
    ASSERT_TRUE(editor->open(setup));
    Form* form = editor->openPage(static_cast<std::int32_t>(PageId::ecoModelDefinition));
    ASSERT_NE(form, nullptr);
    EXPECT_THAT(form->find("Model")->choices, ElementsAre("Bed", "From File ..."));
  }
  ::dlclose(library);
}

}  // namespace platform_program_path_test
}  // namespace gridbay
