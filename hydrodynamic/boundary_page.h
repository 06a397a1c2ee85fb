#pragma once

#include <cstdint>
#include <string>

#include "hydrodynamic/boundary.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"

namespace gridbay {

// The dialog of a sine series. Its page-like form is shown modally; OK copies the four values back.
class CNhdSineSeriesDlg {
 public:
  static constexpr std::int32_t kTemplate = 18927;

  CNhdSineSeriesDlg(const CNhdBoundaryObjectKvs& object, const UnitChoices& units);

  std::string_view title() const;
  Form& form() { return form_; }
  // Takes what the form shows; what is wrong with it, or empty.
  std::string fault() { return form_.store(units_); }
  void OnOK(CNhdBoundaryObjectKvs& object) const;

 private:
  const UnitChoices& units_;
  float referenceLevel_;
  float range_;
  float period_;
  float phase_;
  Form form_;
};

// Six rows for each boundary.
class CNhdBoundaryGrid final : public CV27SetupGridWnd {
 public:
  static constexpr int kRowsPerBoundary = 6;

  int GetRowCount() override;
  int GetColCount() override { return 4; }
  std::string GetColHeader(int) override { return ""; }
  std::string GetRowHeader(int) override { return ""; }
  int GetColWidth(int col) override;
  bool ShowsHeaders() const override { return false; }

  // The boundary and the row in its block (both from 1) of a row from 1.
  static int boundaryOf(int row) { return (row - 1) / kRowsPerBoundary + 1; }
  static int subRowOf(int row) { return (row - 1) % kRowsPerBoundary + 1; }

 protected:
  bool styleOf(int row, int col, CellStyle& style) override;
  bool storeCell(int row, int col, std::string_view text) override;
  void buttonPressed(int row, int col) override;
  std::string editName(int row, int col) override;

 private:
  CNhdBoundaryObjectKvs* object(int row);
  void styleOfData(CNhdBoundaryObjectKvs& object, int col, CellStyle& style);
  void styleOfDirection(CNhdBoundaryObjectKvs& object, int col, CellStyle& style);
  bool storeData(CNhdBoundaryObjectKvs& object, std::string_view text);
  bool storeSine(CNhdBoundaryObjectKvs& object, const std::string& text);
  std::string dataText(const CNhdBoundaryObjectKvs& object);
  CVdEditStyle levelOrFlux(const CNhdBoundaryObjectKvs& object);
  void chooseData(CNhdBoundaryObjectKvs& object, int number);
  void chooseDirection(CNhdBoundaryObjectKvs& object, int number);
};

// The conditions at the open boundaries.
class CNhdBoundaryDlg final : public CV27SetupFormView {
 public:
  explicit CNhdBoundaryDlg(CVdDoc& document) : CV27SetupFormView(document, 18705, PageId::hdBoundary) {}

 protected:
  void DoDataExchange(Form& form) override { form.DDX_Control("Boundary conditions", grid_); }
  int Initialize() override {
    SetUpGrid("Boundary conditions");
    return 1;
  }

 private:
  CNhdBoundaryGrid grid_;
};

}  // namespace gridbay
