#include "advice/run_steps.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <string>
#include <string_view>

#include "core/letters.h"
#include "core/parameter_tree.h"

namespace gridbay {

int runStepsIn(const Node& keyword) {
  constexpr std::array<std::string_view, 9> kSteps{
      "First_Time_Step",        "Last_Time_Step",           "Start_Time_Step",
      "End_Time_Step",          "Warm_Up_Period",           "Start_AD_at_HD_Time_Step",
      "End_AD_at_HD_Time_Step", "Start_MT_at_HD_Time_Step", "End_MT_at_HD_Time_Step"};
  const auto isOf = [&](std::size_t count) {
    return keyword.values().size() == count && std::ranges::all_of(keyword.values(), [](const Value& value) {
             return value.kind() == ValueKind::integer;
           });
  };
  if (isOf(3) && sameName("TRange", keyword.name())) return 2;
  const auto isNamed = [&](std::string_view name) { return sameName(name, keyword.name()); };
  return isOf(1) && std::ranges::any_of(kSteps, isNamed) ? 1 : 0;
}

long long wholeOf(const Value& value) {
  return std::atoll(std::string(value.text()).c_str());
}

}  // namespace gridbay
