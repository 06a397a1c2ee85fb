#pragma once

#include <array>

#include "pages/dialog.h"

namespace gridbay {

// The parameters of weir formula 3 (extended Honma), in the order of the file; lengths in metres. No page
// opens it: weirs of that formula can't be chosen yet, and the parameters of a file pass through.
class WeirFormula3Dialog final : public CV27SetupDialog {
 public:
  using Parameters = std::array<double, 14>;

  WeirFormula3Dialog(CVdDoc& document, const Parameters& parameters);
  void OnOK(Parameters& parameters) const { parameters = parameters_; }

 private:
  Parameters parameters_;
};

}  // namespace gridbay
