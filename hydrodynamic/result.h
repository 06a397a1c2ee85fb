#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "core/item_list.h"
#include "core/item_rows.h"
#include "core/table_kvs.h"
#include "families/result_hot_start.h"

namespace gridbay {

// One output: a map, a profile or time series at points, written by the engine while it runs. Points are J
// and K of Area 1, time steps count from 0.
class CNhdResultObjectKvs final : public TableKvs<CNhdResultObjectKvs> {
 public:
  static constexpr std::int32_t kPoints = 0;
  static constexpr std::int32_t kLine = 1;
  static constexpr std::int32_t kMap = 2;
  static constexpr std::int32_t kAreaNumber = 1;  // all outputs are of the outermost area

  // What can be written beside what every flow model has.
  enum ItemNumber : std::int32_t { kManningNumber = 14, kSaturation = 15, kInfiltratedVolume = 16 };

  using TableKvs::TableKvs;

  std::int32_t type = kMap;
  USubArea part;
  std::vector<double> pointsJ{0};  // of type 0; as many as both lists have are points
  std::vector<double> pointsK{0};
  USubLine steps;
  std::vector<std::int32_t> items{1, 2, 3};
  std::string title;
  UResultFileName file;

  // The type, and then the points or the ranges that go with it. A file of before there were types has ranges
  // alone, from which the type is told.
  struct TypeRow {
    void save(const CNhdResultObjectKvs& output, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdResultObjectKvs& output, KvsSection from, const std::string& documentPath) const;
    void copy(CNhdResultObjectKvs& output, const CNhdResultObjectKvs& other) const;
    static constexpr auto members() {
      using Self = CNhdResultObjectKvs;
      return std::tuple(&Self::type, &Self::part, &Self::pointsJ, &Self::pointsK);
    }
    bool access(CNhdResultObjectKvs& output, std::string_view path, PathAccess& access) const;
  };
  // How many items there are, and their numbers. The count decides how many are read.
  struct ItemNumbersRow {
    std::string_view count;
    std::string_view numbers;

    void save(const CNhdResultObjectKvs& output, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdResultObjectKvs& output, KvsSection from, const std::string& documentPath) const;
    void copy(CNhdResultObjectKvs& output, const CNhdResultObjectKvs& other) const {
      output.items = other.items;
    }
    static constexpr auto members() { return std::tuple(&CNhdResultObjectKvs::items); }
    bool access(CNhdResultObjectKvs& output, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    using Self = CNhdResultObjectKvs;
    return keywords(TypeRow{}, writtenOnly("Area_no", [](const Self&) { return kAreaNumber; }),
                    subLine("First_Time_Step", "Last_Time_Step", "Time_Step_interval", &Self::steps),
                    ItemNumbersRow{"Output_item", "ITEM_NUMBERS"}, keyword("Title", &Self::title),
                    keyword("File_Name", &Self::file));
  }

  // Leaves out of the items those that the engine can't write as the model is; throws std::invalid_argument
  // where the list can't be saved, and is then without the item that was in its way.
  void Save(KvsFile& out, const std::string& documentPath) override;
  unsigned Validate(ValidationList& messages, int deep) override;

  int PointCount() const;
  ResultLimits Limits() { return resultLimits(*this, kAreaNumber); }
  // All of Area 1 and of the simulation.
  void TakeWhole() { takeWhole(Limits(), part, steps); }

 private:
  void leaveOutItems();
};

using CNhdHotStartObjectKvs = ResultHotStartKvs<PageId::hdResult>;

// What the flow calculation writes: outputs, a hot start file for each area, and inundation statistics.
class CNhdResultKvs final : public TableKvs<CNhdResultKvs> {
 public:
  static constexpr int kMostOutputs = 18;  // that the page offers

  explicit CNhdResultKvs(CKvsBase* parent);

  bool generateHotStart = false;
  bool includeInundationStatistics = false;
  bool durationAboveThreshold = false;
  std::int32_t inundationStoreStep = 0;  // time steps
  float thresholdHeight = 0;             // metres
  UResultFileName inundationFile;
  ItemList<CNhdResultObjectKvs> outputs;
  ItemList<CNhdHotStartObjectKvs> hotStarts;  // one for each area

  static constexpr auto table() {
    using Self = CNhdResultKvs;
    return section("OUTPUT_SPECIFICATION", count("Number_Of_Output_areas", &Self::outputs),
                   items("OUTPUT_AREA_%d", &Self::outputs),
                   keyword("Generate_Hotstart", &Self::generateHotStart),
                   section("HOTSTART_FILES", items("AREA_%d", &Self::hotStarts)),
                   section("INUNDATION_STATISTICS",
                           keyword("IncludeInundationStatistics", &Self::includeInundationStatistics),
                           keyword("InundationFileName", &Self::inundationFile),
                           keyword("InundationFileStoreStep", &Self::inundationStoreStep),
                           keyword("DurationAboveThreshold", &Self::durationAboveThreshold),
                           keyword("ThresholdHeight", &Self::thresholdHeight)));
  }

  // What is held of outputs goes first, also when there are none on file.
  void Load(KvsSection section, const std::string& documentPath) override;
  unsigned Validate(ValidationList& messages, int deep) override;

  // Follows the number of areas.
  void SetCount(int areas) { hotStarts.SetCount(areas); }

  // Megabytes of 1048576 bytes: of all outputs; of the hot start files, where they are written; and of both
  // with what the module beside hydrodynamics writes.
  double OutputSizeMB();
  double HotStartSizeMB();
  double TotalSizeMB();

 private:
  int hotStartItems();
};

}  // namespace gridbay
