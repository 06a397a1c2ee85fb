// The pages of the ecological model's definition and of the lists that are made of it.

#include <gmock/gmock.h>

#include <filesystem>

#include "basic/bathymetry.h"
#include "ecology/constants.h"
#include "ecology/forcings.h"
#include "ecology/initial_conditions.h"
#include "ecology/model_definition.h"
#include "ecology/starting_conditions.h"
#include "platform/units/units.h"
#include "tests/ecology/carried_model.h"
#include "tests/support/shapes.h"

namespace gridbay {
namespace ecology_definition_pages_test {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

// A host whose user chooses a file in a plain dialog.
class BrowsingHost final : public test::TestHost {
 public:
  bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) override {
    filters.emplace_back(filter);
    extensions.emplace_back(extension);
    if (!chosenFile) return false;
    *name = *chosenFile;
    return true;
  }
};

constexpr std::string_view kGiven = R"(
  CONSTANTS {
    CONSTANT_1 { SYMBOL "a"; ID 4; QUN_TYPE 100006; DEFAULT_VALUE 2.5; MIN_VALUE 0.0; MAX_VALUE 10.0
                 DESCRIPTION "About a"; ONLINE_HELP "Help on a"; IS_USER_SPECIFIED "YES"
                 SPATIAL_VARIATION "NONE" }
    CONSTANT_2 { SYMBOL "b"; ID 6; UNIT "1/d"; DEFAULT_VALUE 0.5; MAX_VALUE 1.5; BUILT_IN_ID 7 }
    CONSTANT_3 { SYMBOL "c"; ID 9; UNIT "m"; DEFAULT_VALUE 1.25 }
  }
  FORCINGS {
    FORCING_1 { SYMBOL "f"; ID 1; UNIT "m"; SPATIAL_VARIATION "NONE" }
    FORCING_2 { SYMBOL "g"; ID 2; BUILT_IN_ID 7 }
    FORCING_3 { SYMBOL "h"; ID 3 }
  }
  STATE_VARIABLE_EQUATIONS { STATE_VARIABLE_EQUATION_1 { OXY "rea - use" } }
})";

class WqsDefinitionPages : public test::ShapeTest {
 protected:
  WqsDefinitionPages() {
    root().bathymetry->SetNoAreas(2);
    const std::string plankton =
        std::string(test::kCarriedModel.substr(0, test::kCarriedModel.rfind('}'))) + std::string(kGiven);
    templates = folder.path() / "templates";
    std::filesystem::create_directory(templates);
    folder.write("templates/a.biorig", plankton);
    folder.write("templates/b.biorig",
                 "BIO_RIG_SETUP { DESCRIPTION \"Bed\"; STATE_VARIABLES { "
                 "STATE_VARIABLE_1 { SYMBOL \"BED\"; ID 5 } } }");
    definition().FindTemplates(templates.string());
  }
  CWQSModelDefinitionKvs& definition() { return *root().wqsModelDefinition; }
  void openPage(std::string_view pageClass, std::int32_t templateId, PageId id) {
    PageTest::open(pageClass);
    EXPECT_EQ(page->templateId(), templateId);
    EXPECT_EQ(page->pageId(), id);
  }
  void openDefinition() { openPage("CWQSModelDefinitionDlg", 18947, PageId::ecoModelDefinition); }
  void openWithPlankton(std::string_view pageClass, std::int32_t templateId, PageId id) {
    UFileName file;
    file = (templates / "a.biorig").string();
    definition().Choose(file);
    openPage(pageClass, templateId, id);
  }
  using test::PageTest::grid;

  test::TemporaryFolder folder;
  std::filesystem::path templates;
};

