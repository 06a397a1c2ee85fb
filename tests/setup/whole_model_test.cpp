// Whole setups, one of each module: read, written and read again in their exact state; every page opened on
// them and read; every control and cell that can be used edited, taken back and done again. Nothing here
// knows what stands on a page.

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>
#include <map>
#include <regex>
#include <set>
#include <sstream>
#include <tuple>

#include "advection_dispersion/texts.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "basic/texts.h"
#include "core/edition.h"
#include "ecology/model_definition.h"
#include "families/result_texts.h"
#include "families/texts.h"
#include "families/transport_texts.h"
#include "hydrodynamic/texts.h"
#include "pages/scan.h"
#include "setup/dlg_enumerator.h"
#include "setup/navigation_tree.h"
#include "setup/page_places.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace setup_whole_model_test {

using Texts = std::vector<std::string>;

// A setup's file, and the module that is chosen in it where that is another one.
struct Setup {
  const char* name;
  std::int32_t module;
};
std::ostream& operator<<(std::ostream& out, const Setup& setup) {
  return out << setup.name << " as module " << setup.module;
}

constexpr Setup kSetups[] = {
    {"flood.v27", module::kHydrodynamic},
    {"flood.v27", module::kHydrodynamicToo},
    {"salinity.v27", module::kAdvectionDispersion},
    {"mud_fractions.v27", module::kMudTransport},
    {"mud_layers.v27", module::kMudTransport},
    {"expanded_mud.v27", module::kMudTransportExpanded},
    {"oxygen.v27", module::kEcological},
};

// What files are asked for.
const Texts kAsked{
    "Air Pressure",
    "Air temperature",
    "Bed Roughness",
    "Boundary",
    "Clearness coefficient",
    "Conservative component",
    "Critical Shear Stress",
    "Critical Shear Stress for Deposition",
    "Density of Bed Layer",
    "Depth Below Ground",
    "Dispersion Coefficients",
    "Dredged mass rate",
    "Dredging spill",
    "Eddy viscocity",
    "Erosion",
    "Erosion Coefficient",
    "Fall Velocity",
    "Fine bathymetry file",
    "Flow direction",
    "Friction Coefficient",
    "Infiltration",
    "Initial Concentration",
    "Initial Conditions",
    "Leakage",
    "Magnitude",
    "Percentage",
    "Pier Resistance",
    "Porosity",
    "Rainfall rate",
    "Relative humidity",
    "Resistance",
    "Surface elevation",
    "Velocity",
    "Wave direction",
    "Wave height",
    "Wave period",
    "Wind X-component",
    "Wind Y-component",
    "Wind direction",
    "Wind speed",
    "X coordinate of dredger",
    "Y coordinate of dredger",
};

// A number that differs from the one in a text, in its form: "3" 4, "(3,4)" (4,4), "0-7,1" 1-7,1.
std::string nextNumber(std::string_view text) {
  const std::size_t digit = text.find_first_of("0123456789");
  if (digit == text.npos) return "1";
  const std::size_t end = std::min(text.find_first_not_of("0123456789", digit), text.size());
  const std::string_view number = text.substr(digit, end - digit);
  const std::int32_t next = plainInteger(number) == 0 ? 1 : plainInteger(number) - 1;
  return std::string(text.substr(0, digit)) + std::to_string(next) + std::string(text.substr(end));
}

// Texts of which some are another valid value for whatever an edit or a plain cell holds.
Texts otherTexts(const std::string& text) {
  return {nextNumber(text), "2", "0", "1", "(2,3)", "1-2,1", "other", "2001-02-03 04:05:06"};
}

// Something that a user can do on a page: change a control or a cell to a value, step a count, press a
// button.
struct Act {
  std::size_t control = 0;
  int row = 0;  // of a cell
  int col = 0;
  int step = 0;
  int place = -1;  // of a choice
  auto operator<=>(const Act&) const = default;
};

