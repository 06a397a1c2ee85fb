#pragma once

#include <cstdint>
#include <tuple>

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"

namespace gridbay {

// The rate at which mud goes from a layer of the bed into the one below it, in an area.
class CNmtExpTransitionObjectKvs final : public ValueOrMapKvs<CNmtExpTransitionObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpTransition;
  static constexpr Text kDescription = texts::bed::transition;
  static constexpr int kQuantity = 0;
};

// Of a layer in each area.
class CNmtExpTransitionComponentKvs final
    : public AreaValuesKvs<CNmtExpTransitionComponentKvs, CNmtExpTransitionObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;
};

// Of all layers but the last, which has none below it.
class CNmtExpTransitionKvs final : public EntryAreasKvs<CNmtExpTransitionKvs, CNmtExpTransitionComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  std::int32_t isExcluded = 1;

  // On file it says whether there is transition.
  struct InclusionRow {
    std::string_view name;

    void save(const CNmtExpTransitionKvs& transition, KvsFile& file, const std::string&) const {
      kvsPutParam(file, name, transition.isExcluded == 0 ? 1 : 0);
    }
    void load(CNmtExpTransitionKvs& transition, KvsSection from, const std::string&) const {
      std::int32_t isIncluded = transition.isExcluded == 0 ? 1 : 0;
      kvsGetParam(from, name, &isIncluded, 1, 1);
      transition.isExcluded = isIncluded == 0 ? 1 : 0;
    }
    void copy(CNmtExpTransitionKvs& transition, const CNmtExpTransitionKvs& other) const {
      transition.isExcluded = other.isExcluded;
    }
    static constexpr auto members() { return std::tuple(&CNmtExpTransitionKvs::isExcluded); }
  };

  static constexpr auto table() {
    return section("TRANSITION_OF_MUD_BETWEEN_LAYERS",
                   InclusionRow{"Include_transition_of_mud_within_layers"}, items("Layer_%d"));
  }
  static float newValue(int) { return 1; }
};

}  // namespace gridbay