TEST_F(WqsDefinitionPages, ControlsOfANewModel) {
  openDefinition();
  EXPECT_EQ(labels(),
            (Labels{"Model Selection", "Model", "File", "...", "Problem", "Summary", "State Variables",
                    "Constants", "Forcings", "Auxiliary Variables", "Processes", "Derived Outputs",
                    "Solution Parameters", "Integration Method", "Update Frequency", "(in AD time steps)",
                    "Disable Processes (AD Transport only)"}));
  EXPECT_EQ(control("Model").choices, (Labels{"Plankton", "Bed", "From File ..."}));
  EXPECT_EQ(control("Model").index, 2);
  EXPECT_TRUE(control("File").usable());
  EXPECT_TRUE(control("...").usable());
  EXPECT_FALSE(control("Problem").visible);
  EXPECT_EQ(text("State Variables"), "0");
  EXPECT_EQ(control("Integration Method").choices, (Labels{"Euler", "RK4", "RKQC"}));
  EXPECT_EQ(control("Integration Method").index, 0);
  EXPECT_EQ(text("Update Frequency"), "1");
  EXPECT_EQ(control("Disable Processes (AD Transport only)").index, 0);
}

TEST_F(WqsDefinitionPages, ChoosingAModelReadsIt) {
  constexpr int kPages[] = {122, 123, 118, 115, 109, 111, 114, 113, 112, 146, 110, 116, 117, 119, 121};
  for (const int id : kPages) document.Touch(static_cast<PageId>(id));
  document.Touch(PageId::bathymetry);
  openDefinition();
  choose("Model", 0);
  EXPECT_EQ(host.titles, Labels{"Reading the ecological model"});  // once
  EXPECT_EQ(control("Model").index, 0);
  EXPECT_EQ(text("File"), (templates / "a.biorig").string());
  EXPECT_FALSE(control("File").usable());
  EXPECT_FALSE(control("...").usable());
  Labels counts;
  for (const char* label :
       {"State Variables", "Constants", "Forcings", "Auxiliary Variables", "Processes", "Derived Outputs"})
    counts.push_back(text(label));
  EXPECT_EQ(counts, (Labels{"3", "3", "3", "2", "1", "1"}));
  for (const int id : kPages) EXPECT_FALSE(document.HasBeenTouched(static_cast<PageId>(id))) << id;
  EXPECT_TRUE(document.HasBeenTouched(PageId::bathymetry));
  EXPECT_TRUE(document.HasBeenTouched(PageId::ecoModelDefinition));
  EXPECT_TRUE(document.IsModified());
  edit("Update Frequency", "3");
  EXPECT_EQ(host.titles.size(), 1U);  // not again
}

TEST_F(WqsDefinitionPages, AnotherModelAndBack) {
  openDefinition();
  choose("Model", 0);
  root().wqsConstants->at(1).value = 9;
  choose("Model", 1);
  EXPECT_EQ(root().wqsConstants->GetCount(), 0);
  choose("Model", 0);
  EXPECT_EQ(root().wqsConstants->at(1).value, 2.5);
}

TEST_F(WqsDefinitionPages, UndoBringsBackTheModelWithItsValues) {
  openDefinition();
  choose("Model", 0);
  edit("Update Frequency", "3");
  root().wqsConstants->at(1).value = 9;
  document.RecordEdit(PageId::ecoConstants, "Value");
  choose("Model", 1);
  document.Undo();
  EXPECT_EQ(control("Model").index, 0);
  EXPECT_EQ(text("Constants"), "3");
  EXPECT_EQ(root().wqsConstants->at(1).value, 9);
  EXPECT_EQ(root().wqsInitialConditions->GetCount(), 2);
  document.Redo();
  EXPECT_EQ(text("Constants"), "0");
  EXPECT_EQ(root().wqsConstants->GetCount(), 0);
}

TEST_F(WqsDefinitionPages, FromFileWaitsForAName) {
  openDefinition();
  choose("Model", 0);
  choose("Model", 2);
  EXPECT_EQ(control("Model").index, 2);
  EXPECT_TRUE(control("File").usable());
  EXPECT_EQ(text("Constants"), "3");
  const std::string path = folder.write("own.biorig", test::kModelOfTheBed);
  edit("File", path);
  EXPECT_EQ(text("Constants"), "0");
  EXPECT_EQ(text("State Variables"), "1");
  EXPECT_EQ(definition().modelFile.absolute(), path);
  EXPECT_EQ(control("Model").index, 2);
}

