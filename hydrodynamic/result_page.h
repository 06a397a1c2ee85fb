#pragma once

#include <cstdint>
#include <functional>
#include <vector>

#include "families/result_pages.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/result.h"

namespace gridbay {

// A row for each output.
class CResultGrid final : public ResultFileGrid {
  void LayOut() override;

  Column& pointsOrRange(std::string_view header, std::vector<double> CNhdResultObjectKvs::*points,
                        std::vector<double> CNhdResultObjectKvs::*others, USubLine USubArea::*range);
  // The pick of both.
  static Column::Pick pointsOrPart(const std::function<CNhdResultObjectKvs*(GridRow)>& output);
  void choosePart(CNhdResultObjectKvs& output);
  void chooseItems();
};

using CHotStartGrid = ResultHotStartGrid<&HydrodynamicParts::nhdResult>;

// What the flow calculation writes, and how large it will be.
class CResultDlg final : public Page<18921, PageId::hdResult> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CResultGrid outputs_;
  CHotStartGrid hotStarts_;
};

}  // namespace gridbay
