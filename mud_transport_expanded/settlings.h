#pragma once

#include <cstdint>
#include <tuple>

#include "core/table_kvs.h"

namespace gridbay {

// Whether grains flocculate, and whether a dense suspension hinders their settling. What stands on file is
// not what is read of it: hindered settling does not come back.
class CNmtExpSettlingsKvs final : public TableKvs<CNmtExpSettlingsKvs> {
 public:
  enum Formulation : std::int32_t { kWinterwerp = 0, kRichardsonZaki = 1 };

  using TableKvs::TableKvs;

  std::int32_t noFlocculation = 1;  // grains have a settling velocity that is constant
  std::int32_t hinderedSettling = 0;
  std::int32_t formulation = kRichardsonZaki;  // of hindered settling

  bool isConstant() const { return noFlocculation != 0; }

  // On file 1 for flocculation; 2, which says that and the second formulation, is only read.
  struct FlocculationRow {
    std::string_view name;

    void save(const CNmtExpSettlingsKvs& settlings, KvsFile& file, const std::string&) const;
    void load(CNmtExpSettlingsKvs& settlings, KvsSection from, const std::string&) const;
    void copy(CNmtExpSettlingsKvs& settlings, const CNmtExpSettlingsKvs& other) const;
    static constexpr auto members() { return std::tuple(&CNmtExpSettlingsKvs::noFlocculation); }
  };

  // On file 0 for none, else the number of the formulation, from 1. It is looked for by another name, under
  // which nothing is written.
  struct HinderedRow {
    std::string_view name;
    std::string_view nameToLoad;

    void save(const CNmtExpSettlingsKvs& settlings, KvsFile& file, const std::string&) const;
    void load(CNmtExpSettlingsKvs& settlings, KvsSection from, const std::string&) const;
    void set(CNmtExpSettlingsKvs& settlings, KvsSection from, const std::string&) const;
    void copy(CNmtExpSettlingsKvs& settlings, const CNmtExpSettlingsKvs& other) const;
    static constexpr auto members() {
      return std::tuple(&CNmtExpSettlingsKvs::hinderedSettling, &CNmtExpSettlingsKvs::formulation);
    }
  };

  static constexpr auto table() {
    return keywords(FlocculationRow{"Flocculation_Description"},
                    HinderedRow{"Hindered_Settling_Description", "Settling_Description"});
  }
};

}  // namespace gridbay
