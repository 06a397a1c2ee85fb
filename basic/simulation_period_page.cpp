#include "basic/simulation_period_page.h"

#include <fmt/format.h>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "platform/units/units.h"

namespace gridbay {

void CSimulationPeriodDlg::DoDataExchange(Form& form) {
  const auto periodChanged = [this] {
    if (UpdateDoc() != 0) ShowEnd();
  };
  form.Group("Simulation");
  form.Group("Time step range:");
  form.Label("First:", first_);
  form.DDX_Text("Last:", last_).Changed(periodChanged);
  form.DDX_VDedit("Time step interval:", timeStepInterval_, item::kTimeStep).Changed([this] {
    if (UpdateDoc() == 0) return;
    ShowEnd();
    ShowCourant();
  });
  form.DDX_Text("Simulation start date:", startDate_).Changed(periodChanged);
  form.Label("Simulation end date:", endDate_).enabled = false;
  form.Group("Warm-up Period");
  form.Group("Time step range:");
  form.Label("First:", warmUpFirst_);
  form.DDX_Text("Last:", warmUpLast_).Changed([this] { UpdateDoc(); });
  form.Group("Courant Number");
  form.Label("Max Courant No:", maxCourant_);
  form.Label("Area:", courantArea_);
}

void CSimulationPeriodDlg::SetData() {
  const CSimulationPeriodKvs& period = *parts<BasicParts>().simulationPeriod;
  last_ = period.noPointsInTime - 1;
  timeStepInterval_ = period.timeStepInterval;
  startDate_ = dateTimeText(period.start);
  warmUpLast_ = period.warmUpPeriod;
  UpdateData(false);
  ShowEnd();
  ShowCourant();
  EnableControls();
}

int CSimulationPeriodDlg::GetData() {
  const std::optional<DateTime> start = dateTimeOfText(form().of(&startDate_).text);
  const bool unchanged = form().of(&startDate_).text == startDate_;
  if (!start && !unchanged) {
    document().host().show(fmt::format("Simulation start date: \"{}\" is not of the form YYYY-MM-DD hh:mm:ss",
                                       form().of(&startDate_).text));
    return 0;
  }
  if (!UpdateData(true)) return 0;
  CSimulationPeriodKvs& period = *parts<BasicParts>().simulationPeriod;
  period.noPointsInTime = last_ + 1;
  period.timeStepInterval = timeStepInterval_;
  if (start && !unchanged) period.start = *start;
  period.warmUpPeriod = warmUpLast_;
  return 1;
}

void CSimulationPeriodDlg::EnableControls() {
  const bool hotStart = parts<BasicParts>().bathymetry->hotStart != 0;
  form().of(&timeStepInterval_).readOnly = hotStart;
  form().of(&startDate_).enabled = !hotStart;
  form().of(&warmUpLast_).enabled = !hotStart;
}

void CSimulationPeriodDlg::ShowEnd() {
  endDate_ = dateTimeText(parts<BasicParts>().simulationPeriod->End());
  form().of(&endDate_).text = endDate_;
}

void CSimulationPeriodDlg::ShowCourant() {
  double courant = 0;
  int area = 0;
  parts<BasicParts>().bathymetry->GetMaxCourant(parts<BasicParts>().simulationPeriod->timeStepInterval,
                                                &courant, &area);
  maxCourant_ = fmt::format("{:.6g}", courant);
  courantArea_ = std::to_string(area);
  form().of(&maxCourant_).text = maxCourant_;
  form().of(&courantArea_).text = courantArea_;
}

}  // namespace gridbay
