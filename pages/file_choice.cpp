#include "pages/file_choice.h"

#include "platform/files/paths.h"

namespace gridbay {

std::string FileChoice::text(GridRow row) const {
  const FileRef held = file(row);
  return held.name == nullptr ? std::string() : held.name->text();
}

// A name that is typed as it stands stays where it was relative to.
void FileChoice::type(std::string_view text, GridRow row, CVdDoc& document) const {
  const FileRef held = file(row);
  if (held.name == nullptr) return;
  if (text != held.name->text()) held.name->Set(text, document.path());
  if (changed) changed(row);
  if (typed) typed(row);
}

bool FileChoice::choose(GridRow row, CVdDoc& document) const {
  const FileRef held = file(row);
  if (held.name == nullptr || (ready && !ready(row))) return false;
  const FileKind what = kind(row);
  std::string name = held.name->text();
  if (request && !isResult) {
    CVdFileSelectorDlg selector(what.extension, name, what.filter,
                                held.items == nullptr ? std::vector<std::uint32_t>() : *held.items, 1);
    request(selector, row);
    selector.SetChooser(&document.host());
    if (selector.DoModal() != 1) return false;
    name = selector.fileName();
    if (held.items != nullptr) *held.items = selector.GetSelectedItems();
  } else if (!(isResult ? document.host().chooseSaveFile(what.filter, what.extension, &name)
                        : document.host().chooseFile(what.filter, what.extension, &name))) {
    return false;
  }
  held.name->Set(name, document.path());
  if (changed) changed(row);
  if (chosen) chosen(row);
  return true;
}

bool FileChoice::canView(GridRow row) const {
  const FileRef held = file(row);
  return held.name != nullptr && isReadableFile(held.name->absolute());
}

void FileChoice::view(GridRow row, CVdDoc& document) const {
  if (canView(row)) document.host().openFile(document.getAbsoluteFilepath(file(row).name->absolute()), 0);
}

}  // namespace gridbay
