#pragma once

#include "basic/bathymetry.h"
#include "core/file_selector.h"

namespace gridbay {

// What the grid file of an area must be.
void RequestBathymetry(CVdFileSelectorDlg& selector, bool hotStart);

// What the fine bathymetry of the overland solver must be: cells that divide those of Area 1.
class COverlandRqTsbItem final : public CVdRqTsbItem {
 public:
  explicit COverlandRqTsbItem(const CBathymetryObjectKvs& area1);

  bool IsTsbFileValid(const TsbHeader& header, CValidationMessageBuffer& buffer,
                      std::span<const std::uint32_t> items) const override;

 private:
  int area1NoJ_;
  int area1NoK_;
  float area1Dx_;
  float area1Dy_;
};

}  // namespace gridbay
