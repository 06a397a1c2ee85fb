#include "ecology/results_page.h"

#include "families/entry_selection.h"

namespace gridbay {

void CWQSResultsGridDlg::LayOut() {
  const auto outputs = [this]() -> auto& {
    return parts<EcologyParts>().wqsResults->outputs;
  };
  const auto output = [outputs](GridRow row) { return outputs().GetItem(row.item); };
  Rows([outputs] { return outputs().GetCount(); });
  ListOutput(output);
  Check("Averaged", 60, output, &CWQSResultsItemKvs::timeAveraged);
  // Both choices in one list: the state variables, and the additional items behind them.
  Button("Items...", 60, [this, output](GridRow row) {
    CWQSResultsItemKvs& it = *output(row);
    std::vector<std::string> names = stateVariableNames(it);
    const auto variables = static_cast<std::ptrdiff_t>(names.size());
    for (std::string& name : additionalItemNames(it)) names.push_back(std::move(name));
    EntryFlags chosen = it.stateVariables;
    chosen.resize(static_cast<std::size_t>(variables));
    chosen.insert(chosen.end(), it.additionalItems.begin(), it.additionalItems.end());
    if (!chooseEntries(document(), "Output area " + std::to_string(row.item), std::move(names), chosen))
      return;
    it.stateVariables.assign(chosen.begin(), chosen.begin() + variables);
    it.additionalItems.assign(chosen.begin() + variables, chosen.end());
    UpdateDoc();
  });
}

void CWQSResultsDlg::DoDataExchange(Form& form) {
  const auto results = objectOf(&EcologyParts::wqsResults);
  listOutputControls(form, results, "Size of BIO Rig Output", outputs_);
  // No hot start without that of the flow calculation.
  Binding<std::int32_t> hotStart = memberOf(results, &CWQSResultsKvs::generateHotStart);
  hotStart.set = [this, results, take = hotStart.set](std::int32_t on) {
    const bool isRefused = on != 0 && !results().generateHotStart && !results().hydrodynamicHotStart();
    if (isRefused) {
      document().host().show(formatted(texts::noHydrodynamicHotStart));
    } else {
      take(on);
    }
  };
  form.Check("Create Hotstart Output", hotStart);
  form.Grid("Hot start files", hotStarts_);
}

}  // namespace gridbay