// Another value in each field and cell of a dialog; true for OK.
bool fillDialog(Form& form) {
  for (Control& it : form.controls()) {
    if (it.grid != nullptr) {
      for (int row = 1; row <= std::min(it.grid->GetRowCount(), 2); ++row) {
        for (int col = 1; col <= it.grid->GetColCount(); ++col) {
          CellStyle style;
          if (it.grid->GetStyleRowCol(row, col, style) == 1 && style.editable())
            it.grid->StoreStyleRowCol(row, col, nextNumber(style.value));
        }
      }
    }
    if (!it.usable() || (!it.isEdit() && !it.isIndexed())) continue;
    if (it.isEdit()) it.text = nextNumber(it.text);
    if (it.isIndexed()) it.index = it.kind == ControlKind::check ? 1 - it.index : 0;
    form.act(it);
  }
  return true;
}

// Keeps what each chosen file was to be.
class AskedHost : public test::TestHost {
 public:
  bool choose(CVdFileSelectorDlg& selector) override {
    for (const auto& request : selector.requests()) asked.insert(request->description());
    return TestHost::choose(selector);
  }
  std::set<std::string> asked;
};

CellStyle cellOf(CV27SetupGridWnd& grid, int row, int col) {
  CellStyle style;
  grid.GetStyleRowCol(row, col, style);
  return style;
}

// The rows of an entry, as a table finds them: the first one, and behind the last one.
std::pair<int, int> rowsOf(CV27SetupGridWnd& grid, const std::vector<ListEntry>& entries) {
  int first = 1;
  while (first <= grid.GetRowCount() && cellOf(grid, first, 1).isHeader) ++first;
  int rows = grid.GetRowCount() - first + 1;
  for (const auto& [number, count] : entries) {
    const int each = std::max(count > 0 ? rows / count : 1, 1);
    if (number < 1 || (number - 1) * each >= rows) return {0, 0};
    first += (number - 1) * each;
    rows = each;
    while (rows > 1 && cellOf(grid, first, 1).isHeading) {
      ++first;
      --rows;
    }
  }
  return {first, first + rows};
}

// Whether a table has the place: its row, and a column with the header or the value that it names.
bool isIn(CV27SetupGridWnd& grid, const PagePlace& place) {
  const auto [first, end] = rowsOf(grid, place.entries);
  if (first == end || place.column > grid.GetColCount()) return false;
  if (place.column > 0 || (place.field.empty() && place.value.empty())) return true;
  for (int row = first; row < end; ++row) {
    for (int col = 1; col <= grid.GetColCount(); ++col) {
      if (!place.field.empty() && grid.GetColHeader(col) == place.field) return true;
      if (!place.value.empty() && cellOf(grid, row, col).value == place.value) return true;
    }
  }
  return false;
}

std::string labelsOf(Form& form) {
  std::string labels;
  for (const Control& control : form.controls()) {
    labels += "\n    " + control.label + (control.visible ? "" : " (hidden)");
    if (control.grid == nullptr) continue;
    labels += ", " + std::to_string(control.grid->GetRowCount()) + " rows:";
    for (int col = 1; col <= control.grid->GetColCount(); ++col)
      labels += " [" + control.grid->GetColHeader(col) + "]";
  }
  return labels;
}

// What is wrong with a place on its page; empty where it leads to something.
std::string faultOf(Form& form, const PagePlace& place) {
  for (const Control& control : form.controls()) {
    if (place.isInTable() && control.grid != nullptr && control.visible && isIn(*control.grid, place))
      return {};
  }
  // A file that the page shows once its layer is chosen: the row of that.
  const auto hasRow = [&](const Control& control) {
    if (control.grid == nullptr || !control.visible) return false;
    if (place.entries.empty()) return false;
    return isIn(*control.grid, {.entries = place.entries}) ||
           isIn(*control.grid, {.entries = {place.entries[0]}});
  };
  if (place.isInTable() && place.field.empty() && std::ranges::any_of(form.controls(), hasRow)) return {};
  if (place.field.empty() && place.value.empty())
    return place.isInTable() ? "no table has its row" : "leads to the page alone";
  int number = place.fieldNumber;
  for (const Control& control : form.controls()) {
    if (!place.field.empty() ? control.label == place.field && --number == 0
                             : control.isEdit() && control.visible && control.text == place.value)
      return {};
  }
  return "there is no such field";
}

