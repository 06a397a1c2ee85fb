#include "mud_transport_expanded/task_selection_page.h"

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/task_selection.h"

namespace gridbay {

void CNmtExpTaskSelectionDlg::DoDataExchange(Form& form) {
  using Task = CNmtExpTaskSelectionKvs;
  constexpr int kMost = Task::kMostOnPage;
  const auto task = objectOf(&MudTransportExpandedParts::nmtExpTaskSelection);
  Binding<std::int32_t> fractions = memberOf(task, &Task::fractions);
  fractions.set = [task](std::int32_t n) { task().SetCounts(task().layers, n, task().includeSalinity); };
  Binding<std::int32_t> layers = memberOf(task, &Task::layers);
  layers.set = [task](std::int32_t n) { task().SetCounts(n, task().fractions, task().includeSalinity); };
  Binding<std::int32_t> salinity = memberOf(task, &Task::includeSalinity);
  salinity.set = [task](std::int32_t on) { task().SetSalinity(on != 0); };
  form.Count("Number of grain size fractions:", fractions, kMost, kMost, 1);
  form.Count("Number of bed layers:", layers, kMost, kMost, 1);
  form.Check("Include salinity component", salinity);
  form.Check("Include xenobiotics parameters", task, &Task::includeXenobiotics);
}

}  // namespace gridbay
