#include "hydrodynamic/eddy_viscosity_page.h"

#include "basic/page_texts.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Entry = CNhdEddyViscosityObjectKvs;
using Viscosity = CNhdEddyViscosityKvs;

}  // namespace

void CNhdEddyViscosityConstGrid::LayOut() {
  const auto entry = RowsOf(&HydrodynamicParts::nhdEddyViscosity);
  Number("Viscosity", 120, entry, &Entry::constantValue, item::kEddyViscosity)
      .Look([this](GridRow, CellStyle& style) {
        style.isGrey = parts<HydrodynamicParts>().nhdEddyViscosity->dataFormat == Viscosity::kNone;
      });
}

void CNhdEddyViscosityFromFileGrid::LayOut() {
  const auto entry = RowsOf(&HydrodynamicParts::nhdEddyViscosity);
  File({.file = fileOf(entry, &Entry::map, texts::eddyViscosityMap, &Entry::RequestMap),
        .header = "Data File",
        .browse = "..."});
}

void CNhdEddyViscositySmagorinskyGrid::LayOut() {
  const auto entry = RowsOf(&HydrodynamicParts::nhdEddyViscosity);
  Number("Smagorinsky Constants", 150, entry, &Entry::smagorinskyConstant);
}

void CNhdEddyViscosityDlg::DoDataExchange(Form& form) {
  const auto viscosity = objectOf(&HydrodynamicParts::nhdEddyViscosity);
  const auto is = [viscosity](std::int32_t format) {
    return [viscosity, format] { return viscosity().dataFormat == format; };
  };
  const auto isOn = [viscosity] { return viscosity().dataFormat != Viscosity::kNone; };
  form.List("Given as",
            Choices::numbered({"No Viscosity", "Constant Value", "From File", "Smagorinsky Formula"}),
            viscosity, &Viscosity::dataFormat);
  form.List("Type of Formulation", Choices::numbered({"Flux based", "Velocity based"}), viscosity,
            &Viscosity::formulation)
      .EnabledIf(isOn);
  form.Grid("Viscosity", constants_).EnabledIf(isOn).VisibleIf([viscosity] {
    return viscosity().dataFormat != Viscosity::kFromFile &&
           viscosity().dataFormat != Viscosity::kSmagorinsky;
  });
  form.Grid("Data files", files_).VisibleIf(is(Viscosity::kFromFile));
  form.Grid("Smagorinsky constants", smagorinsky_).VisibleIf(is(Viscosity::kSmagorinsky));
}

}  // namespace gridbay
