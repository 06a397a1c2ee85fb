#pragma once

#include <cstdint>

#include "core/list_kvs.h"

namespace gridbay {

// Whether a fraction is sand, and the velocity at which it then settles (m/s).
class CNmtExpSandFractionObjectKvs final : public TableKvs<CNmtExpSandFractionObjectKvs> {
 public:
  using TableKvs::TableKvs;

  std::int32_t isSand = 1;
  float meanFallVelocity = 0.001F;

  static constexpr auto table() {
    using Self = CNmtExpSandFractionObjectKvs;
    return keywords(offFile(&Self::isSand, &Self::meanFallVelocity));
  }
  void CopyFrom(const CKvsBase& other) override { AssignState(other); }
};

// Which of the fractions are sand.
class CNmtExpSandFractionsKvs final : public ListKvs<CNmtExpSandFractionsKvs, CNmtExpSandFractionObjectKvs> {
 public:
  using ListKvs::ListKvs;

  std::int32_t sandFractionDescription = 0;  // 1: there may be sand among the fractions

  bool hasSand() const { return sandFractionDescription == 1; }

  // The fractions have no sections: their keywords are numbered.
  struct FractionsRow : ListRow<OwnList> {
    void save(const CNmtExpSandFractionsKvs& fractions, KvsFile& file, const std::string&) const;
    void load(CNmtExpSandFractionsKvs& fractions, KvsSection from, const std::string&) const;
    bool access(CNmtExpSandFractionsKvs& fractions, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    return section("SAND_FRACTIONS",
                   keyword("Sand_Fraction_Description", &CNmtExpSandFractionsKvs::sandFractionDescription),
                   FractionsRow{});
  }
};

}  // namespace gridbay