// A setup's text with other values in all keywords but those that shape it.
std::string withValues(const std::string& text, const std::string& number, const std::string& file) {
  static const std::regex kShape(
      "No_?Of|Number|Count|Format|Type|Description|Include|Enable|Version|SCHEME|Module|Simulation|Layers|"
      "Fractions|Dynamic|Hot_?Start|Select|Area|Component",
      std::regex::icase);
  static const std::regex kLine("( *)([A-Za-z0-9_]+) (.*)");
  std::istringstream lines(text);
  std::string out;
  for (std::string line; std::getline(lines, line);) {
    std::smatch parts;
    if (std::regex_match(line, parts, kLine) && !std::regex_search(parts[2].first, parts[2].second, kShape)) {
      const std::string values = parts[3];
      if (values.find("(file)") != values.npos || values.find("(result)") != values.npos) {
        if (file != "as it is")
          line =
              parts[1].str() + parts[2].str() + " " + values.substr(0, values.find('"')) + '"' + file + '"';
      } else if (!number.empty() && std::regex_match(values, std::regex("-?[0-9][-0-9.eE+ ]*"))) {
        line =
            parts[1].str() + parts[2].str() + " " + std::regex_replace(values, std::regex("[^ ]+"), number);
      }
    }
    out += line + "\n";
  }
  return out;
}

class WholeModel : public ::testing::TestWithParam<Setup> {
 protected:
  void SetUp() override {
    for (const auto& [name, spec] :
         std::map<std::string, test::GridSpec>{{"estuary.tsb2", {.noJ = 121, .noK = 91, .dx = 90, .dy = 90}},
                                               {"inlet.tsb2", {.noJ = 40, .noK = 31}}})
      test::writeGrid(folder.file(name), spec);
    path = folder.file(GetParam().name);
    std::filesystem::copy_file(std::string(GRIDBAY_TESTS) + "/main_job/setups/" + GetParam().name, path);
    ASSERT_TRUE(document.OnOpenDocument(path));
    if (!theEdition.wetlandSweepKit) root().moduleSelection->simulationType = GetParam().module;
    document.RecordEdit(PageId::none, "module");
    tree.OnInitialUpdate(&root());
  }
  static bool walksAllPages() { return GetParam().module == module::kHydrodynamic; }
  CGlobalKvs& root() { return document.root(); }
  Form& form() { return page->form(); }
  Control& controlOf(const Act& act) { return form().controls()[act.control]; }

  // The parts that differ from those of another model: their classes, and what stands on file of both.
  Texts differences(const CGlobalKvs& other) {
    if (other.SameState(root())) return {};
    Texts all;
    const std::vector<CKvsBase*> parts = root().children();
    const std::vector<CKvsBase*> others = const_cast<CGlobalKvs&>(other).children();
    for (std::size_t i = 0; i < parts.size(); ++i) {
      CKvsBase& part = *parts[i];
      if (part.SameState(*others[i])) continue;
      all.emplace_back(typeid(part).name());
      all.push_back(test::savedText(part, path));
      all.push_back(test::savedText(*others[i], path));
    }
    return all;
  }

  // All that the page shows, which reads every control and every cell.
  Texts shown() {
    Texts all;
    for (const Control& it : form().controls()) {
      std::string line = it.label + '|' + it.text + '|' + std::to_string(it.index) + '|' + it.unit + '|' +
                         it.toolTip + '|' + it.fault;
      for (const bool flag : {it.enabled, it.visible, it.readOnly, it.absent}) line += flag ? '1' : '0';
      for (const bool flag : it.choiceEnabled) line += flag ? '1' : '0';
      for (const std::string& choice : it.choices) line += '|' + choice;
      all.push_back(std::move(line));
      if (it.grid != nullptr) showGrid(*it.grid, all);
    }
    return all;
  }
  static void showGrid(CV27SetupGridWnd& grid, Texts& all) {
    const int columns = grid.GetColCount();
    for (int row = 0; row <= grid.GetRowCount(); ++row) {
      std::string line = grid.GetRowLook(row).lineBelow ? "_" : "";
      for (int col = 0; col <= columns; ++col) {
        CellStyle style;
        EXPECT_EQ(grid.GetStyleRowCol(row, col, style), 1) << row << ", " << col;
        line += '|' + style.value + '|' + style.toolTip;
        for (const bool flag : {style.enabled, style.readOnly}) line += flag ? '1' : '0';
        if (row == 0) line += ':' + std::to_string(grid.GetColWidth(col));
      }
      all.push_back(std::move(line));
    }
  }

