#include "ecology/constants_page.h"

namespace gridbay {

using Constant = CWQSConstantsItemKvs;

// All have the same number of areas.
int CWQSConstantsGridDlg::areas() {
  const Constant* first = constant(1);
  return first == nullptr ? 0 : static_cast<int>(first->files.size());
}

Constant* CWQSConstantsGridDlg::constant(int number) {
  if (list_ == nullptr) list_ = parts<EcologyParts>().wqsConstants.get();
  return list_->GetItem(number);
}

RowLook CWQSConstantsGridDlg::GetRowLook(int row) {
  RowLook look = BandedGrid::GetRowLook(row);
  const GridRow at = rowAt(row);
  const Constant* held = constant(at.item);
  if (at.sub > 0 && (held == nullptr || held->IsConstant())) look = {.height = 0};
  if (at.sub == 0 && held != nullptr && held->IsConstant()) look.lineBelow = true;
  return look;
}

void CWQSConstantsGridDlg::LayOut() {
  list_ = nullptr;
  Rows([this] { return parts<EcologyParts>().wqsConstants->GetCount(); });
  ListDeclared<Constant>(
      [](EcologyParts& module, int number) { return module.wqsConstants->GetItem(number); },
      [](Constant& held) {
        Choices choices{{Constant::kConstant, "Constant"}};
        if (!held.HasSpatialVariation()) return choices.Otherwise(0);
        choices.Add({Constant::kMap, "Type 2 File"});
        choices.Add({Constant::kOther, ""});
        return choices.Otherwise(2);
      });
  const auto isFile = [this](GridRow row) {
    const Constant* held = constant(row.item);
    return row.sub > 0 && held != nullptr && held->IsUserSpecified() && !held->IsConstant();
  };
  const FileChoice file{
      .file = [this](GridRow row) -> FileRef {
        Constant* held = constant(row.item);
        UTsbSelection* selection = held == nullptr ? nullptr : held->File(row.sub);
        return selection == nullptr ? FileRef() : FileRef(*selection);
      },
      .kind = texts::type2File,
      .request = [this](CVdFileSelectorDlg& selector,
                        GridRow row) { constant(row.item)->RequestDataFile(selector, row.sub); }};
  File({.file = file, .browse = "...", .enabled = isFile});
}

}  // namespace gridbay
