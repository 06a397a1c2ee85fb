#pragma once

#include <string>
#include <vector>

#include "core/file_name.h"
#include "core/file_selector.h"
#include "core/kvs_base.h"

namespace gridbay {

class CNmtExpTaskSelectionKvs;

// The counts that a part of the model belongs with; null where it stands in no whole model.
CNmtExpTaskSelectionKvs* expandedCountsOf(CKvsBase& object);
bool carriesSalinity(CKvsBase& object);
int fractionCount(CKvsBase& object);
int layerCount(CKvsBase& object);

// What this module carries with the water: salinity, where it is included, and the fractions behind it
// (families/entry_constants.h). A name and a quantity are asked for by position, which goes on through the
// layers of the bed behind the fractions.
struct ExpandedMudEntries {
  using Value = float;
  using File = UFileName;

  static int count(CKvsBase& object);
  static std::string name(CKvsBase& object, int position);
  static int quantity(CKvsBase& object, int position);
  static int sourceQuantity(CKvsBase& object, int entry, int source);
  // An item for each fraction, of any quantity: salinity is not counted.
  static void requestItems(CVdFileSelectorDlg& selector, CKvsBase& object);
  static void requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int source);
};

// The names of all that is carried.
std::vector<std::string> expandedEntryNames(CKvsBase& object);

}  // namespace gridbay
