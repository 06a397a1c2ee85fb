#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// What acts on the sediment beside the flow.
class CNmtExpForcingsKvs final : public TableKvs<CNmtExpForcingsKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t includeWaves = 0;
  std::int32_t includeDredging = 0;

  // On file there are waves where they are of some type; the keyword is that of the waves, in whose section a
  // load looks for all of these.
  struct WavesRow {
    static constexpr std::string_view kType = "Type_of_Wave_variation";

    void save(const CNmtExpForcingsKvs&, KvsFile&, const std::string&) const {}
    void load(CNmtExpForcingsKvs& forcings, KvsSection from, const std::string&) const {
      std::int32_t type = forcings.includeWaves;
      kvsGetParam(from, kType, &type, 1, 1);
      forcings.includeWaves = type == 0 ? 0 : 1;
    }
    void copy(CNmtExpForcingsKvs& forcings, const CNmtExpForcingsKvs& other) const {
      forcings.includeWaves = other.includeWaves;
    }
    static constexpr auto members() { return std::tuple(&CNmtExpForcingsKvs::includeWaves); }
  };

  static constexpr auto table() {
    return keywords(WavesRow{}, keyword("Include_dredging", &CNmtExpForcingsKvs::includeDredging));
  }
};

}  // namespace gridbay
