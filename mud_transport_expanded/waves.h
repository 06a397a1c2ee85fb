#pragma once

#include <cstdint>

#include "core/selections.h"
#include "core/table_kvs.h"

namespace gridbay {

class CVdFileSelectorDlg;

// Where the waves come from, and what they do.
class CNmtExpWavesKvs final : public TableKvs<CNmtExpWavesKvs> {
 public:
  enum Type : std::int32_t { kConstant = 1, kVarying = 2, kDatabase = 3 };

  using TableKvs::TableKvs;

  std::int32_t typeOfWaveVariation = kConstant;
  std::int32_t shearStressFormulation = 0;
  std::int32_t includeLiquefaction = 0;
  float liquefactionFactor = 1;
  float minimumDepth = 0;  // metres

  // 0 on file while there are no waves; the type is then kept here alone, and is 1 after a load.
  struct TypeRow {
    std::string_view name;

    void save(const CNmtExpWavesKvs& waves, KvsFile& file, const std::string&) const;
    void load(CNmtExpWavesKvs& waves, KvsSection from, const std::string&) const;
    void set(CNmtExpWavesKvs& waves, KvsSection from, const std::string&) const;
    void copy(CNmtExpWavesKvs& waves, const CNmtExpWavesKvs& other) const {
      waves.typeOfWaveVariation = other.typeOfWaveVariation;
    }
    static constexpr auto members() { return std::tuple(&CNmtExpWavesKvs::typeOfWaveVariation); }
  };

  static constexpr auto table() {
    using Self = CNmtExpWavesKvs;
    return keywords(
        TypeRow{"Type_of_Wave_variation"}, keyword("Shearstress_Formulation", &Self::shearStressFormulation),
        keyword("Include_Liquefaction", &Self::includeLiquefaction),
        writtenOnly("Do_Combined_Wave_Current_Shearstress_Calculations", [](const Self&) { return true; }),
        keyword("Liquefaction_factor", &Self::liquefactionFactor),
        keyword("Minimum_waterdepth_for_including_waves", &Self::minimumDepth));
  }
};

// One wave for the whole model and simulation.
class CNmtExpConstantWavesKvs final : public TableKvs<CNmtExpConstantWavesKvs> {
 public:
  using TableKvs::TableKvs;

  float height = 0.3F;  // metres
  float period = 3;     // seconds
  float direction = 0;  // degrees

  static constexpr auto table() {
    using Self = CNmtExpConstantWavesKvs;
    return section("Constant_Wave_Data", keyword("Constant_Wave_Height", &Self::height),
                   keyword("Constant_Wave_Period", &Self::period),
                   keyword("Constant_Wave_Direction", &Self::direction));
  }
};

// Waves from a data file.
class CNmtExpTSVWavesKvs final : public TableKvs<CNmtExpTSVWavesKvs> {
 public:
  using TableKvs::TableKvs;

  UTsbSelection file{1};

  static constexpr auto table() { return section("TWOD_Wavefields", selection(&CNmtExpTSVWavesKvs::file)); }

  // Finds no fault in the file.
  unsigned Validate(ValidationList& messages, int deep) override;
  // Maps of Area 1 that cover the simulation.
  void RequestDataFile(CVdFileSelectorDlg& selector);
};

// Requires of a file that its first items are maps of Area 1 of the height, the direction and the period of
// waves.
void requestWaveMaps(CVdFileSelectorDlg& selector, CKvsBase& object);

}  // namespace gridbay
