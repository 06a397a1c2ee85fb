#pragma once

#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/selections.h"
#include "families/area_list.h"
#include "hydrodynamic/texts.h"

namespace gridbay {

// The bed resistance of an area, as a number of Manning (m^⅓/s) or Chezy (m^½/s), and that of piers in it.
class CNhdResistanceObjectKvs final : public TableKvs<CNhdResistanceObjectKvs> {
 public:
  static constexpr std::int32_t kExcluded = 0;
  static constexpr std::int32_t kConstant = 1;
  static constexpr std::int32_t kDataFile = 2;

  using TableKvs::TableKvs;

  std::int32_t dataFormat = kConstant;
  float constantValue = 32.0F;
  bool includePier = false;
  UTsbSelection map{1};
  UTsbSelection pierFile{1};

  static constexpr auto table() {
    using Self = CNhdResistanceObjectKvs;
    return keywords(keyword("Data_Format", &Self::dataFormat),
                    keyword("Constant_Value", &Self::constantValue), selection(&Self::map, 1),
                    keyword("Include_Pier", &Self::includePier),
                    section("PIER", selection(&Self::pierFile, 1)));
  }

  // The copy belongs to the other's parent, and has the other's map for its pier file.
  void CopyFrom(const CKvsBase& other) override;
  // What the list's copy takes over: all values, each by its own.
  void copyWhole(const CNhdResistanceObjectKvs& other) { TableKvs::CopyFrom(other); }

  using TableKvs::Validate;
  // `number` from 1, here and below: that of the entry and of its area.
  unsigned Validate(ValidationList& messages, int deep, int number);
  void RequestMap(CVdFileSelectorDlg& selector, int number);
  void RequestPierFile(CVdFileSelectorDlg& selector, int number);
};

// Bed resistance in all areas; and sediment and waves, from which formulation 2 works out the resistance that
// waves induce. Lengths of waves in metres, grains in millimetres, directions in degrees, periods in seconds.
class CNhdResistanceKvs final : public AreaListKvs<CNhdResistanceKvs, CNhdResistanceObjectKvs> {
 public:
  static constexpr bool kChecksItemsAlways = true;

  enum Formulation : std::int32_t { kManning = 0, kChezy = 1, kWaveInduced = 2 };
  enum DiameterFormat : std::int32_t { kConstantGrain = 0, kGrainMap = 1, kVaryingGrain = 2 };
  enum WaveFormat : std::int32_t {
    kConstantWaves = 0,
    kWaveSeries = 1,
    kWaveMap = 2,
    kVaryingWaves = 3,
  };

  using AreaListKvs::AreaListKvs;

  std::int32_t formulation = kManning;
  std::int32_t diameterFormat = kConstantGrain;
  float constantGrainSize = 0.2F;
  float relativeDensity = 2.65F;
  std::int32_t typeOfRoughness = 0;
  std::int32_t waveHeightCorrection = 1;
  float waveHeightOverDepthLimit = 0.85F;
  std::int32_t updateFrequency = 1;  // in time steps
  UTsbSelection grainSizeMap{1};
  std::int32_t waveHeightKind = 0;
  std::int32_t wavePeriodKind = 0;
  std::int32_t waveFormat = kVaryingWaves;
  float constantWaveHeight = 1.0F;
  float constantWaveDirection = 180.0F;
  float constantWavePeriod = 3.0F;
  UTsbSelection waveFile{3};

  // On file a diameter format that is not 0 is one more: the values there are 0, 2 and 3.
  struct GrainFormatRow {
    std::string_view name;

    void save(const CNhdResistanceKvs& resistance, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdResistanceKvs& resistance, KvsSection from, const std::string& documentPath) const;
    void copy(CNhdResistanceKvs&, const CNhdResistanceKvs&) const {}
    static constexpr auto members() { return std::tuple(&CNhdResistanceKvs::diameterFormat); }
  };

  // The section of the waves stands beside that of the resistance, and is read without it too. Two of its
  // keywords end in a blank.
  static constexpr auto table() {
    using Self = CNhdResistanceKvs;
    return keywords(
        section("RESISTANCE", keyword("Formulation", &Self::formulation),
                items("AREA_%d", texts::resistanceSectionMissing),
                section("SEDIMENT_DATA", GrainFormatRow{"Grain_Format"},
                        notCopied(keyword("Constant_Grain_Size", &Self::constantGrainSize)),
                        notCopied(keyword("Relative_Density", &Self::relativeDensity)),
                        notCopied(selection(&Self::grainSizeMap, 1))),
                notCopied(keyword("Type_Of_Roughness", &Self::typeOfRoughness)),
                notCopied(keyword("Include_Wave_Height_Correction", &Self::waveHeightCorrection)),
                notCopied(keyword("Wave_Height_Over_Depth_Limit", &Self::waveHeightOverDepthLimit)),
                notCopied(keyword("Update_Frequency", &Self::updateFrequency))),
        notCopied(section("WAVES", keyword("Type_Of_Wave_Height ", &Self::waveHeightKind),
                          keyword("Type_Of_Wave_Period ", &Self::wavePeriodKind),
                          keyword("Wave_Format", &Self::waveFormat),
                          keyword("Constant_Wave_Height", &Self::constantWaveHeight),
                          keyword("Constant_Wave_Period", &Self::constantWavePeriod),
                          keyword("Constant_Wave_Direction", &Self::constantWaveDirection),
                          selection(&Self::waveFile, 3))));
  }

  unsigned Validate(ValidationList& messages, int deep) override;

  // What the files of waves and grain sizes must be; for a format without a file nothing.
  void RequestWaveFile(CVdFileSelectorDlg& selector);
  void RequestGrainSizeMap(CVdFileSelectorDlg& selector);
  bool hasWaveFile() const { return kWaveSeries <= waveFormat && waveFormat <= kVaryingWaves; }
  bool hasGrainSizeMap() const { return diameterFormat == kGrainMap || diameterFormat == kVaryingGrain; }
};

}  // namespace gridbay
