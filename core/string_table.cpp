#include "core/string_table.h"

#include <fmt/args.h>
#include <fmt/printf.h>

namespace gridbay {

std::string formattedText(std::string_view format, std::initializer_list<TextArgument> arguments) {
  fmt::dynamic_format_arg_store<fmt::printf_context> store;
  for (const TextArgument& argument : arguments) {
    std::visit([&store](const auto& value) { store.push_back(value); }, argument.value());
  }
  return fmt::vsprintf(fmt::string_view(format.data(), format.size()), store);
}

}  // namespace gridbay