TEST_F(WqsDefinitionPages, AFileThatCannotBeReadIsNotTaken) {
  openDefinition();
  choose("Model", 0);
  choose("Model", 2);
  const std::string before = text("File");
  edit("File", folder.file("none.biorig"));
  EXPECT_THAT(host.texts, ElementsAre("Unable to access the file:\n" + folder.file("none.biorig")));
  EXPECT_EQ(text("File"), before);
  EXPECT_EQ(text("Constants"), "3");
  EXPECT_EQ(host.titles.size(), 1U);
}

TEST_F(WqsDefinitionPages, ABrokenFileSaysWhatIsWrong) {
  openDefinition();
  edit("File", folder.write("broken.biorig", "BIO_RIG_SETUP {\n ID = }"));
  EXPECT_TRUE(control("Problem").visible);
  EXPECT_THAT(text("Problem"), HasSubstr("line 2"));
  EXPECT_EQ(text("State Variables"), "0");
  choose("Model", 1);
  EXPECT_FALSE(control("Problem").visible);
}

TEST_F(WqsDefinitionPages, TheEntryIsThatOfTheFileWithoutRegardToCase) {
  UFileName file;
  file = (templates / "B.BIORIG").string();
  definition().modelFile = file;
  openDefinition();
  EXPECT_EQ(control("Model").index, 1);
}

TEST_F(WqsDefinitionPages, SolutionParameters) {
  openDefinition();
  choose("Integration Method", 2);
  EXPECT_EQ(definition().integration, 3);
  edit("Update Frequency", "12");
  EXPECT_EQ(definition().frequency, 12);
  edit("Update Frequency", "x");
  EXPECT_EQ(definition().frequency, 12);
  choose("Model", 1);  // all the same
  EXPECT_EQ(text("State Variables"), "1");
  choose("Disable Processes (AD Transport only)", 1);
  EXPECT_TRUE(definition().disableProcesses);
}

TEST(WqsDefinitionPage, TheButtonReadsTheFileThatIsChosen) {
  test::TemporaryFolder folder;
  BrowsingHost host;
  CV27SetupDoc document(host);
  document.root().wqsModelDefinition->FindTemplates(folder.path().string());
  const auto page = makePage("CWQSModelDefinitionDlg", document);
  Form& form = page->form();
  form.act(*form.find("..."));
  EXPECT_FALSE(document.IsModified());
  host.chosenFile = folder.write("own.biorig", test::kCarriedModel);
  form.act(*form.find("..."));
  EXPECT_EQ(host.filters.back(), "BIO Rig Files (*.biorig)|*.biorig|All Files (*.*)|*.*||");
  EXPECT_EQ(host.extensions.back(), "biorig");
  EXPECT_EQ(form.find("State Variables")->text, "3");
  EXPECT_EQ(form.find("File")->text, *host.chosenFile);
  document.Undo();
  EXPECT_EQ(form.find("State Variables")->text, "0");
}

TEST_F(WqsDefinitionPages, StateVariables) {
  openWithPlankton("CWQSStateVariablesDlg", 18950, PageId::ecoStateVariables);
  EXPECT_EQ(headers(), (Labels{"ID", "Symbol", "Description", "Unit", "Transport"}));
  EXPECT_EQ(widths()[0], 40);
  EXPECT_EQ(grid().GetRowCount(), 3);
  EXPECT_EQ(grid().GetRowHeader(3), "7");
  EXPECT_EQ(rowOf(grid(), 1), (Labels{"PHY", "", std::string(qunBaseUnit(100201)->symbol), "AD"}));
  EXPECT_EQ(rowOf(grid(), 2), (Labels{"BED", "", "g/m2", "NONE"}));
  for (int row = 1; row <= 3; ++row) {
    EXPECT_EQ(usableOf(grid(), row), "....");
    for (int col = 1; col <= 4; ++col) EXPECT_TRUE(style(row, col).isGrey);
  }
  EXPECT_EQ(style(1, 1).toolTip, "PHY");
  EXPECT_EQ(style(3, 1).toolTip, "OXY = rea - use");
  EXPECT_THAT(style(1, 3).toolTip, HasSubstr("["));
  EXPECT_EQ(store(1, 1, "X"), 0);
}

