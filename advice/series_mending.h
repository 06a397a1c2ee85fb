#pragma once

#include <cstddef>
#include <optional>
#include <span>

#include "platform/tsb/tsb_types.h"

namespace gridbay {

bool isMissing(double value, const TsbItem& item);

// Puts each run of missing values on the line between the values around it, at the ends on the one beside
// it; directions go by the shorter arc. False, with nothing changed, where there is no value at all.
bool fillGaps(std::span<double> values, const TsbItem& item, const TsbTimeAxis& time);

// The place of a value that lies very much further from all others than these do from each other; nothing for
// a short series, or one that is constant but for it.
std::optional<std::size_t> valueApart(std::span<const double> values);

// Two values that follow each other and lie far apart for values that go on smoothly.
struct SeriesJump {
  std::size_t step = 0;  // of the later one
  double before = 0, after = 0;
};

// The greatest jump of a series with no gaps; nothing where all of it goes on smoothly.
std::optional<SeriesJump> greatestJump(std::span<const double> values);

// Takes all jumps out: a few values that stand apart come to lie on the line between their neighbours, and
// where the series stays at the other value the way there is spread over several steps. Returns how many
// values are others then.
std::size_t takeOutJumps(std::span<double> values);

}  // namespace gridbay
