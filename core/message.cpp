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
  if (texts.size() == 1) host.show(texts.front());
  if (texts.size() <= 1) return;
  std::map<std::string, int> counts;
  std::vector<std::string> lines;
  for (std::string line : texts) {
    std::ranges::replace(line, '\n', ' ');
    if (++counts[line] == 1) lines.push_back(std::move(line));
  }
  std::string list;
  for (const std::string& line : lines) {
    const int count = counts[line];
    list += (list.empty() ? "" : "\n") + line;
    if (count > 1) list += " (" + std::to_string(count) + " times)";
  }
  host.show(list);
}

}  // namespace gridbay
