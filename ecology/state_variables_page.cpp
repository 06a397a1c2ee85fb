#include "ecology/state_variables_page.h"

#include <algorithm>

#include "ecology/ecology_parts.h"
#include "ecology/model_definition.h"
#include "ecology/page_texts.h"
#include "ecology/variable_headers.h"

namespace gridbay {
namespace {

using Words = std::function<std::string(const CSolverItem&)>;

// Pixels for the longest of the texts, by a usual letter's.
constexpr int kLetterWidth = 7;
constexpr int kCellMargin = 14;
constexpr int kWidest = 400;

int widthFor(std::string_view header, const std::vector<CSolverItem>& variables, const Words& text) {
  std::size_t longest = header.size();
  for (const CSolverItem& variable : variables) longest = std::max(longest, text(variable).size());
  constexpr std::size_t kMost = (kWidest - kCellMargin) / kLetterWidth;
  return kCellMargin + kLetterWidth * static_cast<int>(std::min(longest, kMost));
}

}  // namespace

const CSolverItem* CWQSStateVariablesGrid::variable(int number) {
  return parts<EcologyParts>().wqsModelDefinition->StateVariable(number);
}

std::string CWQSStateVariablesGrid::RowHeader(GridRow row) {
  const CSolverItem* declared = variable(row.item);
  return declared == nullptr ? std::string() : std::to_string(declared->id);
}

void CWQSStateVariablesGrid::LayOut() {
  Rows([this] { return parts<EcologyParts>().wqsModelDefinition->GetNoStateVariables(); });
  const auto column = [this](std::string_view header, const Words& text, const Words& tip) {
    const auto of = [this](const Words& worded) {
      return [this, worded](GridRow row) {
        const CSolverItem* declared = variable(row.item);
        return declared == nullptr ? std::string() : worded(*declared);
      };
    };
    const int width = widthFor(header, parts<EcologyParts>().wqsModelDefinition->stateVariables(), text);
    Column& shown =
        Shown(header, width, of(text)).Look([](GridRow, CellStyle& style) { style.isGrey = true; });
    if (tip) shown.Tip(of(tip));
  };
  const UnitChoices& units = document().units();
  column(
      "Symbol", [](const CSolverItem& it) { return it.symbol; },
      [](const CSolverItem& it) {
        return it.expression.empty() ? it.symbol
                                     : CVdDoc::GetToolTipsString(
                                           formatted(texts::symbolAndExpression, it.symbol, it.expression));
      });
  column(
      "Description", [](const CSolverItem& it) { return it.description; },
      [](const CSolverItem& it) { return CVdDoc::GetToolTipsString(it.onlineHelp); });
  column(
      "Unit", [&units](const CSolverItem& it) { return unitText(&it, units); },
      [&units](const CSolverItem& it) { return unitTip(&it, units); });
  column("Transport", [](const CSolverItem& it) { return std::string(it.IsTransported() ? "AD" : "NONE"); },
         {});
}

}  // namespace gridbay
