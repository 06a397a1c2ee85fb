#include "hydrodynamic/wind_conditions_page.h"

#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/wind_conditions.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Wind = CWindConditionsKvs;

}  // namespace

void CWindConditionsDlg::DoDataExchange(Form& form) {
  const auto wind = objectOf(&HydrodynamicParts::windConditions);
  const auto isConstant = [wind] { return wind().dataFormat == Wind::kConstant; };
  const auto isVarying = [wind] { return wind().dataFormat == Wind::kVarying; };
  const auto isOn = [wind] { return wind().dataFormat != Wind::kNone; };
  const auto hasFriction = [wind, isOn](std::int32_t type) {
    return [wind, isOn, type] { return isOn() && wind().frictionType == type; };
  };
  Binding<std::int32_t> format = memberOf(wind, &Wind::dataFormat);
  format.set = [wind](std::int32_t chosen) { wind().SetDataFormat(chosen); };

  form.List("Wind type:",
            Choices::numbered(
                {"No Wind", "Constant in Time and Space", "Constant in Space", "Varying in Time and Space"}),
            format);
  form.Group("Wind", [&] {
    form.Number("Speed:", wind, &Wind::constantSpeed, item::kWindSpeed).EnabledIf(isConstant);
    form.Number("Direction:", wind, &Wind::constantDirection, item::kWindDirection).EnabledIf(isConstant);
    form.Number("Neutral pressure:", wind, &Wind::neutralPressure, item::kAirPressure).EnabledIf(isVarying);
    AddFile(form, "Data file:", windFile()).EnabledIf([wind] { return wind().hasFile(); });
    form.Check("Include air pressure correction", wind, &Wind::airPressureCorrection).EnabledIf(isVarying);
  });
  form.Group("Friction", [&] {
    form.List("Friction type:", Choices::numbered({"Constant", "Varying with Wind Speed"}), wind,
              &Wind::frictionType)
        .EnabledIf(isOn);
    form.Number("Constant:", wind, &Wind::constantFriction).EnabledIf(hasFriction(Wind::kConstantFriction));
    form.Group("Linear variation using:", [&] {
      const auto isLinear = hasFriction(Wind::kVaryingFriction);
      const auto pair = [&](float Wind::*speed, float Wind::*friction) {
        form.Number("Speed", wind, speed, item::kWindSpeed).EnabledIf(isLinear);
        form.Number("Friction", wind, friction).EnabledIf(isLinear).Beside();
      };
      pair(&Wind::speed1, &Wind::friction1);
      pair(&Wind::speed2, &Wind::friction2);
    });
  });
}

FileChoice CWindConditionsDlg::windFile() {
  const auto wind = objectOf(&HydrodynamicParts::windConditions);
  return fileOf([wind](GridRow) { return &wind(); }, &Wind::windFile,
                [wind](GridRow) {
                  return wind().dataFormat == Wind::kConstantInSpace ? texts::timeSeriesFile : texts::windMap;
                },
                [wind](CVdFileSelectorDlg& selector, GridRow) { wind().RequestFile(selector); });
}

}  // namespace gridbay
