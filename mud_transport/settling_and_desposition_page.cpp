#include "mud_transport/settling_and_desposition_page.h"

#include "mud_transport/mud_transport_parts.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/task_selection.h"

namespace gridbay {
namespace {

CNmtSettlingAndDespositionKvs& settlingOf(CKvsBase& object) {
  return rootMember<&MudTransportParts::nmtSettlingAndDesposition>(object);
}

}  // namespace

int SettlingComponents::count(CKvsBase& object) {
  return settlingOf(object).GetCount();
}
std::string SettlingComponents::name(CKvsBase& object, int number) {
  return rootMember<&MudTransportParts::nmtTaskSelection>(object).EntryName(number);
}

std::string CNmtMfSettlingAndDepositionGrid::CornerHeader() {
  return std::string(SettlingComponents::kCorner);
}
int CNmtMfSettlingAndDepositionGrid::RowHeaderWidth() {
  return SettlingComponents::kRowHeaderWidth;
}
std::string CNmtMfSettlingAndDepositionGrid::RowHeader(GridRow row) {
  return SettlingComponents::name(GetKvs(), row.item);
}
void CNmtMfSettlingAndDepositionGrid::LayOut() {
  using Component = CNmtSettlingAndDespositionComponentKvs;
  const auto component = RowsOf(&MudTransportParts::nmtSettlingAndDesposition);
  constexpr int kWidth = 130;
  Number("Critical velocity for deposition", kWidth, component, &Component::criticalVelocityForDeposition,
         item::kCurrentSpeed);
  Number("Critical velocity for erosion", kWidth, component, &Component::criticalVelocityForErosion,
         item::kCurrentSpeed);
  Number("Relative height of centroid", kWidth, component, &Component::relativeHeightOfCentroid);
  Number("Mean settling velocity", kWidth, component, &Component::meanSettlingVelocity,
         item::kSettlingVelocity);
}

CNmtSettlingAndDespositionBedCompositionKvs* BedCompositionWords::values(CKvsBase& object, int number) {
  CNmtSettlingAndDespositionComponentKvs* component = settlingOf(object).GetItem(number);
  return component == nullptr ? nullptr : &component->bedComposition;
}

CNmtSettlingAndDespositionErosionKvs* FractionErosionWords::values(CKvsBase& object, int number) {
  CNmtSettlingAndDespositionComponentKvs* component = settlingOf(object).GetItem(number);
  return component == nullptr ? nullptr : &component->erosion;
}

CNmtSettlingAndDespositionBedCompositionDlg::CNmtSettlingAndDespositionBedCompositionDlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtSettlingAndDespositionBedCompositionDlg::~CNmtSettlingAndDespositionBedCompositionDlg() = default;

CNmtSettlingAndDespositionErosionDlg::CNmtSettlingAndDespositionErosionDlg(CVdDoc& document)
    : LayerValuesDlg(document) {}
CNmtSettlingAndDespositionErosionDlg::~CNmtSettlingAndDespositionErosionDlg() = default;

}  // namespace gridbay