  // What can be done on the page as it stands. Of a long grid the first rows and the last ones stand for all.
  std::set<Act> acts() {
    std::set<Act> all;
    for (std::size_t i = 0; i < form().controls().size(); ++i) {
      const Control& it = form().controls()[i];
      if (it.grid != nullptr && it.enabled && it.visible) addCells(*it.grid, i, all);
      if (!it.usable()) continue;
      if (it.isEdit() || it.kind == ControlKind::button) all.insert({.control = i});
      if (it.onSpin) all.insert({{.control = i, .step = 1}, {.control = i, .step = -1}});
      if (it.kind == ControlKind::check) all.insert({.control = i, .place = 1 - it.index});
      if (it.kind != ControlKind::radio && it.kind != ControlKind::dropDown) continue;
      for (std::size_t n = 0; n < it.choices.size(); ++n) {
        const bool isOffered = it.choiceEnabled.empty() || it.choiceEnabled[n];
        const int place = static_cast<int>(n);
        if (isOffered && place != it.index) all.insert({.control = i, .place = place});
      }
    }
    return all;
  }
  static void addCells(CV27SetupGridWnd& grid, std::size_t control, std::set<Act>& all) {
    constexpr int kFirst = 24;
    constexpr int kLast = 4;
    const int rows = grid.GetRowCount();
    const int columns = grid.GetColCount();
    for (int row = 1; row <= rows; ++row) {
      if (row > kFirst && row <= rows - kLast) continue;
      for (int col = 1; col <= columns; ++col) {
        CellStyle style;
        if (grid.GetStyleRowCol(row, col, style) != 1) continue;
        if (style.kind == CellKind::dropDown && style.choices.size() < 2) continue;
        const Act cell{.control = control, .row = row, .col = col};
        if (style.kind == CellKind::button ? style.enabled : style.editable()) {
          all.insert(cell);
        } else if (style.kind != CellKind::button && !style.takesValue()) {
          EXPECT_EQ(grid.StoreStyleRowCol(row, col, "1"), 0) << grid.GetColHeader(col);
        }
      }
    }
  }

  // Does it, one way after another until the model has changed.
  bool doAct(const Act& act) {
    Control& control = controlOf(act);
    if (control.grid != nullptr) return doCell(*control.grid, act);
    if (act.step != 0) {
      form().spin(control, act.step);
    } else if (act.place >= 0) {
      control.index = act.place;
      form().act(control);
    } else if (control.kind == ControlKind::button) {
      form().act(control);
    } else {
      const std::string held = control.text;
      for (const std::string& text : otherTexts(held)) {
        control.text = text;
        form().act(control);
        if (isChanged()) return true;
        control.text = held;
        control.fault.clear();
      }
      page->SetData();
    }
    return isChanged();
  }
  bool doCell(CV27SetupGridWnd& grid, const Act& act) {
    CellStyle style;
    if (grid.GetStyleRowCol(act.row, act.col, style) != 1) return false;
    Texts texts = otherTexts(style.value);
    if (style.kind == CellKind::button) grid.OnClickedButtonRowCol(act.row, act.col);
    if (style.kind == CellKind::button) return isChanged();
    if (style.kind == CellKind::dropDown) texts = style.choices;
    if (style.kind == CellKind::checkBox) texts = {style.value == "1" ? "0" : "1"};
    for (const std::string& text : texts) {
      grid.StoreStyleRowCol(act.row, act.col, text);
      if (isChanged()) return true;
    }
    return false;
  }
  bool isButton(const Act& act) {
    const Control& control = controlOf(act);
    CellStyle style;
    if (control.grid == nullptr) return control.kind == ControlKind::button;
    return control.grid->GetStyleRowCol(act.row, act.col, style) == 1 && style.kind == CellKind::button;
  }
  bool isChanged() { return document.ModelState() != state; }

