#pragma once

#include <string>

#include "ecology/deposition.h"
#include "ecology/ecology_parts.h"
#include "ecology/variable_headers.h"
#include "families/deposition_page.h"

namespace gridbay {

// A band for each transported variable; surface or soil by the list, its flag and the kind of its files.
template <auto list, auto include, const FileKind& kind>
class CWQSADDepositionGridDlg final
    : public DepositionGrid<&EcologyParts::wqsAdDeposition, CWQSADDepositionStateVariableKvs, list, include> {
  std::string BandTitle(int item) override {
    return formatted(texts::variableBand, WqsVariables::name(this->GetKvs(), item));
  }
  int Quantity(int number) override { return WqsVariables::quantity(this->GetKvs(), number); }
  std::string ValueTip(int number) override {
    return rangeTip(WqsVariables::declaration(this->GetKvs(), number), this->document().units());
  }
  bool HasUnits() override { return true; }
  std::string UnitOf(int number) override {
    return unitText(WqsVariables::declaration(this->GetKvs(), number), this->document().units());
  }
  Choices Formats() override { return Choices::lines("Constant value\r\nType 2 data file\r\n"); }
  FileKind KindOfFile(std::int32_t) override { return kind; }
};

struct WqsDepositionWords {
  static constexpr std::string_view kSurface = "Include Surface Deposition";
  static constexpr std::string_view kSoil = "Include Soil Deposition";
};

// What settles on the surface, and what comes from the soil.
class CWQSADDepositionDlg final
    : public DepositionDlg<
          18937, PageId::ecoDeposition, &EcologyParts::wqsAdDeposition, WqsDepositionWords,
          CWQSADDepositionGridDlg<&CWQSADDepositionKvs::surface, &CWQSADDepositionKvs::includeSurface,
                                  texts::wqsSurfaceDepositionFile>,
          CWQSADDepositionGridDlg<&CWQSADDepositionKvs::soil, &CWQSADDepositionKvs::includeSoil,
                                  texts::wqsSoilDepositionFile>> {
 public:
  explicit CWQSADDepositionDlg(CVdDoc& document);
  ~CWQSADDepositionDlg() override;
};

}  // namespace gridbay