TEST_F(WqsDefinitionPages, Constants) {
  openWithPlankton("CWQSConstantsDlg", 18943, PageId::ecoConstants);
  EXPECT_EQ(headers(),
            (Labels{"No.", "Symbol", "Description", "Type", "Value", "Unit", "File Name", "", ""}));
  EXPECT_EQ(widths()[3], 80);
  EXPECT_EQ(widths()[4], 60);
  EXPECT_EQ(grid().GetRowCount(), 9);
  const std::string unit(qunBaseUnit(100006)->symbol);
  EXPECT_EQ(rowOf(grid(), 1), (Labels{"a", "About a", "Constant", "2.500000", unit, "", "", ""}));
  EXPECT_EQ(rowOf(grid(), 4), (Labels{"b", "", "Built-in", "0.500000", "1/d", "", "", ""}));
  EXPECT_EQ(rowOf(grid(), 9), (Labels{"Area 2", "", "", "", "", "", "...", "View..."}));
  EXPECT_EQ((Labels{grid().GetRowHeader(1), grid().GetRowHeader(2), grid().GetRowHeader(7)}),
            (Labels{"1", "", "3"}));
  EXPECT_EQ(usableOf(grid(), 1), "...x....");  // one value: there is nothing to choose
  EXPECT_EQ(usableOf(grid(), 4), "........");
  EXPECT_FALSE(style(4, 4).enabled);
  EXPECT_FALSE(style(4, 5).enabled);
  EXPECT_EQ(usableOf(grid(), 7), "..xx....");
  EXPECT_EQ(usableOf(grid(), 8), "........");
  EXPECT_EQ(style(1, 4).toolTip, "Range: 0 - 10");
  EXPECT_EQ(style(4, 4).toolTip, "Range: 1 - 1.5");
  EXPECT_EQ(style(1, 2).toolTip, "Help on a");
  EXPECT_EQ(style(7, 3).choices, (Labels{"Constant", "Type 2 File"}));
  EXPECT_EQ(store(1, 4, "3.5"), 1);
  EXPECT_EQ(root().wqsConstants->at(1).value, 3.5);
  EXPECT_EQ(store(4, 4, "3.5"), 0);
}

TEST_F(WqsDefinitionPages, RowsOfAreasAreShownForMaps) {
  openWithPlankton("CWQSConstantsDlg", 18943, PageId::ecoConstants);
  for (const int row : {2, 3, 5, 8, 9}) EXPECT_EQ(grid().GetRowLook(row).height, 0) << row;
  EXPECT_EQ(grid().GetRowLook(7).height, 1);
  EXPECT_EQ(store(7, 3, "Type 2 File"), 1);
  EXPECT_EQ(root().wqsConstants->at(3).format, 3);
  EXPECT_EQ(usableOf(grid(), 7), "..x.....");
  for (const int row : {8, 9}) {
    EXPECT_EQ(grid().GetRowLook(row).height, 1) << row;
    EXPECT_EQ(usableOf(grid(), row), ".....xx.");
  }
  host.chosenFile = folder.write("c.tsb2", "");
  host.chosenItems = {2};
  grid().OnClickedButtonRowCol(9, 7);
  EXPECT_EQ(host.filters.back(), "Type 2 Files (*.tsb2;*.tb2)|*.tsb2;*.tb2|All Files (*.*)|*.*||");
  EXPECT_EQ(cell(9, 6), *host.chosenFile);
  EXPECT_EQ(root().wqsConstants->at(3).File(2)->items, std::vector<std::uint32_t>{2});
  EXPECT_EQ(usableOf(grid(), 9), ".....xxx");
  root().wqsConstants->at(3).format = 7;  // what is none of the choices is kept
  EXPECT_EQ(cell(7, 3), "");
  root().bathymetry->SetNoAreas(1);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(grid().GetRowCount(), 6);
  test::define(root(), folder, test::kModelOfTheBed);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(grid().GetRowCount(), 0);
}

