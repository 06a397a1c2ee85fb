#include "families/mass_budget_page.h"

#include "families/entry_selection.h"
#include "families/page_texts.h"

namespace gridbay {
namespace {

// Lets the user choose among the entries, and the variables behind them; true when he did.
bool chooseItems(CVdDoc& document, const std::string& whose, MassFileList& list, MassFile& file) {
  std::vector<std::string> names = list.entryNames();
  const std::vector<std::string> variables = list.variableNames();
  const auto entries = static_cast<std::ptrdiff_t>(names.size());
  EntryFlags chosen = file.entries;
  chosen.resize(names.size());
  chosen.insert(chosen.end(), file.variables.begin(), file.variables.end());
  names.insert(names.end(), variables.begin(), variables.end());
  if (!chooseEntries(document, whose, std::move(names), chosen)) return false;
  file.entries.assign(chosen.begin(), chosen.begin() + entries);
  file.variables.assign(chosen.begin() + entries, chosen.end());
  return true;
}

}  // namespace

void MassFileGrid::LayOut() {
  const auto item = [this](GridRow row) { return list_().GetMassFile(row.item); };
  const FileChoice file = resultFileOf(item, &MassFile::file, texts::massFile);
  Rows([this] { return list_().GetCount(); });
  Integer("Associated polygon", 110, item, &MassFile::polygon);
  Range("TRange", 80, [item](GridRow row) { return &item(row)->steps; });
  FileName("Filename", 160, file);
  BrowseBeside(file);
  View("View", 45, file);
  Text("Title", 120, item, &MassFile::title);
  Button("Items...", 60, [this, item](GridRow row) {
    if (chooseItems(document(), "File " + std::to_string(row.item), list_(), *item(row))) UpdateDoc();
  });
}

void listMassBudgetControls(Form& form, const MassFileGrid::List& list, MassFileGrid& grid) {
  form.Count("&Number of files:", countOf(list), MassFileList::kMostOnPage);
  form.Grid("Files", grid);
}

}  // namespace gridbay
