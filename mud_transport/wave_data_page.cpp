#include "mud_transport/wave_data_page.h"

#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/page_texts.h"
#include "mud_transport/wave_data.h"
#include "platform/units/units.h"

namespace gridbay {

void CNmtWaveDataDlg::DoDataExchange(Form& form) {
  using Waves = CNmtWaveDataKvs;
  const auto waves = objectOf(&MudTransportParts::nmtWaveData);
  const auto areIncluded = [waves] { return waves().description != Waves::kExcluded; };
  const auto areConstant = [waves] { return waves().input == Waves::kConstant; };
  const auto areFromFile = [waves] { return waves().input == Waves::kFromFile; };
  form.Radio("Wave description",
             Choices{{Waves::kExcluded, "Waves not included"}, {Waves::kIncluded, "Waves included"}}, waves,
             &Waves::description);
  form.Radio("Wave input", Choices{{Waves::kConstant, "Constant waves"}, {Waves::kFromFile, "Wave fields"}},
             waves, &Waves::input)
      .EnabledIf(areIncluded);
  form.Group("Constant waves",
             [&] {
               form.Number("Significant wave height", waves, &Waves::significantHeight,
                           item::kSignificantWaveHeight);
               form.Number("Significant wave period", waves, &Waves::significantPeriod, item::kWavePeriod);
               form.Number("Angle with true north", waves, &Waves::angleWithTrueNorth, item::kWaveDirection);
             })
      .EnabledIf([areIncluded, areConstant] { return areIncluded() && areConstant(); });
  form.Group("Wave fields",
             [&] {
               form.Radio("Field", Choices::numbered({"Use interpolation in time", "Use database"}), waves,
                          &Waves::useDatabase);
               AddFile(form, "Data file",
                       fileOf([waves](GridRow) { return &waves(); }, &Waves::file, texts::waveFieldFile,
                              [waves](CVdFileSelectorDlg& selector, GridRow) {
                                waves().RequestDataFile(selector);
                              }));
             })
      .EnabledIf([areIncluded, areFromFile] { return areIncluded() && areFromFile(); });
  form.Number("Minimum water depth for including waves", waves, &Waves::minimumDepth, item::kFloodDepth)
      .EnabledIf(areIncluded);
  form.Group("Liquefaction",
             [&] {
               form.Check("Include liquefaction", waves, &Waves::includeLiquefaction);
               form.Number("Liquefaction factor", waves, &Waves::liquefactionFactor).EnabledIf([waves] {
                 return waves().includeLiquefaction != 0;
               });
             })
      .EnabledIf(areIncluded);
}

}  // namespace gridbay
