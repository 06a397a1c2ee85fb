#include "core/message.h"

namespace gridbay {

std::string CValidationMessageBuffer::text() const {
  std::string joined;
  for (const std::string& line : lines_) joined += (joined.empty() ? "" : "\n") + line;
  return joined;
}

}  // namespace gridbay
