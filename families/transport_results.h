#pragma once

#include <cstdint>
#include <string>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "core/item_list.h"
#include "core/item_rows.h"
#include "core/table_kvs.h"
#include "families/result_hot_start.h"
#include "families/result_output.h"

// What a transport module writes: outputs, each of a part of an area and of the simulation, and a hot start
// file for each area. The modules differ in what they choose for an output, and in further keywords.

namespace gridbay {

// J, K and time steps from 0.
struct TransportOutput {
  std::int32_t areaNumber = 1;  // from 1
  USubArea part;
  USubLine steps;
  std::string title;
  UResultFileName file;
};

// The rows of its table.
constexpr auto transportOutputRows() {
  return keywords(subArea("X_Range_And_Interval", "Y_Range_And_Interval", &TransportOutput::part),
                  keyword("Area_no", &TransportOutput::areaNumber),
                  subLine("First_Time_Step", "Last_Time_Step", "Time_Step_Interval", &TransportOutput::steps),
                  keyword("Title", &TransportOutput::title), keyword("File_Name", &TransportOutput::file));
}

// The defaults of output `number`, from 1: the areas in turn, the whole area, the whole simulation.
void startTransportOutput(TransportOutput& output, CKvsBase& object, int number);
// The checks, in their order. Return the number of faults.
unsigned checkTransportOutput(ValidationList& messages, CKvsBase& object, PageId page,
                              const TransportOutput& output);
unsigned checkOutputCount(ValidationList& messages, PageId page, int count);
// Megabytes, for a number of values at each point and step.
double sizeOfTransportOutput(const TransportOutput& output, int values);

// An output of all that the module transports.
template <PageId page>
class TransportOutputKvs final : public TableKvs<TransportOutputKvs<page>>, public TransportOutput {
 public:
  using TableKvs<TransportOutputKvs>::TableKvs;

  static constexpr auto table() { return transportOutputRows(); }

  unsigned Validate(ValidationList& messages, int) override {
    return checkTransportOutput(messages, *this, page, *this);
  }
};

// `Self` has
//   its table, with the rows below
//   bool hydrodynamicHotStart()   whether the flow calculation writes hot start files: only then does this
//   int valuesAtPoint(const Output&)   that are written at each point and step
//   int itemsOfHotStart()   in the hot start file of an area
// An output may have a Rebuild() of its own, for what it chooses of the module's entries.
template <class Self, class Output, PageId page>
class TransportResultsKvs : public TableKvs<Self> {
 public:
  static constexpr int kMostOnPage = 18;

  explicit TransportResultsKvs(CKvsBase* parent)
      : TableKvs<Self>(parent), outputs(this, startOutput), hotStarts(this) {}

  bool generateHotStart = false;
  ItemList<Output> outputs;
  ItemList<ResultHotStartKvs<page>> hotStarts;  // one for each area

  // What is held of outputs goes first, also when there are none on file.
  void Load(KvsSection section, const std::string& documentPath) override {
    outputs.SetCount(0);
    TableKvs<Self>::Load(section, documentPath);
  }

  unsigned Validate(ValidationList& messages, int) override {
    const unsigned faults = checkOutputCount(messages, page, outputs.GetCount());
    return faults + ValidateItems(messages);
  }
  // Of the outputs, and of the hot start files where they are written.
  unsigned ValidateItems(ValidationList& messages) {
    unsigned faults = 0;
    for (int number = 1; number <= outputs.GetCount(); ++number)
      faults += checkedEntry(messages, {number, outputs.GetCount()},
                             [&] { return outputs.at(number).Validate(messages, 0); });
    for (int number = 1; generateHotStart && number <= hotStarts.GetCount(); ++number)
      faults += hotStarts.at(number).Validate(messages, 0);
    return faults;
  }

  // Follows the number of areas.
  void SetCount(int areas) { hotStarts.SetCount(areas); }

  // Megabytes of all outputs.
  float OutputSizeMB() {
    float sum = 0;
    for (int number = 1; number <= outputs.GetCount(); ++number) {
      const Output& output = outputs.at(number);
      sum = static_cast<float>(sum + sizeOfTransportOutput(output, self().valuesAtPoint(output)));
    }
    return sum;
  }
  // What the hot start files hold, where they are written: items at each point, and megabytes of all areas.
  int hotStartItems() { return generateHotStart ? self().itemsOfHotStart() : 0; }
  double HotStartSizeMB() {
    auto* basic = this->template parts<BasicParts>();
    return basic == nullptr ? 0 : basic->bathymetry->EstimateSizeMB(hotStartItems());
  }

 protected:
  // The rows of the table: the number of outputs, the outputs, the hot start files.
  static constexpr auto outputCountRow() {
    return count("Number_Of_Output_areas", &TransportResultsKvs::outputs);
  }
  static constexpr auto outputRows() { return items("OUTPUT_AREA_%d", &TransportResultsKvs::outputs); }
  static constexpr auto hotStartRows() {
    return keywords(HotStartFlagRow{{"Generate_Hotstart", &TransportResultsKvs::generateHotStart}},
                    section("HOTSTART_FILES", items("AREA_%d", &TransportResultsKvs::hotStarts)));
  }

 private:
  struct HotStartFlagRow : Keyword<TransportResultsKvs, bool> {
    void save(const TransportResultsKvs& object, KvsFile& file, const std::string& documentPath) const {
      auto& results = static_cast<Self&>(const_cast<TransportResultsKvs&>(object));  // to ask its model
      this->put(file, object.generateHotStart && results.hydrodynamicHotStart(), documentPath);
    }
    bool access(TransportResultsKvs& object, std::string_view path, PathAccess& access) const {
      return table_detail::accessRow(static_cast<const Keyword<TransportResultsKvs, bool>&>(*this), object,
                                     path, access);
    }
  };

  static void startOutput(CKvsBase& owner, Output& output, int number) {
    startTransportOutput(output, owner, number);
    if constexpr (requires { output.Rebuild(); }) output.Rebuild();
  }
  Self& self() { return static_cast<Self&>(*this); }
};

}  // namespace gridbay
