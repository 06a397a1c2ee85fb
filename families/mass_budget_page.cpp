#include "families/mass_budget_page.h"

#include "families/entry_selection.h"
#include "families/page_texts.h"

namespace gridbay {

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
    if (chooseEntries(document(), "File " + std::to_string(row.item), list_().entryNames(),
                      item(row)->entries))
      UpdateDoc();
  });
}

void listMassBudgetControls(Form& form, const MassFileGrid::List& list, MassFileGrid& grid) {
  form.Count("&Number of files:", countOf(list), MassFileList::kMostOnPage);
  form.Grid("Files", grid);
}

}  // namespace gridbay
