#include "conversion/item_types.h"

#include <fmt/format.h>

#include <vector>

#include "core/nearest.h"
#include "core/number_text.h"

namespace gridbay {

Result<const QunItem*> itemTypeOfText(std::string_view text, std::string_view where) {
  if (!text.empty() && text.find_first_not_of("0123456789") == text.npos) {
    const QunItem* byCode = qunFindItem(int32OfText(text).value_or(0));
    if (byCode != nullptr) return byCode;
    return Failure{fmt::format("There is no item type {}; {}", text, where)};
  }
  const std::string wanted = lowered(text);
  std::vector<std::string_view> names;
  std::vector<const QunItem*> beginSo;
  for (const QunItem& quantity : qunItems()) {
    const std::string name = lowered(quantity.name);
    if (name == wanted) return &quantity;
    if (name.starts_with(wanted)) beginSo.push_back(&quantity);
    names.push_back(quantity.name);
  }
  if (beginSo.size() == 1) return beginSo.front();
  if (!wanted.empty() && !beginSo.empty()) {
    std::string list;
    for (const QunItem* quantity : beginSo)
      list += fmt::format("{}\"{}\"", list.empty() ? "" : ", ", quantity->name);
    return Failure{fmt::format("Several item types begin with \"{}\": {}", text, list)};
  }
  const std::string_view nearest = nearestOf(text, names);
  return Failure{fmt::format("There is no item type \"{}\"; {}{}", text,
                             nearest.empty() ? "" : fmt::format("did you mean \"{}\"? ", nearest), where)};
}

}  // namespace gridbay
