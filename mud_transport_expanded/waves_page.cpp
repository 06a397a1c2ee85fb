#include "mud_transport_expanded/waves_page.h"

#include "core/file_selector.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/page_texts.h"
#include "mud_transport_expanded/waves.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtExpWavesDlg::DoDataExchange(Form& form) {
  using Waves = CNmtExpWavesKvs;
  const auto waves = objectOf(&MudTransportExpandedParts::nmtExpWaves);
  form.Radio("Type",
             Choices{{Waves::kConstant, "Use constant waves"},
                     {Waves::kVarying, "Use time and space varying waves"},
                     {Waves::kDatabase, "Use wave database"}},
             waves, &Waves::typeOfWaveVariation);
  form.Check("Include liquefaction", waves, &Waves::includeLiquefaction);
  form.Number("Liquefaction factor", waves, &Waves::liquefactionFactor).EnabledIf([waves] {
    return waves().includeLiquefaction != 0;
  });
  form.Number("Minimum water depth for including waves", waves, &Waves::minimumDepth, item::kFloodDepth);
}

void CNmtExpConstantWavesDlg::DoDataExchange(Form& form) {
  using Waves = CNmtExpConstantWavesKvs;
  const auto waves = objectOf(&MudTransportExpandedParts::nmtExpConstantWaves);
  form.Number("Wave height:", waves, &Waves::height, item::kWaveHeight);
  form.Number("Wave period:", waves, &Waves::period, item::kWavePeriod);
  form.Number("Wave direction:", waves, &Waves::direction, item::kMeanWaveDirection);
}

void CNmtExpTSVWaves::DoDataExchange(Form& form) {
  const auto waves = objectOf(&MudTransportExpandedParts::nmtExpTsvWaves);
  AddFile(form, "Data file:",
          fileOf([waves](GridRow) { return &waves(); }, &CNmtExpTSVWavesKvs::file, texts::waveMapFile,
                 [waves](CVdFileSelectorDlg& selector, GridRow) { waves().RequestDataFile(selector); }));
}

}  // namespace gridbay
