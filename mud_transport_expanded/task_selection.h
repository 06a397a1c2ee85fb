#pragma once

#include <cstdint>

#include "core/table_kvs.h"

namespace gridbay {

// How many fractions and layers there are, and what is carried beside them. The counts lead all that has an
// entry for each of them.
class CNmtExpTaskSelectionKvs final : public TableKvs<CNmtExpTaskSelectionKvs> {
 public:
  static constexpr std::int32_t kMostOnPage = 8;
  // That are taken from a file; a model of so many is far beyond any use.
  static constexpr std::int32_t kMost = 100;

  using TableKvs::TableKvs;

  std::int32_t fractions = 1;
  std::int32_t layers = 1;
  bool includeSalinity = false;
  bool includeXenobiotics = false;

  // The counts and the salinity, which reach all lists. A count that is negative stays as it was.
  void SetCounts(std::int32_t newLayers, std::int32_t newFractions, bool salinity);
  // Salinity comes and goes at the head of the concentrations.
  void SetSalinity(bool on);

  // The keywords of what reaches other lists. A load takes all three before any of them acts; one that the
  // file lacks stays as it is.
  struct CountsRow {
    void save(const CNmtExpTaskSelectionKvs& task, KvsFile& file, const std::string&) const;
    void load(CNmtExpTaskSelectionKvs& task, KvsSection from, const std::string&) const;
    void copy(CNmtExpTaskSelectionKvs& task, const CNmtExpTaskSelectionKvs& other) const;
    static constexpr auto members() {
      using Task = CNmtExpTaskSelectionKvs;
      return std::tuple(&Task::layers, &Task::fractions, &Task::includeSalinity);
    }
    bool access(CNmtExpTaskSelectionKvs& task, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    return section("TASK_SELECTION", CountsRow{},
                   keyword("Include_xenobiotics", &CNmtExpTaskSelectionKvs::includeXenobiotics));
  }
};

}  // namespace gridbay
