#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <vector>

#include "core/selections.h"
#include "pages/field_picks.h"
#include "pages/host.h"

namespace gridbay {

// Lets the user choose what a result file holds of an area and of time: first, last and interval of points
// along X (J, from 0) and Y (K, from 0), and of time steps (from 0).
class CV27SetupResultSubsetDialog {
 public:
  // The six integers of an area and the three of a line, in that order.
  using Range = std::array<std::int32_t, 9>;

  static Range rangeOf(const USubArea& area, const USubLine& steps);
  static void copyBack(const Range& range, USubArea& area, USubLine& steps);

  // The limits are the last J and K index of the area, and the last time step; with one below 0, which
  // is not known, any range will do.
  CV27SetupResultSubsetDialog(const Range& range, std::int32_t lastJ, std::int32_t lastK,
                              std::int32_t lastStep);

  // The part can be pointed at on a map, on the grid of an area; one that is a line has no width.
  void SetPick(std::int32_t area, bool isLine);
  // Shows the dialog; 1 for OK, with the choice in `range`. Nothing changes otherwise.
  int DoModal(SetupHost& host);
  const Range& range() const { return range_; }

 private:
  std::string fault();

  Range range_;
  Range shown_;
  std::array<std::int32_t, 3> limits_;
  Form form_;
  std::vector<FieldPick> picks_;
};

}  // namespace gridbay