  std::string nameOf(const Act& act) {
    Control& control = controlOf(act);
    std::string name = pageClass + ": " + control.label;
    if (act.row > 0)
      name += " row " + std::to_string(act.row) + " column " + std::to_string(act.col) + " " +
              control.grid->GetColHeader(act.col);
    if (act.step != 0) name += act.step > 0 ? " up" : " down";
    if (act.place >= 0) name += " choice " + std::to_string(act.place);
    return name;
  }

  // Does it, takes it back, does it again and takes that back. What it made usable is done while it holds.
  void tryAct(const Act& act, int depth) {
    const std::string name = nameOf(act);
    SCOPED_TRACE(name);
    const std::uint64_t stateBefore = state;
    CGlobalKvs before;
    before.AssignState(root());
    const Texts shownBefore = shown();
    const std::set<Act> actsBefore = depth > 0 ? acts() : std::set<Act>();
    const bool mayBeIdle = act.step != 0 || isButton(act);
    if (!doAct(act)) {
      EXPECT_EQ(differences(before), Texts()) << "changed, and no step of it";
      page = makePage(pageClass, document);  // which may have been put into another mode
      EXPECT_EQ(shown(), shownBefore) << "shows what it has not changed";
      if (!mayBeIdle) idle.insert(name);
      return;
    }
    const std::uint64_t stateAfter = state = document.ModelState();
    CGlobalKvs after;
    after.AssignState(root());
    const Texts shownAfter = shown();
    EXPECT_FALSE(before.SameState(root()));
    ASSERT_NE(document.UndoStep(), nullptr);
    EXPECT_FALSE(document.UndoStep()->name.empty());
    if (depth > 0) {
      for (const Act& next : acts()) {
        if (!actsBefore.contains(next)) tryAct(next, depth - 1);
      }
      ASSERT_EQ(document.ModelState(), stateAfter);
    }
    const auto expect = [&](const CGlobalKvs& model, const Texts& texts, std::uint64_t number,
                            const char* when) {
      EXPECT_EQ(differences(model), Texts()) << when;
      EXPECT_EQ(document.ModelState(), number) << when;
      EXPECT_EQ(shown(), texts) << when;
    };
    document.Undo();
    expect(before, shownBefore, stateBefore, "after the undo");
    document.Redo();
    expect(after, shownAfter, stateAfter, "after the redo");
    document.Undo();
    expect(before, shownBefore, stateBefore, "after the second undo");
    state = document.ModelState();
  }

  // All pages, whether the tree shows them or not, as they are opened one after the other.
  template <class Do>
  void onEachPage(Do act) {
    for (const PageEntry& entry : CDlgEnumerator().pages()) {
      if (entry.pageClass.empty()) continue;
      pageClass = entry.pageClass;
      page = makePage(entry.pageClass, document);
      if (page == nullptr) continue;
      SCOPED_TRACE(pageClass);
      document.RecordEdit(PageId::none, "what the page works out when it is shown");
      state = document.ModelState();
      CGlobalKvs first;
      first.AssignState(root());
      act(entry);
      EXPECT_EQ(differences(first), Texts()) << "not all of it has come back";
      page->OnLeave();
      if (HasFatalFailure()) return;
    }
  }

  test::TemporaryFolder folder;
  AskedHost host;
  CV27SetupDoc document{host};
  CDlgEnumerator enumerator;
  CNavigationView tree{enumerator};
  std::string path;
  std::string pageClass;
  std::unique_ptr<CV27SetupFormView> page;
  std::uint64_t state = 0;
  std::set<std::string> idle;  // what changed nothing
};

INSTANTIATE_TEST_SUITE_P(Of, WholeModel, ::testing::ValuesIn(kSetups));

TEST_P(WholeModel, ComesBackInItsExactState) {
  const std::string again = folder.file("again.v27");
  ASSERT_TRUE(document.OnSaveDocument(again));
  // An edition that keeps less has done so now.
  if (theEdition.wetlandSweepKit) ASSERT_TRUE(document.OnOpenDocument(again));
  CV27SetupDoc second(host);
  ASSERT_TRUE(second.OnOpenDocument(again));
  EXPECT_EQ(differences(second.root()), Texts());
  const std::string text = test::textOf(again);
  ASSERT_TRUE(second.OnSaveDocument(again));
  EXPECT_EQ(test::textOf(again), text);
}

