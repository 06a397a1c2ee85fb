#include "advection_dispersion/initial_concentration_page.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/transported.h"
#include "families/transport_page_texts.h"

namespace gridbay {

int CNadInitialConcentrationGrid::EntryCount() {
  return parts<AdvectionDispersionParts>().nadInitialConcentration->GetCount();
}

CNadInitialComponentKvs* CNadInitialConcentrationGrid::EntryAt(int number) {
  return parts<AdvectionDispersionParts>().nadInitialConcentration->GetItem(number);
}

std::string CNadInitialConcentrationGrid::BandTitle(int item) {
  return formatted(texts::componentBand, AdComponents::name(GetKvs(), item));
}

int CNadInitialConcentrationGrid::Quantity(int number) {
  return AdComponents::quantity(GetKvs(), number);
}

Choices CNadInitialConcentrationGrid::Formats() {
  return Choices::lines("Constant value\r\nType 2 data file\r\n");
}

FileKind CNadInitialConcentrationGrid::KindOfFile(std::int32_t) {
  return texts::initialConditionFile;
}

}  // namespace gridbay
