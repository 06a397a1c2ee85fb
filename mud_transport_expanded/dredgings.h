#pragma once

#include <array>
#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/list_kvs.h"
#include "core/selections.h"

namespace gridbay {

// A dredger: where it works and how much it takes up and spills, by a time series, and how what it spills is
// shared out among the fractions.
class CNmtExpDredgingItemKvs final : public TableKvs<CNmtExpDredgingItemKvs> {
 public:
  static constexpr int kMostFractions = 8;
  static constexpr int kItems = 4;

  using TableKvs::TableKvs;

  std::array<float, kMostFractions> weights{};  // by fraction
  std::string coordinateType;                   // the projection of its coordinates
  UTsbSelection file{kItems};                   // X, Y, mass rate and spill
  std::int32_t nesting = 0;                     // the area that it works in, from 1

  // A numbered keyword for the weight of each fraction that the model has.
  struct WeightsRow {
    void save(const CNmtExpDredgingItemKvs& dredger, KvsFile& file, const std::string&) const;
    void load(CNmtExpDredgingItemKvs& dredger, KvsSection from, const std::string&) const;
    void copy(CNmtExpDredgingItemKvs& dredger, const CNmtExpDredgingItemKvs& other) const;
    static constexpr auto members() { return std::tuple(&CNmtExpDredgingItemKvs::weights); }
    bool access(CNmtExpDredgingItemKvs& dredger, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    using Self = CNmtExpDredgingItemKvs;
    return keywords(WeightsRow{}, keyword("coordinate_type", &Self::coordinateType),
                    selection(&Self::file, kItems), keyword("Nesting_for_dredging", &Self::nesting));
  }

  void Load(KvsSection section, const std::string& documentPath) override;

  // How many weights count: one for each fraction, as far as there are so many.
  int WeightCount();
  // Equal weights, the projection of the model and its innermost area.
  void SetDefaults();

  unsigned Validate(ValidationList& messages, int deep) override;
  // Completes the choice of items first: fewer than all is none.
  void RequestDataFile(CVdFileSelectorDlg& selector, int number);

 private:
  void completeItems();
};

// All dredgers that work.
class CNmtExpDredgingsKvs final : public ListKvs<CNmtExpDredgingsKvs, CNmtExpDredgingItemKvs> {
 public:
  using ListKvs::ListKvs;

  bool updateBed = false;  // what they take up is missing from the bed

  static constexpr auto table() {
    return keywords(count("Number_of_active_dredgers"),
                    keyword("Update_bed", &CNmtExpDredgingsKvs::updateBed), items("Dredger_Nr_%d"));
  }
  static void initialise(CNmtExpDredgingItemKvs& dredger, int) { dredger.SetDefaults(); }
};

}  // namespace gridbay
