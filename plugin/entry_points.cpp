#include "plugin/entry_points.h"

#include <string_view>

#include "core/edition.h"

namespace gridbay {
namespace {

class GridbayDocTemplate final : public CVdDocTemplate {
 public:
  std::string GetDocString(Field field) const override {
    std::string_view rest = theEdition.document.format;
    for (int i = 0; i < field; ++i) rest.remove_prefix(rest.find('\n') + 1);
    return std::string(rest.substr(0, rest.find('\n')));
  }
  int GetStringId() const override { return theEdition.document.id; }
  std::string GetDocumentClass() const override { return "CGridbayDoc"; }
  std::unique_ptr<CV27SetupChildFrame> CreateFrame() const override {
    return std::make_unique<CChildFrame>();
  }
  std::unique_ptr<SetupEditor> CreateNewDocument(SetupHost& host) const override {
    return makeSetupEditor(host);
  }
};

int nothing() {
  return 0;
}

}  // namespace
}  // namespace gridbay

int VdGetNumDocTemplates() {
  return 1;
}

gridbay::CVdDocTemplate* VdGetDocTemplatePtr(int index) {
  return index == 0 ? std::make_unique<gridbay::GridbayDocTemplate>().release() : nullptr;
}

int VdGetEditorString(std::string* name) {
  if (name == nullptr) return 0;
  *name = gridbay::theEdition.editorName.format;
  return 1;
}

int VdGetBitmapId() {
  return gridbay::nothing();
}
int VdGetNumToolbars() {
  return gridbay::nothing();
}
int VdGetToolbarString() {
  return gridbay::nothing();
}
int VdInitToolbar() {
  return gridbay::nothing();
}