TEST_F(WqsDefinitionPages, Forcings) {
  openWithPlankton("CWQSForcingsDlg", 18944, PageId::ecoForcings);
  EXPECT_EQ(headers(),
            (Labels{"No.", "Symbol", "Description", "Type", "Value", "Unit", "File Name", "", ""}));
  EXPECT_EQ(grid().GetRowCount(), 3);
  EXPECT_EQ(style(1, 3).choices, (Labels{"Constant", "Type 0 File"}));
  EXPECT_EQ(style(3, 3).choices, (Labels{"Constant", "Type 0 File", "Type 2 File"}));
  EXPECT_EQ(cell(2, 3), "Built-in");
  EXPECT_EQ(usableOf(grid(), 1), "..xx....");
  EXPECT_EQ(usableOf(grid(), 2), "........");
  EXPECT_EQ(store(1, 3, "Type 2 File"), 0);
  host.chosenFile = folder.write("f", "");
  EXPECT_EQ(store(3, 3, "Type 0 File"), 1);
  EXPECT_EQ(root().wqsForcings->at(3).format, 1);
  EXPECT_EQ(usableOf(grid(), 3), "..x..xx.");
  grid().OnClickedButtonRowCol(3, 7);
  EXPECT_EQ(host.filters.back(), "Type 0 Files (*.tsb0;*.tb0)|*.tsb0;*.tb0|All Files (*.*)|*.*||");
  EXPECT_EQ(store(3, 3, "Type 2 File"), 1);
  EXPECT_EQ(root().wqsForcings->at(3).format, 3);
  grid().OnClickedButtonRowCol(3, 7);
  EXPECT_EQ(host.filters.back(), "Type 2 Files (*.tsb2;*.tb2)|*.tsb2;*.tb2|All Files (*.*)|*.*||");
  EXPECT_EQ(cell(3, 6), *host.chosenFile);
}

TEST_F(WqsDefinitionPages, InitialConditions) {
  openWithPlankton("CWQSInitialConditionsDlg", 18945, PageId::ecoInitialConditions);
  EXPECT_EQ(headers(), (Labels{"Area", "Type", "Value", "Unit", "File Name", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{50, 100, 60, 60, 210, 30, 45}));
  EXPECT_EQ(grid().GetRowCount(), 6);
  EXPECT_EQ(cell(1, 1), "State Variable :   PHY");
  EXPECT_EQ(cell(4, 1), "State Variable :   OXY");
  EXPECT_EQ(cell(5, 2), "8.000000");
  EXPECT_EQ(cell(5, 3), "g/m3");
  EXPECT_EQ(style(5, 2).toolTip, "Range: 0 - 20");
  EXPECT_EQ(style(5, 1).choices, (Labels{"Constant value", "Type 2 data file"}));
  EXPECT_EQ(usableOf(grid(), 5), "xx....");
  EXPECT_EQ(store(6, 2, "9.5"), 1);
  EXPECT_EQ(root().wqsInitialConditions->at(2).at(2).value, 9.5);
  EXPECT_EQ(store(5, 1, "Type 2 data file"), 1);
  EXPECT_EQ(usableOf(grid(), 5), "x..xx.");
}

TEST_F(WqsDefinitionPages, StartingConditions) {
  openPage("CWQSStartingConditionsDlg", 18949, PageId::ecoStartingConditions);
  EXPECT_EQ(control("Type").choices, (Labels{"Cold start", "Hot start"}));
  EXPECT_EQ(control("Type").index, 0);
  EXPECT_EQ(grid().GetRowCount(), 2);
  EXPECT_FALSE(style(1, 2).enabled);
  choose("Type", 1);
  EXPECT_TRUE(root().wqsStartingConditions->hotStart);
  EXPECT_TRUE(style(1, 2).enabled);
  host.chosenFile = folder.write("h.tsb2", "");
  grid().OnClickedButtonRowCol(2, 2);
  EXPECT_EQ(host.filters.back(), "HotStart files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||");
  EXPECT_EQ(root().wqsStartingConditions->at(2).file.text(), *host.chosenFile);
}

}  // namespace ecology_definition_pages_test
}  // namespace gridbay
