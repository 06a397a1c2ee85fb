#include "mud_transport/initial_concentration_page.h"

#include "families/transport_page_texts.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/transported.h"

namespace gridbay {

int CNmtInitialConcentrationGrid::EntryCount() {
  return parts<MudTransportParts>().nmtInitialConcentration->GetCount();
}

CNmtInitialComponentKvs* CNmtInitialConcentrationGrid::EntryAt(int number) {
  return parts<MudTransportParts>().nmtInitialConcentration->GetItem(number);
}

std::string CNmtInitialConcentrationGrid::BandTitle(int item) {
  return formatted(texts::componentBand, MudFractions::name(GetKvs(), item));
}

int CNmtInitialConcentrationGrid::Quantity(int number) {
  return MudFractions::quantity(GetKvs(), number);
}

Choices CNmtInitialConcentrationGrid::Formats() {
  return Choices::lines("Constant value\r\nType 2 data file\r\n");
}

FileKind CNmtInitialConcentrationGrid::KindOfFile(std::int32_t) {
  return texts::initialConditionFile;
}

GridRow CNmtInitialConcentrationGrid::FormatRow(GridRow row) {
  const bool isThickness = parts<MudTransportParts>().nmtTaskSelection->IsThickness(row.item);
  return {row.item, CNmtInitialComponentKvs::FormatArea(row.sub, isThickness)};
}

}  // namespace gridbay
