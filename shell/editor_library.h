#pragma once

#include <QString>
#include <memory>

#include "plugin/doc_template.h"

namespace gridbay::shell {

// An editor found in a plug-in library of the installation, through its entry points.
class EditorLibrary {
 public:
  // Null, with the reason and where it was looked for, when there is none.
  static std::unique_ptr<EditorLibrary> load(const QString& name, QString* error);
  ~EditorLibrary();

  const QString& editorName() const { return editorName_; }
  QString docString(CVdDocTemplate::Field field) const;
  std::unique_ptr<SetupEditor> newDocument(SetupHost& host) const {
    return template_->CreateNewDocument(host);
  }

 private:
  explicit EditorLibrary(void* library) : library_(library) {}

  void* library_;
  QString editorName_;
  std::unique_ptr<CVdDocTemplate> template_;
};

}  // namespace gridbay::shell
