#pragma once

#include <string>

#include "core/file_selector.h"
#include "core/kvs_base.h"
#include "core/message.h"
#include "core/selections.h"
#include "ecology/solver_item.h"

namespace gridbay {

// The state variables that are carried with the water, as what this module carries
// (families/entry_constants.h): an entry is the n-th transported one, from 1.
struct WqsVariables {
  using Value = double;
  using File = UTsbSelection;

  static int count(CKvsBase& object);
  // Its symbol.
  static std::string name(CKvsBase& object, int entry);
  // The item code of its quantity; 0 where it has none.
  static int quantity(CKvsBase& object, int entry);
  static int sourceQuantity(CKvsBase& object, int entry, int) { return quantity(object, entry); }
  static void requestItems(CVdFileSelectorDlg& selector, CKvsBase& object);
  static void requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int) {
    requestItems(selector, object);
  }

  // Its declaration, or null; its number in the definition, by which its sections on file go; and the value
  // that it begins with.
  static const CSolverItem* declaration(CKvsBase& object, int entry);
  static int id(CKvsBase& object, int entry);
  static double defaultValue(CKvsBase& object, int entry);
};

// The request for one item of what is declared: any quantity will do where it names none.
void requestDeclared(CVdFileSelectorDlg& selector, const Text& description, const CSolverItem* declared);

// A message that a value of a declaration, null for none, is out of its range; one without limits has no
// value in range. Returns the number of faults.
unsigned checkRange(ValidationList& messages, PageId page, const CSolverItem* declared, double value,
                    const std::string& place);

}  // namespace gridbay
