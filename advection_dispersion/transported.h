#pragma once

#include <cstdint>
#include <string>

#include "core/file_name.h"
#include "core/file_selector.h"
#include "core/kvs_base.h"

namespace gridbay {

class CNadComponentKvs;

// The list of components that a part of the model belongs with; null where it stands in no whole model.
CNadComponentKvs* componentsOf(CKvsBase& object);

// The components as what this module carries with the water (families/entry_constants.h).
struct AdComponents {
  using Value = float;
  using File = UFileName;

  static int count(CKvsBase& object);
  static std::string name(CKvsBase& object, int component);
  // A concentration, or the temperature of a component that is heat.
  static int quantity(CKvsBase& object, int component);
  // The same of an item in a file.
  static int itemQuantity(CKvsBase& object, int component);
  // A pair of source and sink changes the temperature by a difference.
  static int sourceQuantity(CKvsBase& object, int component, int source);
  static void requestItems(CVdFileSelectorDlg& selector, CKvsBase& object);
  static void requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int source);
};

}  // namespace gridbay
