#pragma once

#include <string>

#include "core/kvs_base.h"
#include "pages/vd_doc.h"

namespace gridbay {

class CV27SetupGridWnd;

// Where a grid or the fields of a form stand: on a page, or in a dialog.
class GridHost {
 public:
  virtual ~GridHost() = default;

  virtual CVdDoc& document() = 0;
  // What a grid or a button has changed is to be kept: by a page in the document, by a dialog until OK.
  // Nonzero on success.
  virtual int UpdateDoc() = 0;
  // Names the edit that a grid is making, for as long as it makes it; empty at its end.
  virtual void SetEditName(std::string name) = 0;
  // Shows the model, or the copy, again, as when another row has become the current one.
  virtual void Refresh() = 0;
  virtual std::string nameOf(const CV27SetupGridWnd& grid) = 0;

  // The root of the model, and the members that a room has in it.
  CKvsBase& GetKvs() { return document().GetKvs(); }
  template <class Parts>
  Parts& parts() {
    return *GetKvs().parts<Parts>();
  }
  // A function that gives the object which such a member holds.
  template <class Parts, class Pointer>
  auto objectOf(Pointer Parts::*member) {
    return [ this, member ]() -> auto& {
      return *(parts<Parts>().*member);
    };
  }
};

}  // namespace gridbay
