#pragma once

#include "families/layer_values.h"

// How each layer of the bed erodes: six values, each with its maps, its layers and their list.

namespace gridbay {

// The shear stress (N/m²) at which a layer begins to erode.
class CNmtErosionForEachLayerCriticalMapKvs final
    : public AreaMapKvs<CNmtErosionForEachLayerCriticalMapKvs, PageId::mtErosionForEachLayerCritical> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtErosionForEachLayerCriticalLayerKvs final
    : public ConstantOrMapsKvs<CNmtErosionForEachLayerCriticalLayerKvs,
                               CNmtErosionForEachLayerCriticalMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 0.1F;
};
class CNmtErosionForEachLayerCriticalKvs final
    : public LayerValuesKvs<CNmtErosionForEachLayerCriticalKvs, CNmtErosionForEachLayerCriticalLayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "CRITICAL_SHEARSTRESS_FOR_EROSION";
};

// How fast a layer erodes (g/m²/s), while it is described by one factor.
class CNmtErosionForEachLayerFactorMapKvs final
    : public AreaMapKvs<CNmtErosionForEachLayerFactorMapKvs, PageId::mtErosionForEachLayerFactor> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtErosionForEachLayerFactorLayerKvs final
    : public ConstantOrMapsKvs<CNmtErosionForEachLayerFactorLayerKvs, CNmtErosionForEachLayerFactorMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 0.05F;
};
class CNmtErosionForEachLayerFactorKvs final
    : public LayerValuesKvs<CNmtErosionForEachLayerFactorKvs, CNmtErosionForEachLayerFactorLayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "EROSION_COEFFICIENT_FACTOR";
};

// The first of two factors of the erosion.
class CNmtErosionForEachLayerFactor1MapKvs final
    : public AreaMapKvs<CNmtErosionForEachLayerFactor1MapKvs, PageId::mtErosionForEachLayerFactor1> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtErosionForEachLayerFactor1LayerKvs final
    : public ConstantOrMapsKvs<CNmtErosionForEachLayerFactor1LayerKvs, CNmtErosionForEachLayerFactor1MapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 33;
};
class CNmtErosionForEachLayerFactor1Kvs final
    : public LayerValuesKvs<CNmtErosionForEachLayerFactor1Kvs, CNmtErosionForEachLayerFactor1LayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "EROSION_COEFFICIENT_Factor1";
};

// The second of two factors of the erosion.
class CNmtErosionForEachLayerFactor2MapKvs final
    : public AreaMapKvs<CNmtErosionForEachLayerFactor2MapKvs, PageId::mtErosionForEachLayerFactor2> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtErosionForEachLayerFactor2LayerKvs final
    : public ConstantOrMapsKvs<CNmtErosionForEachLayerFactor2LayerKvs, CNmtErosionForEachLayerFactor2MapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = -0.2F;
};
class CNmtErosionForEachLayerFactor2Kvs final
    : public LayerValuesKvs<CNmtErosionForEachLayerFactor2Kvs, CNmtErosionForEachLayerFactor2LayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "EROSION_COEFFICIENT_FACTOR2";
};

// The power of the erosion of a dense layer, or the alpha of that of a soft one. It is given in one way for
// all layers.
class CNmtErosionForEachLayerPowerMapKvs final
    : public AreaMapKvs<CNmtErosionForEachLayerPowerMapKvs, PageId::mtErosionForEachLayerPower> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtErosionForEachLayerPowerLayerKvs final
    : public ConstantOrMapsKvs<CNmtErosionForEachLayerPowerLayerKvs, CNmtErosionForEachLayerPowerMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 1;
};
class CNmtErosionForEachLayerPowerKvs final
    : public LayerValuesKvs<CNmtErosionForEachLayerPowerKvs, CNmtErosionForEachLayerPowerLayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "ALPHA_OR_POWER";

  unsigned Validate(ValidationList& messages, int deep) override;
};

// The density of the dry sediment in a layer (g/m³).
class CNmtErosionForEachLayerDensityMapKvs final
    : public AreaMapKvs<CNmtErosionForEachLayerDensityMapKvs, PageId::mtErosionForEachLayerDensity> {
 public:
  using AreaMapKvs::AreaMapKvs;
};
class CNmtErosionForEachLayerDensityLayerKvs final
    : public ConstantOrMapsKvs<CNmtErosionForEachLayerDensityLayerKvs, CNmtErosionForEachLayerDensityMapKvs> {
 public:
  using ConstantOrMapsKvs::ConstantOrMapsKvs;

  static constexpr float kDefault = 150000;
};
class CNmtErosionForEachLayerDensityKvs final
    : public LayerValuesKvs<CNmtErosionForEachLayerDensityKvs, CNmtErosionForEachLayerDensityLayerKvs> {
 public:
  using LayerValuesKvs::LayerValuesKvs;

  static constexpr std::string_view kSection = "DENSITY_OF_BED_MATERIAL";
};

}  // namespace gridbay