TEST_P(WholeModel, EveryEditIsTakenBackAndDoneAgain) {
  onEachPage([&](const PageEntry& entry) {
    // Pages that the tree hides are as they would be with the module that they belong to: once is enough.
    if (!tree.IsVisible(entry.id) && !walksAllPages()) return;
    const Texts first = shown();
    for (const Act& act : acts()) {
      tryAct(act, 1);  // a dialog is left
      if (HasFatalFailure()) return;
    }
    host.chosenFile = folder.file("chosen.tsb2");
    host.fillForm = fillDialog;
    for (const Act& act : acts()) {
      if (isButton(act)) tryAct(act, 0);
      if (HasFatalFailure()) return;
    }
    host.chosenFile.reset();
    host.fillForm = nullptr;
    EXPECT_EQ(shown(), first);
  });
  // A file of a model must be there, and without a file "From File ..." is no other model.
  EXPECT_THAT(idle, ::testing::IsSubsetOf(
                        {"CWQSModelDefinitionDlg: File", "CWQSModelDefinitionDlg: Model choice 1"}));
  if (walksAllPages()) EXPECT_THAT(host.asked, ::testing::IsSupersetOf(kAsked));
  EXPECT_THAT(host.texts, ::testing::Each(::testing::Not(::testing::HasSubstr("could not be made"))));
}

// Messages that no value of a keyword brings about alone.
struct Told {
  std::int32_t module;
  PageId page;
  Text text;
  ListEntry entry = {};  // none where its number is 0
};
constexpr Told kTold[] = {
    {module::kHydrodynamic, PageId::floodAndDry, texts::dryingAboveFlooding},
    {module::kHydrodynamic, PageId::simulationPeriod, texts::negativeTimeSteps},
    {module::kHydrodynamic, PageId::simulationPeriod, texts::warmUpTooLong},
    {module::kHydrodynamic, PageId::bathymetry, texts::bathymetryCount},
    {module::kHydrodynamic, PageId::bathymetry, texts::landBelowZero, {2, 2}},
    {module::kHydrodynamic, PageId::bathymetry, texts::outerNotValid, {2, 2}},
    {module::kHydrodynamic, PageId::bathymetry, texts::nestRatio, {2, 2}},
    {module::kHydrodynamic, PageId::bathymetry, texts::nestJextr, {2, 2}},
    {module::kHydrodynamic, PageId::bathymetry, texts::nestKextr, {2, 2}},
    {module::kHydrodynamic, PageId::bathymetry, texts::overlap, {2, 2}},
    {module::kHydrodynamic, PageId::boundary, texts::lineNotParallel, {1, 4}},
    {module::kHydrodynamic, PageId::sourceAndSink, texts::sourceNoArea, {1, 1}},
    {module::kHydrodynamic, PageId::sourceAndSink, texts::sourceOnLand, {1, 1}},
    {module::kHydrodynamic, PageId::sourceAndSink, texts::sinkNoArea, {1, 1}},
    {module::kHydrodynamic, PageId::sourceAndSink, texts::sinkOutside, {1, 1}},
    {module::kHydrodynamic, PageId::sourceAndSink, texts::sinkCovered, {1, 1}},
    {module::kHydrodynamic, PageId::sourceAndSink, texts::sinkOnLand, {1, 1}},
    {module::kHydrodynamic, PageId::infiltration, texts::infiltrationFileNotValid},
    {module::kHydrodynamic, PageId::hdBoundary, texts::tiltingPointOutside, {2, 4}},
    {module::kHydrodynamic, PageId::hdBoundary, texts::noBoundaryDataItem, {2, 4}},
    {module::kHydrodynamic, PageId::surfaceElevation, texts::surfaceElevationType, {2, 2}},
    {module::kHydrodynamic, PageId::eddyViscosity, texts::negativeEddyViscosity, {2, 2}},
    {module::kHydrodynamic, PageId::resistance, texts::negativeResistance, {2, 2}},
    {module::kHydrodynamic, PageId::hdResult, texts::associatedAreaMissing, {1, 1}},
    {module::kAdvectionDispersion, PageId::adResult, texts::outputCount},
    {module::kAdvectionDispersion, PageId::adResult, texts::associatedAreaMissing, {1, 1}},
    {module::kAdvectionDispersion, PageId::adResult, texts::firstPointBehindLast, {1, 1}},
    {module::kAdvectionDispersion, PageId::adResult, texts::firstTimeStepAfterLast, {1, 1}},
    {module::kAdvectionDispersion, PageId::adStartingConditions, texts::firstTimeStepAfterLast},
    {module::kAdvectionDispersion, PageId::adStartingConditions, texts::firstTimeStepNegative},
    {module::kAdvectionDispersion, PageId::adStartingConditions, texts::hotStartTypeNotValid, {1, 2}},
    {module::kAdvectionDispersion, PageId::adLineDischarge, texts::lineCount},
    {module::kAdvectionDispersion, PageId::adBoxSummation, texts::boxCount},
    {module::kAdvectionDispersion, PageId::adComponent, texts::wrongComponentType, {1, 1}},
    {module::kAdvectionDispersion, PageId::adComponent, texts::componentCount},
    {module::kAdvectionDispersion, PageId::adComponent, texts::oneHeatExchange},
    {module::kAdvectionDispersion, PageId::adDispersionCoef, texts::tooMuchDispersion},
    {module::kAdvectionDispersion, PageId::adDispersionCoef, texts::maximumBelowMinimum},
    {module::kAdvectionDispersion, PageId::massBudget, texts::invalidAssociatedArea, {1, 1}},
    {module::kAdvectionDispersion, PageId::massBudget, texts::tooFewCorners, {1, 1}},
    {module::kAdvectionDispersion, PageId::adFeedback, texts::nothingVaries},
    {module::kAdvectionDispersion, PageId::adFeedback, texts::sameFeedbackItem},
    {module::kAdvectionDispersion, PageId::adFeedback, texts::invalidSalinity},
    {module::kAdvectionDispersion, PageId::adFeedback, texts::invalidTemperature},
};

