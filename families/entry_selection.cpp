#include "families/entry_selection.h"

#include "pages/cell_grid.h"
#include "pages/dialog.h"

namespace gridbay {
namespace {

// A row for each entry.
class EntryGrid final : public ColumnGrid {
 public:
  EntryGrid(const std::vector<std::string>& names, EntryFlags& flags) : names_(names), flags_(flags) {}

 private:
  void LayOut() override {
    Rows([this] { return static_cast<int>(names_.size()); });
    const auto at = [](GridRow row) { return static_cast<std::size_t>(row.item) - 1; };
    Shown("Item", 160, [this, at](GridRow row) { return names_[at(row)]; });
    Check("Include", 60, [this, at](GridRow row) { return &flags_[at(row)]; });
  }

  const std::vector<std::string>& names_;
  EntryFlags& flags_;
};

}  // namespace

bool chooseEntries(CVdDoc& document, const std::string& whose, std::vector<std::string> names,
                   EntryFlags& flags) {
  EntryFlags copy = flags;
  copy.resize(names.size());
  EntryGrid grid(names, copy);
  CV27SetupDialog dialog(document, "Items Selection");
  dialog.form().Shown("Items for:", [&whose] { return whose; });
  dialog.form().Grid("Items", grid);
  if (dialog.DoModal() != 1) return false;
  flags = copy;
  return true;
}

}  // namespace gridbay
