#include "cli/console_conversion.h"

#include <fmt/format.h>

#include "cli/commands.h"

namespace gridbay::cli {

bool ConsoleConversion::reached(std::size_t done, std::size_t total) {
  if (!progress_) progress_.emplace(console_, "Converting", total);
  progress_->reached(done);
  if (done == total) progress_.reset();
  return true;
}

std::string ConsoleConversion::option(std::string_view name, std::string_view placeholder) const {
  return fmt::format("--{}{}{}", name, placeholder.empty() ? "" : " ", placeholder);
}

std::string ConsoleConversion::itemTypeList() const {
  return fmt::format("\"{} convert types\" lists them", toolName());
}

}  // namespace gridbay::cli
