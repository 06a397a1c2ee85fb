#pragma once

#include "ecology/output_choice.h"
#include "families/entry_flags.h"
#include "families/transport_results.h"

namespace gridbay {

// An output of chosen state variables and additional items.
class CWQSResultsItemKvs final : public TableKvs<CWQSResultsItemKvs>, public TransportOutput {
 public:
  using TableKvs::TableKvs;

  bool timeAveraged = false;
  EntryFlags stateVariables;   // in the order of the model definition, transported or not
  EntryFlags additionalItems;  // in the order of its output items

  static constexpr auto table() {
    using Self = CWQSResultsItemKvs;
    return keywords(
        keyword("Area_no", &TransportOutput::areaNumber),
        subArea("X_Range_And_Interval", "Y_Range_And_Interval", &TransportOutput::part),
        subLine("First_Time_Step", "Last_Time_Step", "Time_Step_Interval", &TransportOutput::steps),
        keyword("TimeAveragedOutput", &Self::timeAveraged), keyword("File_Name", &TransportOutput::file),
        keyword("Title", &TransportOutput::title), entryFlags("State_Variables", &Self::stateVariables),
        entryFlags("Additional_Items", &Self::additionalItems));
  }

  // As many flags as the model has variables and items, and none of them chosen.
  void Rebuild();
  // The number of faults; 0 for faults of the steps and of averages, which end the checks: their messages
  // stand all the same, and so do those before them.
  unsigned Validate(ValidationList& messages, int deep) override;
};

using CWQSResultsHotstartItemKvs = ResultHotStartKvs<PageId::ecoResults>;

// What the module writes.
class CWQSResultsKvs final
    : public TransportResultsKvs<CWQSResultsKvs, CWQSResultsItemKvs, PageId::ecoResults> {
 public:
  using TransportResultsKvs::TransportResultsKvs;

  static constexpr auto table() {
    return section("OUTPUT_SPECIFICATION", AdditionalOutputRow{}, outputCountRow(), outputRows(),
                   hotStartRows());
  }

  // Clears what each output has chosen, for another model.
  void Rebuild();
  unsigned Validate(ValidationList& messages, int deep) override {
    return deep == 0 ? 0 : ValidateItems(messages);
  }

  bool hydrodynamicHotStart();
  int valuesAtPoint(const CWQSResultsItemKvs& output) {
    return chosenCount(output.stateVariables) + chosenCount(output.additionalItems);
  }
  int itemsOfHotStart() { return stateVariableCount(*this); }

 private:
  // What the engine is told of the additional items. It is never read: the model definition holds.
  struct AdditionalOutputRow {
    void save(const CWQSResultsKvs& object, KvsFile& file, const std::string& documentPath) const;
    void load(CWQSResultsKvs&, KvsSection, const std::string&) const {}
    void copy(CWQSResultsKvs&, const CWQSResultsKvs&) const {}
    static constexpr auto members() { return std::tuple(); }
    bool access(CWQSResultsKvs& object, std::string_view path, PathAccess& access) const;
  };
};

}  // namespace gridbay
