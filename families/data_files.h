#pragma once

#include <string>
#include <vector>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "core/file_selector.h"
#include "core/kvs_base.h"
#include "core/message.h"
#include "core/selections.h"

// What the objects of all modules ask of their data files, and how they tell that a file is not what it must
// be.

namespace gridbay {

// Requires of a file that it covers the simulation.
void requestSimulationPeriod(CVdFileSelectorDlg& selector, CKvsBase& object);

// Requires of a map that it fits area `number` (from 1); without such an area only that it is a map. The
// request is a CVdRqTsbItem or a CVdFileSelectorDlg.
void requestArea(auto& request, CKvsBase& object, int number) {
  auto* basic = object.parts<BasicParts>();
  const CBathymetryObjectKvs* area = basic == nullptr ? nullptr : basic->bathymetry->GetArea(number);
  if (area == nullptr) {
    request.SetDimensions(2);
  } else {
    RequestMatchesArea(*area, request);
  }
}

// The request for the map of area `number`: one item, of one of the quantities.
void requestMap(CVdFileSelectorDlg& selector, CKvsBase& object, int number, const Text& description,
                std::vector<int> itemTypes);
// The request for the map of area `number`: one item, of one quantity. A map that varies covers the
// simulation, one of a single time step holds throughout.
void requestVaryingMap(CVdFileSelectorDlg& selector, CKvsBase& object, int number, const Text& description,
                       int itemType);
// Requires of a file that it is a time series of one quantity, and covers the simulation.
void requestTimeSeries(CVdFileSelectorDlg& selector, CKvsBase& object, const Text& description, int itemType);

// Points on a boundary, both ends counted: last minus first and one, or by the greater extent of the two;
// -1 for a diagonal.
int pointsAlong(const CBoundaryObjectKvs& boundary);
int pointsByExtent(const CBoundaryObjectKvs& boundary);

// Requires of a profile that it lies along a boundary, which may be null, with so many points. The request is
// a CVdRqTsbItem or a CVdFileSelectorDlg.
void requestAlongBoundary(auto& request, CBoundaryObjectKvs* boundary,
                          int (*points)(const CBoundaryObjectKvs&)) {
  constexpr int kNone = -1;
  request.SetDimensions(1);
  request.SetNoPoints(1, boundary == nullptr ? kNone : points(*boundary));
  // 0 stands for a grid that has not been read: then any spacing may be right.
  const float spacing = boundary == nullptr ? kNone : boundary->CellSpacing();
  if (spacing != 0) request.SetInterval(1, spacing);
}

// The last word of nearly all requests: no plug-ins, and a file that the engine takes as it is.
void requestForEngine(CVdFileSelectorDlg& selector);

// A message that a file is not valid, with the selector's reason behind it where that is wanted. Returns 1.
enum class Reason { left, told };
unsigned reportDataFile(ValidationList& messages, PageId page, const FileNameValue& file,
                        const std::string& why, Reason reason = Reason::told,
                        Severity severity = Severity::fault);

// Tells that the model uses a file, for a check that looks at it in a way of its own.
void noteDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                  const FileNameValue& file, const std::vector<std::uint32_t>& items = {});

// Whether a file, with the items chosen in it, meets what the selector asks; else that message. Returns the
// number of faults.
unsigned checkDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                       const UTsbSelection& file, Reason reason = Reason::left,
                       Severity severity = Severity::fault);
// The same for a file with no items to choose.
unsigned checkDataFile(ValidationList& messages, PageId page, const CVdFileSelectorDlg& selector,
                       const FileNameValue& file, Reason reason = Reason::left,
                       Severity severity = Severity::fault);

}  // namespace gridbay
