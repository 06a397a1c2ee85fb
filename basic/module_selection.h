#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// The module code, as every decision reads it; any other code stands for hydrodynamics only.
namespace module {
inline constexpr std::int32_t kHydrodynamic = 0;
inline constexpr std::int32_t kAdvectionDispersion = 2;
inline constexpr std::int32_t kMudTransport = 3;
inline constexpr std::int32_t kMudTransportExpanded = 8;
inline constexpr std::int32_t kEcological = 9;
inline constexpr std::int32_t kHydrodynamicToo = 11;
}  // namespace module

// The modules that run beside hydrodynamics, the scheme of advection-dispersion, and two switches. The
// Wetland Sweep Kit has hydrodynamics alone.
class CModuleSelectionKvs final : public TableKvs<CModuleSelectionKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t simulationType = module::kHydrodynamic;
  std::int32_t adScheme = 1;              // 1 QUICKEST, 5 ULTIMATE, -5 simple UPWIND, -1 2D UPWIND
  bool highPrecision = false;             // not on file
  std::int32_t hydrodynamicFeatures = 1;  // 0 for inland flooding

  static constexpr auto table() {
    return section(
        "MODULE_SELECTION",
        pinned(keyword("Simulation_Type", &CModuleSelectionKvs::simulationType), kPinnedType),
        pinned(keyword("AD_Scheme", &CModuleSelectionKvs::adScheme), kPinnedScheme),
        pinned(keyword("hydrodynamic_features", &CModuleSelectionKvs::hydrodynamicFeatures), kPinnedFeatures),
        offFile(&CModuleSelectionKvs::highPrecision));
  }

  void Load(KvsSection section, const std::string& documentPath) override;

  // Whether the scheme can keep account of the masses in polygons.
  bool schemeHasMassBudget() const { return adScheme == 1 || adScheme == -1; }

  // Whether the module is one of transport, with a scheme that has mass budgets.
  bool HasMassBudget() const {
    return (simulationType == module::kAdvectionDispersion ||
            simulationType == module::kMudTransportExpanded || simulationType == module::kEcological) &&
           schemeHasMassBudget();
  }

 private:
  static constexpr std::int32_t kPinnedType = module::kHydrodynamic;
  static constexpr std::int32_t kPinnedScheme = 1;
  static constexpr std::int32_t kPinnedFeatures = 0;
};

}  // namespace gridbay
