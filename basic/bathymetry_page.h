#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "pages/form_view.h"
#include "pages/grid_wnd.h"

namespace gridbay {

class CBathymetryObjectKvs;

// One row for each area: its grid file and where it lies.
class CBathymetryGrid final : public ColumnGrid {
 public:
  void Initialize() override;

 protected:
  int ItemCount() override;

 private:
  CBathymetryObjectKvs& area(int number);
  void OnFileChanged(int row);
  void ChooseFile(int row);
};

// The areas, the start, the projection and the overland solver.
class CBathymetryDlg final : public CV27SetupFormView {
 public:
  explicit CBathymetryDlg(CVdDoc& document) : CV27SetupFormView(document, 18703, PageId::bathymetry) {}

  int GetData() override;
  void SetData() override;

 protected:
  void DoDataExchange(Form& form) override;
  int Initialize() override;

 private:
  void EnableControls();
  void FillProjections();
  void ChooseOverlandFile();

  std::int32_t type_ = -1;
  std::int32_t number_ = 0;
  std::int32_t projection_ = -1;
  std::vector<std::string> projections_;
  bool hasProjection_ = false;
  std::int32_t coriolis_ = 0;
  std::int32_t landSlides_ = 0;
  std::int32_t overlandSolver_ = 0;
  std::string overlandFile_;
  CBathymetryGrid grid_;
};

}  // namespace gridbay
