#include "mud_transport_expanded/initial_conditions_page.h"

#include <numeric>

#include "families/transport_page_texts.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/transported.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

CNmtExpInitialConditionsKvs& initial(CKvsBase& model) {
  return *model.parts<MudTransportExpandedParts>()->nmtExpInitialConditions;
}

Choices formats() {
  return Choices::lines("Constant value\r\nType 2 data file\r\n");
}

}  // namespace

int CNmtExpInitialConcentrationsGrid::EntryCount() {
  return initial(GetKvs()).components.GetCount();
}
CNmtExpInitialComponentKvs* CNmtExpInitialConcentrationsGrid::EntryAt(int number) {
  return initial(GetKvs()).components.GetItem(number);
}
std::string CNmtExpInitialConcentrationsGrid::BandTitle(int item) {
  return formatted(texts::componentBand, ExpandedMudEntries::name(GetKvs(), item));
}
int CNmtExpInitialConcentrationsGrid::Quantity(int number) {
  return ExpandedMudEntries::quantity(GetKvs(), number);
}
Choices CNmtExpInitialConcentrationsGrid::Formats() {
  return formats();
}
FileKind CNmtExpInitialConcentrationsGrid::KindOfFile(std::int32_t) {
  return texts::initialConditionFile;
}

int CNmtExpInitialBedThicknessGrid::EntryCount() {
  return initial(GetKvs()).thicknesses.GetCount();
}
CNmtExpInitialThicknessKvs* CNmtExpInitialBedThicknessGrid::EntryAt(int number) {
  return initial(GetKvs()).thicknesses.GetItem(number);
}
std::string CNmtExpInitialBedThicknessGrid::BandTitle(int item) {
  return formatted(texts::layerEntry, item);
}
int CNmtExpInitialBedThicknessGrid::Quantity(int) {
  return item::kLayerThickness;
}
Choices CNmtExpInitialBedThicknessGrid::Formats() {
  return formats();
}
FileKind CNmtExpInitialBedThicknessGrid::KindOfFile(std::int32_t) {
  return texts::initialConditionFile;
}

int CNmtExpBedDistributionGrid::LayoutKey() {
  return fractionCount(GetKvs());
}
std::string CNmtExpBedDistributionGrid::RowHeader(GridRow row) {
  return formatted(texts::layerEntry, row.item);
}
void CNmtExpBedDistributionGrid::LayOut() {
  const auto layer = [this](GridRow row) { return initial(GetKvs()).distribution.GetItem(row.item); };
  Rows([this] { return initial(GetKvs()).distribution.GetCount(); });
  for (std::size_t fraction = 0; fraction < static_cast<std::size_t>(LayoutKey()); ++fraction) {
    Integer(formatted(texts::fractionEntry, fraction + 1), 90,
            [layer, fraction](GridRow row) -> std::int32_t* {
              auto* held = layer(row);
              const bool isThere = held != nullptr && fraction < held->percentages.size();
              return isThere ? &held->percentages[fraction] : nullptr;
            });
  }
  Shown("Total", 60, [layer](GridRow row) {
    const std::vector<std::int32_t>& shares = layer(row)->percentages;
    return std::to_string(std::accumulate(shares.begin(), shares.end(), std::int64_t{0}));
  }).Static();
}

void CNmtExpInitialConditionsDlg::DoDataExchange(Form& form) {
  form.Grid("Initial concentrations", concentrations_);
  form.Grid("Initial bed thickness", thickness_);
  form.Grid("Bed distribution", distribution_);
}

}  // namespace gridbay
