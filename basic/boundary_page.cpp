#include "basic/boundary_page.h"

#include "basic/boundary.h"

namespace gridbay {
namespace {

constexpr std::int32_t kUserSpecified = 0;
constexpr std::int32_t kProgramDetected = 1;

}  // namespace

void CBoundaryGrid::Initialize() {
  constexpr int kWidth = 90;
  const auto pointColumn = [this](const char* header, GridPoint CBoundaryObjectKvs::*point) {
    return Column{.header = header,
                  .width = kWidth,
                  .align = CellAlign::right,
                  .get = [this, point](int n) { return pointText(GetKvs().boundary->GetItem(n)->*point); },
                  .set =
                      [this, point](int n, std::string_view text) {
                        const std::optional<GridPoint> typed = pointOfText(text);
                        if (typed) GetKvs().boundary->GetItem(n)->*point = *typed;
                        return typed.has_value();
                      },
                  .readOnly = [this](int) { return GetKvs().boundary->defaultPosition != kUserSpecified; }};
  };
  SetColumns(30, {pointColumn("First point", &CBoundaryObjectKvs::first),
                  pointColumn("Last point", &CBoundaryObjectKvs::last)});
}

int CBoundaryGrid::ItemCount() {
  return GetKvs().boundary->GetCount();
}

void CBoundaryDlg::DoDataExchange(Form& form) {
  form.DDX_Radio("Default position", {"User specified", "Program detected"}, position_).Changed([this] {
    UpdateDoc();
    SetData();
  });
  AddCount(form, "Number of boundaries", number_, CBoundaryKvs::kMostOnPage,
           [this] { return GetKvs().boundary->GetCount(); });
  form.DDX_Control("Boundaries", grid_);
}

int CBoundaryDlg::Initialize() {
  SetUpGrid("Boundaries");
  return 1;
}

void CBoundaryDlg::SetData() {
  const CBoundaryKvs& boundaries = *GetKvs().boundary;
  position_ = boundaries.defaultPosition;
  number_ = boundaries.GetCount();
  form().of(&number_).enabled = position_ != kProgramDetected;
  UpdateData(false);
}

int CBoundaryDlg::GetData() {
  if (!UpdateData(true)) return 0;
  CBoundaryKvs& boundaries = *GetKvs().boundary;
  boundaries.defaultPosition = position_;
  if (position_ != kUserSpecified) {
    boundaries.RecalculateBoundaries();
  } else if (number_ >= 0 && number_ <= CBoundaryKvs::kMostOnPage) {
    boundaries.SetNoBoundaries(number_);
  }
  return 1;
}

}  // namespace gridbay
