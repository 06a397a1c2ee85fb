#pragma once

#include <memory>
#include <string>

#include "pages/host.h"
#include "plugin/setup_editor.h"
#include "setup/child_frame.h"

namespace gridbay {

// How the host makes documents of an editor. The fields of its strings are those of a document template's
// resource.
class CVdDocTemplate {
 public:
  enum Field { kHelpFile, kDefaultName, kNewFileName, kFilterLabel, kExtension, kTypeId, kTypeName };

  virtual ~CVdDocTemplate() = default;

  // One of the seven fields.
  virtual std::string GetDocString(Field field) const = 0;
  // The id of the strings, the class of its documents, and the frame that they are shown in.
  virtual int GetStringId() const = 0;
  virtual std::string GetDocumentClass() const = 0;
  virtual std::unique_ptr<CV27SetupChildFrame> CreateFrame() const = 0;
  // A new document with a whole default model. The host must outlive it.
  virtual std::unique_ptr<SetupEditor> CreateNewDocument(SetupHost& host) const = 0;
};

}  // namespace gridbay
