#pragma once

#include <cstdint>
#include <string>

#include "pages/form_view.h"

namespace gridbay {

// Start, time step and length of the simulation, and the Courant number that follows. With a hot start the
// start and the step come from the file and are only shown.
class CSimulationPeriodDlg final : public CV27SetupFormView {
 public:
  explicit CSimulationPeriodDlg(CVdDoc& document)
      : CV27SetupFormView(document, 18926, PageId::simulationPeriod) {}

  int GetData() override;
  void SetData() override;

 protected:
  void DoDataExchange(Form& form) override;

 private:
  void EnableControls();
  void ShowEnd();
  void ShowCourant();

  std::string first_ = "0";
  std::int32_t last_ = 0;
  float timeStepInterval_ = 0;
  std::string startDate_;
  std::string endDate_;
  std::string warmUpFirst_ = "0";
  std::int32_t warmUpLast_ = 0;
  std::string maxCourant_;
  std::string courantArea_;
};

}  // namespace gridbay
