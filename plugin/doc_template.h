#pragma once

#include <memory>
#include <string>

#include "pages/gridbay_doc.h"
#include "pages/host.h"

namespace gridbay {

// How the host makes documents of an editor. The fields of its strings are those of a document template's
// resource.
class CVdDocTemplate {
 public:
  enum Field { kHelpFile, kDefaultName, kNewFileName, kFilterLabel, kExtension, kTypeId, kTypeName };

  virtual ~CVdDocTemplate() = default;

  // One of the seven fields.
  virtual std::string GetDocString(Field field) const = 0;
  virtual std::unique_ptr<CGridbayDoc> CreateNewDocument(SetupHost& host) const = 0;
};

}  // namespace gridbay
