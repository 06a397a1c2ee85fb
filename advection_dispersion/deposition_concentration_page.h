#pragma once

#include <string>

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/page_texts.h"
#include "advection_dispersion/transported.h"
#include "families/deposition_page.h"
#include "families/transport_page_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// A band for each component.
template <class Entry, auto list, auto include>
class NadDepositionGrid
    : public DepositionGrid<&AdvectionDispersionParts::nadDepositionConcentration, Entry, list, include> {
 protected:
  std::string BandTitle(int item) override {
    return formatted(texts::componentBand, AdComponents::name(this->GetKvs(), item));
  }
  int Quantity(int) override { return item::kDepositionRate; }
  Choices Formats() override {
    return Choices::lines("Constant value\r\nType 0 data file\r\nType 2 data file\r\n");
  }
  static bool isMap(std::int32_t format) { return format == CNadSurfaceDepositionObjectKvs::kMap; }
};

class CNadSurfaceDepositionGrid final
    : public NadDepositionGrid<CNadSurfaceDepositionComponentKvs, &CNadDepositionConcentrationKvs::surface,
                               &CNadDepositionConcentrationKvs::includeSurface> {
  FileKind KindOfFile(std::int32_t format) override;
};

class CNadSoilDepositionGrid final
    : public NadDepositionGrid<CNadSoilDepositionComponentKvs, &CNadDepositionConcentrationKvs::soil,
                               &CNadDepositionConcentrationKvs::includeSoil> {
  FileKind KindOfFile(std::int32_t format) override;
};

struct NadDepositionWords {
  static constexpr std::string_view kSurface = "Include surface deposition";
  static constexpr std::string_view kSoil = "Include soil deposition";
};

// What settles on the surface, and what comes from the soil.
class CNadDepositionConcentrationDlg final
    : public DepositionDlg<18722, PageId::adDepositionConcentration,
                           &AdvectionDispersionParts::nadDepositionConcentration, NadDepositionWords,
                           CNadSurfaceDepositionGrid, CNadSoilDepositionGrid> {
 public:
  explicit CNadDepositionConcentrationDlg(CVdDoc& document);
  ~CNadDepositionConcentrationDlg() override;
};

}  // namespace gridbay
