#include "conversion/moments.h"

#include <fmt/format.h>

#include <cmath>

#include "core/date_time.h"
#include "platform/units/units.h"

namespace gridbay {

std::string momentText(const TsbTimeAxis& axis, std::size_t step) {
  if (!axis.isCalendar()) return fmt::format("{:.10g} {}", axis.at(step), axis.unit);
  constexpr double kSecondsPerDay = 86400;
  constexpr double kThousandths = 1000;
  const double thousandths =
      std::round(CVdUnitConverter(axis.unit, "s").Convert(axis.at(step)) * kThousandths);
  const double seconds = std::floor(thousandths / kThousandths);
  const DateTime moment = DateTime::of(axis.start).plusDays(seconds / kSecondsPerDay);
  if (!moment.parts()) return {};
  const double rest = thousandths - seconds * kThousandths;
  std::string text = dateTimeText(moment);
  if (rest > 0) {
    text += fmt::format(".{:03.0f}", rest);
    text.erase(text.find_last_not_of('0') + 1);
  }
  return text;
}

}  // namespace gridbay
