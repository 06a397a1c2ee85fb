#pragma once

#include "families/layer_values_page.h"
#include "mud_transport/mud_transport_parts.h"
#include "platform/units/units.h"

// The pages of what makes each layer of the bed erode. Each has a grid of the layers, and beside it one of
// the maps of the current layer.

namespace gridbay {

struct ErosionForEachLayerCriticalWords : LayersOfRoot<&MudTransportParts::nmtErosionForEachLayerCritical> {
  static constexpr std::string_view kLabel = "Critical shear stress for erosion";
  static constexpr int kQuantity = item::kShearStress;
};
class CNmtErosionForEachLayerCriticalGrid1 final : public LayerValuesGrid<ErosionForEachLayerCriticalWords> {
};
class CNmtErosionForEachLayerCriticalGrid2 final
    : public LayerMapsGrid<CNmtErosionForEachLayerCriticalGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The shear stress at which each layer begins to erode.
class CNmtErosionForEachLayerCriticalDlg final
    : public LayerValuesDlg<18831, PageId::mtErosionForEachLayerCritical, ErosionForEachLayerCriticalWords,
                            CNmtErosionForEachLayerCriticalGrid1, CNmtErosionForEachLayerCriticalGrid2> {
 public:
  explicit CNmtErosionForEachLayerCriticalDlg(CVdDoc& document);
  ~CNmtErosionForEachLayerCriticalDlg() override;
};

struct ErosionForEachLayerFactorWords : LayersOfRoot<&MudTransportParts::nmtErosionForEachLayerFactor> {
  static constexpr std::string_view kLabel = "Erosion coefficient factor";
  static constexpr int kQuantity = item::kErosionRateInGrams;
};
class CNmtErosionForEachLayerFactorGrid1 final : public LayerValuesGrid<ErosionForEachLayerFactorWords> {};
class CNmtErosionForEachLayerFactorGrid2 final : public LayerMapsGrid<CNmtErosionForEachLayerFactorGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// How fast each layer erodes, described by one factor.
class CNmtErosionForEachLayerFactorDlg final
    : public LayerValuesDlg<18815, PageId::mtErosionForEachLayerFactor, ErosionForEachLayerFactorWords,
                            CNmtErosionForEachLayerFactorGrid1, CNmtErosionForEachLayerFactorGrid2> {
 public:
  explicit CNmtErosionForEachLayerFactorDlg(CVdDoc& document);
  ~CNmtErosionForEachLayerFactorDlg() override;
};

struct ErosionForEachLayerFactor1Words : LayersOfRoot<&MudTransportParts::nmtErosionForEachLayerFactor1> {
  static constexpr std::string_view kLabel = "Erosion coefficient factor 1 [-]";
  static constexpr int kQuantity = 0;
};
class CNmtErosionForEachLayerFactor1Grid1 final : public LayerValuesGrid<ErosionForEachLayerFactor1Words> {};
class CNmtErosionForEachLayerFactor1Grid2 final : public LayerMapsGrid<CNmtErosionForEachLayerFactor1Grid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The first of the two factors of the erosion.
class CNmtErosionForEachLayerFactor1Dlg final
    : public LayerValuesDlg<18816, PageId::mtErosionForEachLayerFactor1, ErosionForEachLayerFactor1Words,
                            CNmtErosionForEachLayerFactor1Grid1, CNmtErosionForEachLayerFactor1Grid2> {
 public:
  explicit CNmtErosionForEachLayerFactor1Dlg(CVdDoc& document);
  ~CNmtErosionForEachLayerFactor1Dlg() override;
};

struct ErosionForEachLayerFactor2Words : LayersOfRoot<&MudTransportParts::nmtErosionForEachLayerFactor2> {
  static constexpr std::string_view kLabel = "Erosion coefficient factor 2 [-]";
  static constexpr int kQuantity = 0;
};
class CNmtErosionForEachLayerFactor2Grid1 final : public LayerValuesGrid<ErosionForEachLayerFactor2Words> {};
class CNmtErosionForEachLayerFactor2Grid2 final : public LayerMapsGrid<CNmtErosionForEachLayerFactor2Grid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The second of the two factors of the erosion.
class CNmtErosionForEachLayerFactor2Dlg final
    : public LayerValuesDlg<18817, PageId::mtErosionForEachLayerFactor2, ErosionForEachLayerFactor2Words,
                            CNmtErosionForEachLayerFactor2Grid1, CNmtErosionForEachLayerFactor2Grid2> {
 public:
  explicit CNmtErosionForEachLayerFactor2Dlg(CVdDoc& document);
  ~CNmtErosionForEachLayerFactor2Dlg() override;
};

struct ErosionForEachLayerPowerWords : LayersOfRoot<&MudTransportParts::nmtErosionForEachLayerPower> {
  static constexpr std::string_view kLabel = "Erosion coefficient power/alpha";
  static constexpr int kQuantity = 0;
};
class CNmtErosionForEachLayerPowerGrid1 final : public LayerValuesGrid<ErosionForEachLayerPowerWords> {};
class CNmtErosionForEachLayerPowerGrid2 final : public LayerMapsGrid<CNmtErosionForEachLayerPowerGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The power of the erosion of a dense layer, or the alpha of that of a soft one.
class CNmtErosionForEachLayerPowerDlg final
    : public LayerValuesDlg<18818, PageId::mtErosionForEachLayerPower, ErosionForEachLayerPowerWords,
                            CNmtErosionForEachLayerPowerGrid1, CNmtErosionForEachLayerPowerGrid2> {
 public:
  explicit CNmtErosionForEachLayerPowerDlg(CVdDoc& document);
  ~CNmtErosionForEachLayerPowerDlg() override;
};

struct ErosionForEachLayerDensityWords : LayersOfRoot<&MudTransportParts::nmtErosionForEachLayerDensity> {
  static constexpr std::string_view kLabel = "Density of bed layer";
  static constexpr int kQuantity = item::kBedDensityInGrams;
};
class CNmtErosionForEachLayerDensityGrid1 final : public LayerValuesGrid<ErosionForEachLayerDensityWords> {};
class CNmtErosionForEachLayerDensityGrid2 final : public LayerMapsGrid<CNmtErosionForEachLayerDensityGrid1> {
 public:
  using LayerMapsGrid::LayerMapsGrid;
};
// The density of the dry sediment in each layer.
class CNmtErosionForEachLayerDensityDlg final
    : public LayerValuesDlg<18813, PageId::mtErosionForEachLayerDensity, ErosionForEachLayerDensityWords,
                            CNmtErosionForEachLayerDensityGrid1, CNmtErosionForEachLayerDensityGrid2> {
 public:
  explicit CNmtErosionForEachLayerDensityDlg(CVdDoc& document);
  ~CNmtErosionForEachLayerDensityDlg() override;
};

}  // namespace gridbay
