#include "advection_dispersion/component_page.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/starting_conditions.h"

namespace gridbay {
namespace {

using Component = CNadComponentObjectKvs;

// What the user has chosen for the mass budget goes by component, and no longer holds.
void forgetMassBudget(CVdDoc& document) {
  document.GetKvs().parts<AdvectionDispersionParts>()->nadMassBudget->ChooseFirstComponent();
  document.UnTouch(PageId::adMassBudget);
}

}  // namespace

void CNadComponentGrid::LayOut() {
  const auto component = RowsOf(&AdvectionDispersionParts::nadComponent);
  const auto isHot = [start = host().objectOf(&AdvectionDispersionParts::nadStartingConditions)](GridRow) {
    return start().hotStart;
  };
  // A type that is none of these shows as the last.
  const Choices types = Choices{
      {Component::kConservative, "Conservative"},
      {Component::kDecaying, "Decaying"},
      {Component::kHeatDissipating, "Heat dissipating"},
      {Component::kHeatExchange,
       "Heat Exchange"}}.Otherwise(3);
  Text("Component Name", 120, component, &Component::name).ReadOnlyIf(isHot);
  List("Type", 100, component, &Component::type, types).ReadOnlyIf(isHot);
}

void CNadComponentDlg::DoDataExchange(Form& form) {
  const auto start = objectOf(&AdvectionDispersionParts::nadStartingConditions);
  Binding<std::int32_t> count = countOf(objectOf(&AdvectionDispersionParts::nadComponent));
  count.set = [this, count](std::int32_t wanted) {
    if (count.get() == wanted) return;
    count.set(wanted);
    forgetMassBudget(document());
  };
  form.Count("Number of Components", count, CNadComponentKvs::kMostComponents).EnabledIf([start] {
    return !start().hotStart;
  });
  form.Grid("Components", grid_);
}

}  // namespace gridbay
