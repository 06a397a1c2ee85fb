#include "core/letters.h"

#include <algorithm>

namespace gridbay {
namespace {

constexpr std::size_t kLongestLetter = 4;
constexpr std::string_view kSeparators = " /\\,;";

bool continuesLetter(char byte) {
  return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80U;
}

// The bytes of the letter that a text, which is not empty, begins with.
std::size_t letterSize(std::string_view text) {
  std::size_t size = 1;
  const bool leads = (static_cast<unsigned char>(text[0]) & 0xC0U) == 0xC0U;
  while (leads && size < std::min(text.size(), kLongestLetter) && continuesLetter(text[size])) ++size;
  return size;
}

}  // namespace

std::size_t wholeLetters(std::string_view text, std::size_t most) {
  if (text.size() <= most) return text.size();
  // A letter that reaches across the limit begins no further back than its longest form.
  for (std::size_t start = most; start > 0 && most - start < kLongestLetter; --start) {
    if (continuesLetter(text[start])) continue;
    return start + letterSize(text.substr(start)) > most ? start : most;
  }
  return most;
}

std::string onLines(std::string_view text, std::size_t letters) {
  std::string lines;
  while (!text.empty()) {
    std::size_t end = 0;
    std::size_t separator = 0;  // the end of the last one in the second half
    for (std::size_t letter = 0; letter < letters && end < text.size(); ++letter) {
      end += letterSize(text.substr(end));
      if (letter >= letters / 2 && kSeparators.find(text[end - 1]) != std::string_view::npos) separator = end;
    }
    if (end < text.size() && separator > 0) end = separator;
    lines.append(lines.empty() ? "" : "\n").append(text.substr(0, end));
    text.remove_prefix(end);
  }
  return lines;
}

}  // namespace gridbay
