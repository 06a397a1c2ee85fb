#pragma once

#include "families/layer_values_page.h"

namespace gridbay {

class CNmtConstantSlidingLayerKvs;

struct ConstantSlidingWords {
  static constexpr std::string_view kLabel = "Constant friction coefficient";
  static constexpr std::string_view kCorner = "Layer";
  static constexpr int kRowHeaderWidth = 40;
  static constexpr int kQuantity = 0;

  static int count(CKvsBase& object);
  static CNmtConstantSlidingLayerKvs* values(CKvsBase& object, int number);
  static std::string name(CKvsBase& object, int number);
  static std::string title(CKvsBase& object, int number);
};
class CNmtConstantSlidingGrid1 final : public LayerValuesGrid<ConstantSlidingWords> {};
class CNmtConstantSlidingGrid2 final : public LayerMapsGrid<CNmtConstantSlidingGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The friction coefficient of each layer.
class CNmtConstantSlidingDlg final
    : public LayerValuesDlg<18812, PageId::mtConstantSliding, ConstantSlidingWords, CNmtConstantSlidingGrid1,
                            CNmtConstantSlidingGrid2> {
 public:
  explicit CNmtConstantSlidingDlg(CVdDoc& document);
  ~CNmtConstantSlidingDlg() override;
};

class CNmtVariableSlidingGrid final : public AreaMapsGrid {
  void LayOut() override;
};
// The friction coefficient that varies with the bed.
class CNmtVariableSlidingDlg final : public Page<18837, PageId::mtVariableSliding> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  CNmtVariableSlidingGrid grid_;
};

// Whether the layers slide, and by which coefficient.
class CNmtSlidingDlg final : public Page<18832, PageId::mtSliding> {
  using Page::Page;
  void DoDataExchange(Form& form) override;
};

}  // namespace gridbay
