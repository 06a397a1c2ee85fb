#pragma once

#include <string>

#include "pages/form_view.h"

namespace gridbay {

// Start, time step and length of the simulation, and the Courant number that follows. With a hot start the
// start and the step come from the file and are only shown.
class CSimulationPeriodDlg final : public Page<18926, PageId::simulationPeriod> {
 public:
  using Page::Page;
  void SetData() override;
  // The period is told to those who begin with it.
  void OnLeave() override;

 private:
  void DoDataExchange(Form& form) override;

  std::string maxCourant_;  // this and its area are empty while no grid has been read
  std::string courantArea_;
  std::string unread_;  // areas that the number says nothing of
};

}  // namespace gridbay
