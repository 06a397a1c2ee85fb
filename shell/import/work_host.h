#pragma once

#include <algorithm>
#include <chrono>
#include <cstddef>
#include <string>
#include <string_view>

#include "conversion/conversion_host.h"
#include "platform/work_apart.h"

namespace gridbay::shell {

// A conversion in a copy of this process: tells how far it is, not too often.
class WorkHost : public ConversionHost {
 public:
  explicit WorkHost(const WorkApart::Progress& progress) : progress_(progress) {}

  bool reached(std::size_t done, std::size_t total) override {
    using namespace std::chrono_literals;
    const auto now = std::chrono::steady_clock::now();
    if (now - told_ < 5ms && done < total) return true;
    told_ = now;
    return progress_(static_cast<double>(done) / static_cast<double>(std::max<std::size_t>(total, 1)));
  }
  std::string option(std::string_view name, std::string_view) const override { return std::string(name); }
  std::string itemTypeList() const override { return "the list of \"Item type\" has all"; }

 private:
  const WorkApart::Progress& progress_;
  std::chrono::steady_clock::time_point told_;
};

}  // namespace gridbay::shell