// What is wrong in them leads to a page, and there to a field, a row or a cell.
TEST_P(WholeModel, EachMessageLeadsToAFieldOrARow) {
  std::set<std::string> seen;
  const auto leads = [&](const CMessage& message) {
    if (!seen.insert(fmt::format("{} {}", message.entries.size(), message.text)).second) return;
    std::string topic;
    std::string local;
    const auto id = static_cast<std::int32_t>(message.page);
    pageClass = enumerator.GetPageClass(id, &topic, &local);
    SCOPED_TRACE(message.text + " on page " + std::to_string(id) + " " + pageClass);
    page = makePage(pageClass, document);
    ASSERT_NE(page, nullptr);
    const PagePlace place = placeOfMessage(message);
    EXPECT_EQ(faultOf(form(), place), "") << "  of \"" << place.thing << "\", field \"" << place.field
                                          << "\", value \"" << place.value << '"' << labelsOf(form());
  };
  // The Wetland Sweep Kit has one area, and the flow alone.
  for (const Told& told : kTold) {
    if (theEdition.wetlandSweepKit) break;
    const bool isOfEntry = told.entry.number > 0;
    const std::vector<ListEntry> entries(isOfEntry ? 1 : 0, told.entry);
    const bool hasNumber = told.text.format.find("%d") != std::string_view::npos;
    const std::string worded = hasNumber ? formatted(told.text, 1, "2") : formatted(told.text, "1", "2");
    if (told.module == GetParam().module) leads({told.page, worded, {}, entries});
  }
  const std::string text = test::textOf(std::string(GRIDBAY_TESTS) + "/main_job/setups/" + GetParam().name);
  for (const auto& [number, file] : {std::pair<std::string, std::string>{"", "none.tsb2"},
                                     {"-1", ""},
                                     {"99999", "x/"},
                                     {"0", "as it is"}}) {
    folder.write(GetParam().name, withValues(text, number, file));
    ASSERT_TRUE(document.OnOpenDocument(path));
    if (!theEdition.wetlandSweepKit) root().moduleSelection->simulationType = GetParam().module;
    ValidationList messages;
    root().Validate(messages, 1);
    for (const CMessage& message : messages) leads(message);
  }
  EXPECT_GE(seen.size(), theEdition.wetlandSweepKit ? 15U : 30U);
}

}  // namespace setup_whole_model_test
}  // namespace gridbay
