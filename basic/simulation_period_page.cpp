#include "basic/simulation_period_page.h"

#include <fmt/ranges.h>

#include <array>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "core/model_root.h"
#include "platform/units/units.h"

namespace gridbay {

void CSimulationPeriodDlg::DoDataExchange(Form& form) {
  using Period = CSimulationPeriodKvs;
  const auto period = objectOf(&BasicParts::simulationPeriod);
  const auto isHot = [areas = objectOf(&BasicParts::bathymetry)] { return areas().hotStart != 0; };
  const auto isCold = [isHot] { return !isHot(); };
  const auto range = [&form](const Binding<std::int32_t>& last) -> Control& {
    Control* edit = nullptr;
    form.Group("Time step range:", [&] {
      form.Shown("First:", [] { return "0"; });
      edit = &form.Number("Last:", last).Beside();
    });
    return *edit;
  };
  form.Group("Simulation", [&] {
    range(lastOf(memberOf(period, &Period::noPointsInTime)));
    form.Number("Time step interval:", period, &Period::timeStepInterval, item::kTimeStep).ReadOnlyIf(isHot);
    form.DateTimeEdit("Simulation start date:", period, &Period::start).EnabledIf(isCold);
    form.Shown("Simulation end date:", [period] { return dateTimeText(period().End()); }).Disabled();
  });
  form.Group("Warm-up Period", [&] { range(memberOf(period, &Period::warmUpPeriod)).EnabledIf(isCold); });
  form.Group("Courant Number", [&] {
    form.Shown("Max Courant No:", [this] { return maxCourant_; }).Tip([this] { return unread_; });
    form.Shown("Area:", [this] { return courantArea_; }).Beside();
  });
}

void CSimulationPeriodDlg::SetData() {
  CBathymetryKvs& areas = *parts<BasicParts>().bathymetry;
  double courant = 0;
  int area = 0;
  areas.GetMaxCourant(parts<BasicParts>().simulationPeriod->timeStepInterval, &courant, &area);
  const std::vector<int> unread = areas.UnreadAreas();
  const bool isKnown = static_cast<int>(unread.size()) < areas.GetCount();
  unread_ =
      unread.empty() ? "" : fmt::format("Not known before a validation: area {}", fmt::join(unread, ", "));
  maxCourant_ = isKnown ? fmt::format("{:.6g}", courant) : std::string();
  courantArea_ = isKnown ? std::to_string(area) : std::string();
  CV27SetupFormView::SetData();
}

void CSimulationPeriodDlg::OnLeave() {
  CSimulationPeriodKvs& period = *parts<BasicParts>().simulationPeriod;
  const std::array steps{0, period.noPointsInTime - 1};
  auto* root = period.parts<ModelRoot>();
  if (root == nullptr) return;
  const auto told = [&] { root->TellFollowers(period, steps); };
  document().Attempt(told);
  document().RecordEdit(pageId(), "Simulation Period");
}

}  // namespace gridbay
