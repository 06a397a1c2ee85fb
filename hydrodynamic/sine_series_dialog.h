#pragma once

#include <string>
#include <string_view>

#include "hydrodynamic/boundary.h"
#include "pages/dialog.h"
#include "pages/grid_wnd.h"
#include "platform/units/edit_style.h"

namespace gridbay {

// A sine series in one line, "amplitude sin( 2 pi (t - phase)/period )  + reference level", its levels in the
// unit of the style.
std::string sineText(const CNhdBoundaryObjectKvs& object, const CVdEditStyle& style);
// The fields go into the object as they are read, also when the text then turns out to be too short: phase
// and period that were read, and amplitude and reference level as 0 where they were not.
Stored storeSineText(CNhdBoundaryObjectKvs& object, std::string_view text, const CVdEditStyle& style);

// The dialog of a sine series, over a copy of it; OK copies the four values back.
class CNhdSineSeriesDlg final : public CV27SetupDialog {
 public:
  CNhdSineSeriesDlg(CVdDoc& document, const CNhdBoundaryObjectKvs& object);
  void OnOK(CNhdBoundaryObjectKvs& object) const;

 private:
  CNhdBoundaryObjectKvs copy_{nullptr};
};

}  // namespace gridbay
