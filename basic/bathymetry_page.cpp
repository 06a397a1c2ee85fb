#include "basic/bathymetry_page.h"

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/bathymetry_requests.h"
#include "basic/boundary.h"
#include "basic/page_texts.h"
#include "core/edition.h"
#include "pages/cell_controls.h"
#include "platform/files/paths.h"

namespace gridbay {
namespace {

constexpr const char* kOverlandEdit = "Edit";
constexpr const char* kOverlandBrowse = "...";

}  // namespace

CBathymetryObjectKvs& CBathymetryGrid::area(int number) {
  return *parts<BasicParts>().bathymetry->GetArea(number);
}

void CBathymetryGrid::Initialize() {
  CVdDoc::EnableGXMultiToolTips(*this, 1);
  const auto isOutermost = [](int n) { return n == 1; };
  const auto placeIsFixed = [this](int n) { return n == 1 || parts<BasicParts>().bathymetry->hotStart == 1; };
  SetColumns(30,
             {{.header = "Bathymetry",
               .width = 210,
               .get = [this](int n) { return area(n).fileName.text(); },
               .set =
                   [this](int n, std::string_view text) {
                     area(n).fileName.Set(text, page().document().path());
                     OnFileChanged(n);
                     return true;
                   }},
              {.header = "",
               .width = 30,
               .kind = CellKind::button,
               .press = [this](int n) { ChooseFile(n); },
               .choices = {std::string(texts::browse.format)}},
              {.header = "Origin",
               .width = 60,
               .align = CellAlign::right,
               .get = [this, isOutermost](int n) { return isOutermost(n) ? "" : pointText(area(n).origin); },
               .set =
                   [this](int n, std::string_view text) {
                     const std::optional<GridPoint> typed = pointOfText(text);
                     if (typed) area(n).origin = *typed;
                     return typed.has_value();
                   },
               .readOnly = placeIsFixed},
              {.header = "Enclosing Area",
               .width = 100,
               .align = CellAlign::right,
               .get = [this, isOutermost](
                          int n) { return isOutermost(n) ? "" : std::to_string(area(n).enclosingArea); },
               .set =
                   [this](int n, std::string_view text) {
                     area(n).enclosingArea = plainInteger(text);
                     return true;
                   },
               .readOnly = placeIsFixed},
              {.header = "",
               .width = 45,
               .kind = CellKind::button,
               .enabled = [this](int n) { return isReadableFile(area(n).fileName.absolute()); },
               .press = [this](int n) { page().document().host().openFile(area(n).fileName.absolute()); },
               .choices = {std::string(texts::view.format)}}});
}

int CBathymetryGrid::ItemCount() {
  return parts<BasicParts>().bathymetry->GetCount();
}

// Another grid for Area 1 makes boundaries that were detected worthless.
void CBathymetryGrid::OnFileChanged(int row) {
  CBoundaryKvs& boundaries = *parts<BasicParts>().boundary;
  if (row != 1 || boundaries.defaultPosition == 0) return;
  const bool ask = boundaries.GetCount() > 0;
  if (!ask || page().document().host().askYesNo(formatted(texts::recalculateBoundaries)))
    boundaries.RecalculateBoundaries();
}

void CBathymetryGrid::ChooseFile(int row) {
  CVdFileSelectorDlg selector(texts::mapExtension.format, area(row).fileName.text(),
                              texts::bathymetryFilter.format);
  RequestBathymetry(selector, parts<BasicParts>().bathymetry->hotStart == 1);
  selector.SetChooser(&page().document().host());
  if (selector.DoModal() != 1) return;
  area(row).fileName.Set(selector.fileName(), page().document().path());
  OnFileChanged(row);
  if (row == 1) parts<BasicParts>().bathymetry->projectionStale = true;
  UpdateDoc();
  if (row == 1) page().SetData();
}

void CBathymetryDlg::DoDataExchange(Form& form) {
  const auto changed = [this] {
    UpdateDoc();
    EnableControls();
  };
  form.DDX_Radio("Type", {"Cold start", "Hot start"}, type_).Changed(changed);
  AddCount(form, "Number of areas", number_, CBathymetryKvs::kMostAreas,
           [this] { return parts<BasicParts>().bathymetry->GetCount(); });
  form.DDX_CBIndex("Map projection:", {}, projection_).Changed(changed);
  form.DDX_Check("Apply Coriolis forcing:", coriolis_).Changed(changed);
  form.DDX_Check("Landslides:", landSlides_).Changed(changed);
  form.DDX_Check("Multi-cell overland solver for inland applications:            ", overlandSolver_)
      .Changed(changed);
  form.DDX_Text(texts::fineBathymetryFile.format, overlandFile_).Changed([this] { UpdateDoc(); });
  form.Button(kOverlandBrowse, [this] { ChooseOverlandFile(); });
  form.Button(kOverlandEdit, [this] {
    const std::string path = parts<BasicParts>().bathymetry->overlandFile.absolute();
    if (isReadableFile(path)) document().host().openFile(path);
  });
  form.DDX_Control("Areas", grid_);
}

int CBathymetryDlg::Initialize() {
  SetUpGrid("Areas");
  return 1;
}

void CBathymetryDlg::SetData() {
  FillProjections();
  const CBathymetryKvs& areas = *parts<BasicParts>().bathymetry;
  type_ = areas.hotStart;
  number_ = areas.GetCount();
  coriolis_ = hasProjection_ && areas.coriolis ? 1 : 0;
  landSlides_ = areas.landSlides ? 1 : 0;
  overlandSolver_ = areas.overlandSolver ? 1 : 0;
  overlandFile_ = areas.overlandFile.text();
  UpdateData(false);
  EnableControls();
}

int CBathymetryDlg::GetData() {
  if (!UpdateData(true)) return 0;
  CBathymetryKvs& areas = *parts<BasicParts>().bathymetry;
  areas.hotStart = type_;
  if (number_ >= 0 && number_ <= CBathymetryKvs::kMostAreas && number_ != areas.GetCount())
    areas.SetNoAreas(number_);
  if (hasProjection_ && projection_ >= 0)
    areas.projection = projections_[static_cast<std::size_t>(projection_)];
  if (hasProjection_) areas.coriolis = coriolis_ != 0;
  areas.landSlides = landSlides_ != 0;
  areas.overlandSolver = overlandSolver_ != 0;
  if (overlandFile_ != areas.overlandFile.text()) areas.overlandFile.Set(overlandFile_, document().path());
  return 1;
}

// The projection that holds, and those that can be picked in its place.
void CBathymetryDlg::FillProjections() {
  std::string held;
  int flag = 0;
  hasProjection_ = parts<BasicParts>().bathymetry->GetProjection(&held, &flag) == 1;
  CVdMapProjectionGXComboBox list;
  list.UpdateMapProjection(held);
  projections_ = list.choices();
  form().of(&projection_).choices = projections_;
  projection_ = 0;
}

void CBathymetryDlg::EnableControls() {
  const bool sweep = theEdition.wetlandSweepKit;
  const bool overland = overlandSolver_ != 0;
  form().of(&number_).visible = !sweep;
  form().of(&coriolis_).visible = !sweep;
  form().of(&landSlides_).visible = !sweep;
  form().of(&number_).enabled = !overland;
  form().of(&projection_).enabled = hasProjection_;
  form().of(&coriolis_).enabled = hasProjection_ && !overland;
  form().of(&landSlides_).enabled = !overland;
  form().of(&overlandFile_).visible = overland;
  form().find(kOverlandBrowse)->visible = overland;
  form().find(kOverlandEdit)->visible = overland;
}

// The fine grid is held against Area 1, and so comes after it.
void CBathymetryDlg::ChooseOverlandFile() {
  CBathymetryObjectKvs* area = parts<BasicParts>().bathymetry->GetArea(1);
  ValidationList dropped;
  if (area == nullptr || area->ReadGrid(dropped, 1) != 0) {
    document().host().show(formatted(texts::area1First));
    return;
  }
  CVdFileSelectorDlg selector(texts::mapExtension.format, overlandFile_, texts::fineBathymetryFilter.format);
  selector.AddRequest(std::make_unique<COverlandRqTsbItem>(*area));
  selector.SetChooser(&document().host());
  if (selector.DoModal() != 1) return;
  form().of(&overlandFile_).text = selector.fileName();
  UpdateDoc();
}

}  // namespace gridbay
