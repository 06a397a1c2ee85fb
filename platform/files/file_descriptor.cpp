#include "platform/files/file_descriptor.h"

#include <cerrno>
#include <system_error>

namespace gridbay {

std::string systemError(std::string_view what, std::string_view path) {
  const int code = errno;
  std::string text(what);
  text.append(" \"").append(path).append("\": ").append(std::generic_category().message(code));
  return text;
}

}  // namespace gridbay
