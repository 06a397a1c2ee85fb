#pragma once

#include "families/mass_budget.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

// The masses in a polygon: of what is carried, and of all sediment in the water, on the bed and together.
struct NmtExpMassFile : MassFile {
  enum Variable : std::size_t { kSuspended, kBed, kTotal, kNoOfVariables };

  NmtExpMassFile() { variables.assign(kNoOfVariables, 0); }

  // The keyword of one of them.
  struct VariableRow {
    std::string_view name;
    std::size_t place;

    void save(const MassFile& file, KvsFile& out, const std::string&) const {
      kvsPutParam(out, name, file.variables[place] != 0);
    }
    void load(MassFile& file, KvsSection from, const std::string&) const {
      bool isChosen = file.variables[place] != 0;
      kvsGetParam(from, name, &isChosen, 1, 1);
      file.variables[place] = isChosen ? 1 : 0;
    }
    void copy(MassFile& file, const MassFile& other) const { file.variables[place] = other.variables[place]; }
    static constexpr auto members() { return std::tuple(&MassFile::variables); }
  };
};

struct NmtExpMassBudget {
  using Item = NmtExpMassFile;
  using VariableRow = NmtExpMassFile::VariableRow;

  static constexpr PageId kPage = PageId::mtExpMassBudget;
  static constexpr std::string_view kCount = "NoOfMassFiles";
  static constexpr auto entryRows() {
    return keywords(
        section("SIMPLE_COMPONENTS",
                countThenNumbers("NoOfSimpleComponents", "ComponentNumbers", &MassFile::entries)),
        writtenOnly(
            "TotalNoOfComponentsAndVariables",
            [](const MassFile& file) { return chosenCount(file.entries) + chosenCount(file.variables); }),
        section("BULK_VARIABLES", VariableRow{"Total_Suspended_Mass", Item::kSuspended},
                VariableRow{"Total_Bed_Mass", Item::kBed}, VariableRow{"Total_Mass", Item::kTotal}));
  }
  static std::vector<std::string> entryNames(CKvsBase& object) { return expandedEntryNames(object); }
  static std::vector<std::string> variableNames() {
    return {"Total suspended mass", "Total bed mass", "Total mass"};
  }
};

// The masses in a polygon, and all such files. They do not follow the counts.
using CNmtExpMassBudgetItemKvs = MassFileKvs<NmtExpMassBudget>;
class CNmtExpMassBudgetKvs final : public MassFilesKvs<NmtExpMassBudget> {
  using MassFilesKvs::MassFilesKvs;
};

}  // namespace gridbay
