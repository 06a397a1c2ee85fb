#include "basic/boundary_page.h"

#include "basic/basic_parts.h"
#include "basic/boundary.h"

namespace gridbay {
namespace {

constexpr std::int32_t kUserSpecified = 0;
constexpr std::int32_t kProgramDetected = 1;

}  // namespace

void CBoundaryGrid::Initialize() {
  constexpr int kWidth = 90;
  const auto pointColumn = [this](const char* header, GridPoint CBoundaryObjectKvs::*point) {
    Column column = PointColumn(header, kWidth, [this, point](int n) -> GridPoint& {
      return parts<BasicParts>().boundary->GetItem(n)->*point;
    });
    column.align = CellAlign::right;
    column.readOnly = [this](int) { return parts<BasicParts>().boundary->defaultPosition != kUserSpecified; };
    return column;
  };
  SetColumns(30, {pointColumn("First point", &CBoundaryObjectKvs::first),
                  pointColumn("Last point", &CBoundaryObjectKvs::last)});
}

int CBoundaryGrid::ItemCount() {
  return parts<BasicParts>().boundary->GetCount();
}

void CBoundaryDlg::DoDataExchange(Form& form) {
  form.DDX_Radio("Default position", {"User specified", "Program detected"}, position_).Changed([this] {
    UpdateDoc();
    SetData();
  });
  AddCount(form, "Number of boundaries", number_, CBoundaryKvs::kMostOnPage,
           [this] { return parts<BasicParts>().boundary->GetCount(); });
  form.DDX_Control("Boundaries", grid_);
}

int CBoundaryDlg::Initialize() {
  SetUpGrid("Boundaries");
  return 1;
}

void CBoundaryDlg::SetData() {
  const CBoundaryKvs& boundaries = *parts<BasicParts>().boundary;
  position_ = boundaries.defaultPosition;
  number_ = boundaries.GetCount();
  form().of(&number_).enabled = position_ != kProgramDetected;
  UpdateData(false);
}

int CBoundaryDlg::GetData() {
  if (!UpdateData(true)) return 0;
  CBoundaryKvs& boundaries = *parts<BasicParts>().boundary;
  boundaries.defaultPosition = position_;
  if (position_ != kUserSpecified) {
    boundaries.RecalculateBoundaries();
  } else if (number_ >= 0 && number_ <= CBoundaryKvs::kMostOnPage) {
    boundaries.SetNoBoundaries(number_);
  }
  return 1;
}

}  // namespace gridbay
