#include "setup/gridbay_doc.h"

#include "core/edition.h"

namespace gridbay {

CGridbayDoc::CGridbayDoc(SetupHost& host) : CV27SetupDoc(host), fileKind_(theEdition.fileKind) {
  SetEngine("gridbay.exe");
}

bool CGridbayDoc::OnCommand(int id) {
  switch (id) {
    case kAutomaticValidation:
      automaticValidation_ = automaticValidation_ == 1 ? 0 : 1;
      return true;
    case kValidate: {
      ValidationList messages;
      const unsigned faults = ValidateData(messages);
      host().showMessages(messages, faults);
      return true;
    }
    case kStartSimulation:
      RunEngineApv2(host().isShiftHeld() ? 0 : 1, "", 1, 1, 0);
      return true;
    default:
      return false;
  }
}

void CGridbayDoc::RunEngineApv2(int flag, std::string_view text, int a, int b, int c) {
  if (path().empty()) {
    host().show("The setup must be saved before it can be run.");
    return;
  }
  if (IsModified() &&
      (!host().askYesNo("The setup has changes that are not saved. Save it, and run it then?") ||
       !OnSaveDocument(path())))
    return;
  if (automaticValidation_ == 1) {
    ValidationList messages;
    const unsigned faults = ValidateData(messages);
    host().showMessages(messages, faults);
    if (faults > 0) return;
  }
  host().startEngine({engine(), path(), flag, std::string(text), {a, b, c}});
}

}  // namespace gridbay
