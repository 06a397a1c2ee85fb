#include "mud_transport_expanded/result_page.h"

#include <algorithm>

#include "families/entry_selection.h"

namespace gridbay {

void CNmtExpResultGrid::LayOut() {
  const auto outputs = [this]() -> auto& {
    return parts<MudTransportExpandedParts>().nmtExpResult->outputs;
  };
  Rows([outputs] { return outputs().GetCount(); });
  ListOutput([outputs](GridRow row) { return outputs().GetItem(row.item); });
  Button("Items...", 60, [this](GridRow row) { chooseItems(row.item); });
}

// The items by their keywords, with blanks.
void CNmtExpResultGrid::chooseItems(int number) {
  CNmtExpResultObjectKvs& output = parts<MudTransportExpandedParts>().nmtExpResult->outputs.at(number);
  std::vector<std::string> names;
  for (ExpOutputItem& item : expOutputItems(output.layers, output.fractions)) {
    std::ranges::replace(item.keyword, '_', ' ');
    names.push_back(std::move(item.keyword));
  }
  if (chooseEntries(document(), "Output " + std::to_string(number), std::move(names), output.items))
    UpdateDoc();
}

}  // namespace gridbay
