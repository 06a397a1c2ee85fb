#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "core/table_kvs.h"

namespace gridbay {

// What the module calculates: several fractions over a bed of one layer, or one fraction over several
// layers; and whether there is salinity too, for flocculation. It leads all that has an entry for each of
// these: first salinity, then the fractions, and in the task of layers the thickness of each layer.
class CNmtTaskSelectionKvs final : public TableKvs<CNmtTaskSelectionKvs> {
 public:
  // The limits of the page. The model has none; of a file a count is believed as far as the last one.
  static constexpr int kMostFractions = 8;
  static constexpr int kMostLayers = 12;
  static constexpr int kMostBelieved = 256;

  // What followers are told, by its place among the counts. One below 0 leaves them alone.
  enum Count : std::size_t {
    kEntries,      // all of them
    kTransported,  // salinity and fractions
    kOfFractions,  // the same, for those who follow in the task of fractions alone
    kLayers,
    kHead,  // 1: salinity comes in before all others; -1: it goes
    kNoOfCounts,
  };

  using TableKvs::TableKvs;

  bool multiFraction = true;  // else the task of layers
  std::int32_t fractions = 3;
  std::int32_t layers = 1;
  bool includeSalinity = false;

  struct TaskRow;
  static constexpr auto table();

  // Choose the task, with its count; that of the other task becomes 1. A negative one does nothing.
  void SetFractions(int n);
  void SetLayers(int n);
  // Salinity comes in, or goes, at the head of the lists.
  void SetSalinity(bool on);

  int TransportedCount() const { return fractions + (includeSalinity ? 1 : 0); }
  int EntryCount() const { return TransportedCount() + (multiFraction ? 0 : layers); }
  // Of entry `number`, from 1: its name, the item code of its values, and whether it is that of a layer.
  std::string EntryName(int number) const;
  int EntryQuantity(int number) const;
  bool IsThickness(int number) const { return !multiFraction && number > TransportedCount(); }
  bool IsSalinity(int number) const { return includeSalinity && number == 1; }
};

// The keywords: only those of the task count in a load, which tells the followers.
struct CNmtTaskSelectionKvs::TaskRow {
  void save(const CNmtTaskSelectionKvs& task, KvsFile& file, const std::string& documentPath) const;
  void load(CNmtTaskSelectionKvs& task, KvsSection from, const std::string& documentPath) const;
  void copy(CNmtTaskSelectionKvs& task, const CNmtTaskSelectionKvs& other) const;
  static constexpr auto members() {
    using Self = CNmtTaskSelectionKvs;
    return std::tuple(&Self::multiFraction, &Self::fractions, &Self::layers, &Self::includeSalinity);
  }
  bool access(CNmtTaskSelectionKvs& task, std::string_view path, PathAccess& access) const;
};

constexpr auto CNmtTaskSelectionKvs::table() {
  return section("TASK_SELECTION", TaskRow{});
}

}  // namespace gridbay
