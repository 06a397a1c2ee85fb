#include "core/message.h"

#include <algorithm>
#include <map>

namespace gridbay {

std::string CValidationMessageBuffer::text() const {
  std::string joined;
  for (const std::string& line : lines_) joined += (joined.empty() ? "" : "\n") + line;
  return joined;
}

void showTogether(MessageHost& host, const std::vector<std::string>& texts) {
  if (texts.empty()) return;
  std::map<std::string_view, int> counts;
  std::vector<std::string_view> first;
  for (const std::string& text : texts) {
    if (++counts[text] == 1) first.push_back(text);
  }
  const bool areLines = std::ranges::none_of(
      first, [](std::string_view text) { return text.find('\n') != std::string_view::npos; });
  std::string list;
  for (const std::string_view text : first) {
    if (!list.empty()) list += areLines ? "\n" : "\n\n";
    list += text;
    if (const int count = counts[text]; count > 1) list += " (" + std::to_string(count) + " times)";
  }
  host.show(list);
}

}  // namespace gridbay
