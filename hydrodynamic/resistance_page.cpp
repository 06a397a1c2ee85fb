#include "hydrodynamic/resistance_page.h"

#include "basic/page_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/resistance.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Entry = CNhdResistanceObjectKvs;
using Resistance = CNhdResistanceKvs;

// The number with its own unit: it is typed and shown as it stands on file, whatever units are chosen.
std::string resistanceTip(const Resistance& resistance) {
  const UnitChoices metric;
  const bool isManning = resistance.formulation == Resistance::kManning;
  return CVdEditStyle(metric)
      .SetQunUnitBaseGroup(isManning ? item::kManningNumber : item::kChezyNumber)
      .GetQunToolTipText();
}

}  // namespace

void CNhdResistanceGrid::LayOut() {
  const auto entry = RowsOf(&HydrodynamicParts::nhdResistance);
  const auto has = [entry](std::int32_t format) {
    return [entry, format](GridRow row) { return entry(row)->dataFormat == format; };
  };
  const auto hasPier = [entry](GridRow row) { return entry(row)->includePier; };
  ValueOrFileColumns(entry,
                     ValueOrFile<Entry>{.formatHeader = "Format",
                                        .formatWidth = 90,
                                        .format = &Entry::dataFormat,
                                        .formats = Choices::lines("Excluded\r\nConstant\r\nData file\r\n"),
                                        .valueHeader = "Constant",
                                        .valueWidth = 75,
                                        .value = &Entry::constantValue,
                                        .quantity = 0,
                                        .takesValue = has(Entry::kConstant),
                                        .file = {.file = fileOf(entry, &Entry::map, texts::resistanceMap,
                                                                &Entry::RequestMap),
                                                 .header = "Filename",
                                                 .width = 160,
                                                 .browse = texts::browse.format,
                                                 .enabled = has(Entry::kDataFile)}})
      .Tip([this](GridRow) { return resistanceTip(*parts<HydrodynamicParts>().nhdResistance); });
  Check("Pier res.", 60, entry, &Entry::includePier);
  File({.file = fileOf(entry, &Entry::pierFile, texts::pierResistanceFile, &Entry::RequestPierFile),
        .header = "Filename",
        .width = 160,
        .browse = texts::browse.format,
        .enabled = hasPier});
}

void CNhdResistanceDlg::DoDataExchange(Form& form) {
  const auto resistance = objectOf(&HydrodynamicParts::nhdResistance);
  const auto isWaveInduced = [resistance] { return resistance().formulation == Resistance::kWaveInduced; };
  const auto isConstant = [resistance] { return resistance().diameterFormat == Resistance::kConstantGrain; };
  form.List("Resistance type:", Choices::numbered({"Manning number", "Chezy numbers"}), resistance,
            &Resistance::formulation);
  form.Grid("Resistance", grid_);
  form.Group("Sediment",
             [&] {
               form.List("Diameter format:",
                         Choices::numbered({"Constant", "Constant in Time, Varying in Space",
                                            "Varying in Time and Space "}),
                         resistance, &Resistance::diameterFormat);
               form.Number("Effective diameter:", resistance, &Resistance::constantGrainSize,
                           item::kSedimentGrainDiameter)
                   .EnabledIf(isConstant);
               AddFile(form, "Data file:", grainSizeMap()).EnabledIf([isConstant] { return !isConstant(); });
               form.Number("Relative density:", resistance, &Resistance::relativeDensity);
             })
      .VisibleIf(isWaveInduced);
  form.Group("Wave induced bed resistance parameters",
             [&] {
               form.List("Type of roughness:", Choices::numbered({"Parameterized", "Non-Parameterized"}),
                         resistance, &Resistance::typeOfRoughness);
               form.Check("Include wave height correction", resistance, &Resistance::waveHeightCorrection);
               form.Number("Wave height/depth limit:", resistance, &Resistance::waveHeightOverDepthLimit,
                           item::kWaveHeightOverDepth)
                   .EnabledIf([resistance] { return resistance().waveHeightCorrection != 0; });
               form.Number("Update frequency:", resistance, &Resistance::updateFrequency,
                           item::kNumberOfSteps);
             })
      .VisibleIf(isWaveInduced);
}

FileChoice CNhdResistanceDlg::grainSizeMap() {
  const auto resistance = objectOf(&HydrodynamicParts::nhdResistance);
  return fileOf(
      [resistance](GridRow) { return &resistance(); }, &Resistance::grainSizeMap, texts::grainDiameterMap,
      [resistance](CVdFileSelectorDlg& selector, GridRow) { resistance().RequestGrainSizeMap(selector); });
}

void CNhdResistanceWaveDlg::DoDataExchange(Form& form) {
  const auto resistance = objectOf(&HydrodynamicParts::nhdResistance);
  const auto isConstant = [resistance] { return resistance().waveFormat == Resistance::kConstantWaves; };
  form.Group("Wave field", [&] {
    form.Radio("Type of wave height:", Choices::numbered({"Significant wave height", "RMS wave height"}),
               resistance, &Resistance::waveHeightKind);
    form.Radio("Type of wave period:", Choices::numbered({"Peak wave period", "Mean wave period"}),
               resistance, &Resistance::wavePeriodKind);
    form.List("Wave format:",
              Choices::numbered({"Constant in Time and Space", "Varying in Time,Constant in Space",
                                 "Constant in Time,Varying in Space", "Varying in Time and Space"}),
              resistance, &Resistance::waveFormat);
    form.Number("Wave height:", resistance, &Resistance::constantWaveHeight, item::kWaveHeight)
        .EnabledIf(isConstant);
    form.Number("Wave direction:", resistance, &Resistance::constantWaveDirection, item::kWaveDirection)
        .EnabledIf(isConstant);
    form.Number("Wave period:", resistance, &Resistance::constantWavePeriod, item::kWavePeriod)
        .EnabledIf(isConstant);
    AddFile(form, "Data file:", waveFile()).EnabledIf([resistance] { return resistance().hasWaveFile(); });
  });
}

FileChoice CNhdResistanceWaveDlg::waveFile() {
  const auto resistance = objectOf(&HydrodynamicParts::nhdResistance);
  return fileOf(
      [resistance](GridRow) { return &resistance(); }, &Resistance::waveFile,
      [resistance](GridRow) {
        return resistance().waveFormat == Resistance::kWaveSeries ? texts::timeSeriesFile : texts::waveMap;
      },
      [resistance](CVdFileSelectorDlg& selector, GridRow) { resistance().RequestWaveFile(selector); });
}

}  // namespace gridbay
