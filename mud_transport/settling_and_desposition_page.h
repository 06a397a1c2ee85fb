#pragma once

#include "families/layer_values_page.h"
#include "platform/units/units.h"

namespace gridbay {

class CNmtSettlingAndDespositionBedCompositionKvs;
class CNmtSettlingAndDespositionErosionKvs;

class CNmtMfSettlingAndDepositionGrid final : public ColumnGrid {
  void LayOut() override;
  std::string CornerHeader() override;
  int RowHeaderWidth() override;
  std::string RowHeader(GridRow row) override;
};
// How the components of the multi fraction task settle.
class CNmtMfSettlingAndDepositionDlg final : public Page<18825, PageId::mtMfSettlingAndDeposition> {
  using Page::Page;
  void DoDataExchange(Form& form) override { form.Grid("Settling and deposition", grid_); }

  CNmtMfSettlingAndDepositionGrid grid_;
};

// What pairs of grids with a row for each component have in common.
struct SettlingComponents {
  static constexpr std::string_view kCorner = "Component";
  static constexpr int kRowHeaderWidth = 110;

  static int count(CKvsBase& object);
  static std::string name(CKvsBase& object, int number);
  static std::string title(CKvsBase& object, int number) { return name(object, number); }
};

struct BedCompositionWords : SettlingComponents {
  static constexpr std::string_view kLabel = "Initial bed composition";
  static constexpr int kQuantity = 0;

  static CNmtSettlingAndDespositionBedCompositionKvs* values(CKvsBase& object, int number);
};
class CNmtSettlingAndDespositionBedCompositionGrid1 final : public LayerValuesGrid<BedCompositionWords> {};
class CNmtSettlingAndDespositionBedCompositionGrid2 final
    : public LayerMapsGrid<CNmtSettlingAndDespositionBedCompositionGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The share of each component in the bed when the calculation begins.
class CNmtSettlingAndDespositionBedCompositionDlg final
    : public LayerValuesDlg<18826, PageId::mtSettlingAndDespositionBedComposition, BedCompositionWords,
                            CNmtSettlingAndDespositionBedCompositionGrid1,
                            CNmtSettlingAndDespositionBedCompositionGrid2> {
 public:
  explicit CNmtSettlingAndDespositionBedCompositionDlg(CVdDoc& document);
  ~CNmtSettlingAndDespositionBedCompositionDlg() override;
};

struct FractionErosionWords : SettlingComponents {
  static constexpr std::string_view kLabel = "Erosion coefficients";
  static constexpr int kQuantity = item::kErosionRateInGrams;

  static CNmtSettlingAndDespositionErosionKvs* values(CKvsBase& object, int number);
};
class CNmtSettlingAndDespositionErosionGrid1 final : public LayerValuesGrid<FractionErosionWords> {};
class CNmtSettlingAndDespositionErosionGrid2 final
    : public LayerMapsGrid<CNmtSettlingAndDespositionErosionGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// How fast each component is eroded.
class CNmtSettlingAndDespositionErosionDlg final
    : public LayerValuesDlg<18827, PageId::mtSettlingAndDespositionErosion, FractionErosionWords,
                            CNmtSettlingAndDespositionErosionGrid1, CNmtSettlingAndDespositionErosionGrid2> {
 public:
  explicit CNmtSettlingAndDespositionErosionDlg(CVdDoc& document);
  ~CNmtSettlingAndDespositionErosionDlg() override;
};

}  // namespace gridbay
