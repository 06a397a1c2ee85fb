#pragma once

#include <string>
#include <vector>

#include "core/file_name.h"
#include "core/file_selector.h"
#include "core/kvs_base.h"

namespace gridbay {

class CNmtTaskSelectionKvs;

// The task that a part of the model belongs with; null where it stands in no whole model.
CNmtTaskSelectionKvs* mudTaskOf(CKvsBase& object);

// Salinity and fractions as what this module carries with the water (families/entry_constants.h). The
// quantities of a file's items are the modeller's affair: only their number is asked for, without salinity.
struct MudFractions {
  using Value = float;
  using File = UFileName;

  static int count(CKvsBase& object);
  static std::string name(CKvsBase& object, int entry);
  static int quantity(CKvsBase& object, int entry);
  static int sourceQuantity(CKvsBase& object, int entry, int source);
  static void requestItems(CVdFileSelectorDlg& selector, CKvsBase& object);
  static void requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int source);
};

// Their names: they are the entries of this module's lines and boxes.
std::vector<std::string> mudFractionNames(CKvsBase& object);

}  // namespace gridbay
