#pragma once

#include <memory>
#include <string>

#include "pages/host.h"
#include "plugin/setup_editor.h"

namespace gridbay {

// How the host makes documents of an editor. The fields of its strings are those of a document template's
// resource.
class CVdDocTemplate {
 public:
  enum Field { kHelpFile, kDefaultName, kNewFileName, kFilterLabel, kExtension, kTypeId, kTypeName };

  virtual ~CVdDocTemplate() = default;

  // One of the seven fields.
  virtual std::string GetDocString(Field field) const = 0;
  // A new document with a whole default model. The host must outlive it.
  virtual std::unique_ptr<SetupEditor> CreateNewDocument(SetupHost& host) const = 0;
};

}  // namespace gridbay
