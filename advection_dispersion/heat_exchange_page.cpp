#include "advection_dispersion/heat_exchange_page.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/heat_exchange.h"
#include "advection_dispersion/page_texts.h"
#include "platform/units/units.h"

namespace gridbay {

void CNadHeatExchangeDlg::DoDataExchange(Form& form) {
  using Heat = CNadHeatExchangeKvs;
  const auto heat = objectOf(&AdvectionDispersionParts::nadHeatExchange);
  const auto inPercent = [&form, heat](std::int32_t Heat::*share) -> Control& {
    Control& edit = form.Number("Constant Value", heat, share);
    edit.unit = "[%]";
    return edit;
  };
  // The type, the constant that `addConstant` gives, and the file.
  const auto input = [&](const char* caption, const Choices& types, std::int32_t Heat::*format,
                         const auto& addConstant, const FileChoice& file) {
    const auto isConstant = [heat, format] { return heat().*format == Heat::kConstant; };
    form.Group(caption, [&] {
      form.List("Type", types, heat, format);
      addConstant().EnabledIf(isConstant);
      AddFile(form, "File", file).EnabledIf([isConstant] { return !isConstant(); });
    });
  };
  const auto fileAt = [heat](UTsbSelection Heat::*file, ByRow<FileKind> kind,
                             void (Heat::*request)(CVdFileSelectorDlg&)) {
    const auto object = [heat](GridRow) -> Heat& { return heat(); };
    return fileOf(object, file, std::move(kind),
                  [heat, request](CVdFileSelectorDlg& selector, GridRow) { (heat().*request)(selector); });
  };
  const Choices series{{Heat::kConstant, "Constant"}, {Heat::kType0File, "Type 0 data"}};
  Choices seriesOrMaps = series;
  seriesOrMaps.Add({Heat::kType2File, "Type 2 data"});
  const auto airKind = [heat](GridRow) {
    return heat().airFormat == Heat::kType0File ? texts::airSeriesFile : texts::airMapFile;
  };

  form.Radio(
      "Integration method",
      Choices{{1, "1st order Euler"}, {2, "2nd order Runge-Kutta"}, {4, "4th order Runge-Kutta"}}.Otherwise(
          0),
      heat, &Heat::integrationOrder);
  form.Check("Evaporation/precipitation temperature from latent heat flux", heat,
             &Heat::latentHeatTemperature);
  form.Number("Sun constant, a in Ångstrøm's law:", heat, &Heat::angstromA);
  form.Number("Sun constant, b in Ångstrøm's law:", heat, &Heat::angstromB);
  form.Number("Constant in Dalton's law:", heat, &Heat::daltonA);
  form.Number("Wind coefficient in Dalton's law:", heat, &Heat::daltonB);
  form.Number("Standard meridian for time zone:", heat, &Heat::standardMeridian);
  form.Number("Displacement (summer time):", heat, &Heat::displacementHours);
  input(
      "Air temperature", seriesOrMaps, &Heat::airFormat,
      [&]() -> Control& { return form.Number("Value", heat, &Heat::airTemperature, item::kTemperature); },
      fileAt(&Heat::airFile, airKind, &Heat::RequestAirFile));
  input(
      "Relative humidity", series, &Heat::humidityFormat,
      [&]() -> Control& { return inPercent(&Heat::relativeHumidity); },
      fileAt(&Heat::humidityFile, texts::humidityFile, &Heat::RequestHumidityFile));
  input(
      "Clearness coefficient", series, &Heat::clearnessFormat,
      [&]() -> Control& { return inPercent(&Heat::clearness); },
      fileAt(&Heat::clearnessFile, texts::clearnessFile, &Heat::RequestClearnessFile));
}

}  // namespace gridbay
