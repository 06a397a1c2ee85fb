#include "core/grid_point.h"

#include <fmt/format.h>

#include <charconv>

namespace gridbay {
namespace {

class Scanner {
 public:
  explicit Scanner(std::string_view text) : rest_(text) {}

  bool take(char c) {
    skipBlanks();
    if (!rest_.starts_with(c)) return false;
    rest_.remove_prefix(1);
    return true;
  }
  bool take(std::int32_t& number) {
    skipBlanks();
    const auto [end, error] = std::from_chars(rest_.data(), rest_.data() + rest_.size(), number);
    if (error != std::errc()) return false;
    rest_.remove_prefix(static_cast<std::size_t>(end - rest_.data()));
    return true;
  }
  bool atEnd() {
    skipBlanks();
    return rest_.empty();
  }

 private:
  void skipBlanks() {
    while (rest_.starts_with(' ') || rest_.starts_with('\t')) rest_.remove_prefix(1);
  }

  std::string_view rest_;
};

}  // namespace

std::string pointText(GridPoint point) {
  return fmt::format("({},{})", point.j, point.k);
}

std::optional<GridPoint> pointOfText(std::string_view text) {
  Scanner scanner(text);
  GridPoint point;
  const bool bracket = scanner.take('(');
  if (!scanner.take(point.j) || !scanner.take(',') || !scanner.take(point.k)) return std::nullopt;
  if (bracket && !scanner.take(')')) return std::nullopt;
  return scanner.atEnd() ? std::optional(point) : std::nullopt;
}

}  // namespace gridbay
