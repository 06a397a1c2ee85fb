#include "conversion/history.h"

#include <fmt/chrono.h>

#include <ctime>

namespace gridbay {

std::string historyWith(const std::string& before, const std::string& how) {
  return fmt::format("{}{}{:%Y-%m-%dT%H:%M:%SZ}: {}", before, before.empty() ? "" : "\n",
                     fmt::gmtime(std::time(nullptr)), how);
}

}  // namespace gridbay
