#include "core/nearest.h"

#include <algorithm>
#include <cctype>
#include <numeric>
#include <vector>

namespace gridbay {

std::size_t slipsBetween(std::string_view a, std::string_view b) {
  std::vector<std::size_t> row(b.size() + 1);
  std::iota(row.begin(), row.end(), std::size_t{0});
  for (std::size_t i = 0; i < a.size(); ++i) {
    std::size_t diagonal = row[0]++;
    for (std::size_t j = 0; j < b.size(); ++j) {
      const std::size_t change = diagonal + (a[i] == b[j] ? 0 : 1);
      diagonal = row[j + 1];
      row[j + 1] = std::min({change, row[j] + 1, diagonal + 1});
    }
  }
  return row.back();
}

std::string lowered(std::string_view text) {
  std::string small(text);
  std::ranges::transform(small, small.begin(),
                         [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
  return small;
}

std::string_view nearestOf(std::string_view wanted, std::span<const std::string_view> candidates) {
  const std::string small = lowered(wanted);
  std::string_view nearest;
  std::size_t least = std::max<std::size_t>(small.size() / 2, 2) + 1;
  for (const std::string_view candidate : candidates) {
    const std::size_t slips = slipsBetween(lowered(candidate), small);
    if (slips < least) {
      least = slips;
      nearest = candidate;
    }
  }
  return nearest;
}

}  // namespace gridbay
