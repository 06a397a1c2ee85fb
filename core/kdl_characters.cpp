#include "core/kdl_characters.h"

#include <algorithm>
#include <array>

namespace gridbay::kdl {
namespace {

bool isPlainByte(unsigned char byte) {
  return (byte >= 0x20 && byte < 0x7F) || (byte >= '\t' && byte <= '\r');
}

// The bytes of a block that need a closer look: none in nearly every block of a real file.
bool isPlainBlock(const char* at, std::size_t size) {
  unsigned odd = 0;
  for (std::size_t i = 0; i < size; ++i) {
    const auto byte = static_cast<unsigned char>(at[i]);
    odd |= static_cast<unsigned>((byte < 0x20) & ((byte < '\t') | (byte > '\r'))) |
           static_cast<unsigned>(byte >= 0x7F);
  }
  return odd == 0;
}

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}

}  // namespace

Character decode(std::string_view at) {
  const auto byte = [at](std::size_t i) { return static_cast<unsigned char>(at[i]); };
  const auto follows = [&](std::size_t i) { return i < at.size() && (byte(i) & 0xC0U) == 0x80U; };
  const auto tail = [&](std::size_t i) { return static_cast<char32_t>(byte(i) & 0x3FU); };
  const char32_t first = byte(0);
  if (first < 0x80) return {first, 1};
  if (first >= 0xC2 && first < 0xE0 && follows(1)) return {(first & 0x1FU) << 6 | tail(1), 2};
  if (first >= 0xE0 && first < 0xF0 && follows(1) && follows(2)) {
    const char32_t code = (first & 0x0FU) << 12 | tail(1) << 6 | tail(2);
    if (code >= 0x800 && (code < 0xD800 || code > 0xDFFF)) return {code, 3};
  }
  if (first >= 0xF0 && first < 0xF5 && follows(1) && follows(2) && follows(3)) {
    const char32_t code = (first & 0x07U) << 18 | tail(1) << 12 | tail(2) << 6 | tail(3);
    if (code >= 0x10000 && code <= 0x10FFFF) return {code, 4};
  }
  return {kNoCharacter, 1};
}

void appendUtf8(std::string& text, char32_t code) {
  const auto put = [&text](char32_t byte) { text.push_back(static_cast<char>(byte)); };
  if (code < 0x80) {
    put(code);
  } else if (code < 0x800) {
    put(0xC0 | code >> 6);
    put(0x80 | (code & 0x3F));
  } else if (code < 0x10000) {
    put(0xE0 | code >> 12);
    put(0x80 | (code >> 6 & 0x3F));
    put(0x80 | (code & 0x3F));
  } else {
    put(0xF0 | code >> 18);
    put(0x80 | (code >> 12 & 0x3F));
    put(0x80 | (code >> 6 & 0x3F));
    put(0x80 | (code & 0x3F));
  }
}

bool isDisallowed(char32_t code) {
  return code < 0x09 || (code >= 0x0E && code < 0x20) || code == 0x7F || (code >= 0xD800 && code <= 0xDFFF) ||
         code == 0x200E || code == 0x200F || (code >= 0x202A && code <= 0x202E) ||
         (code >= 0x2066 && code <= 0x2069) || code == 0xFEFF || code > 0x10FFFF;
}

bool isUnicodeSpace(char32_t code) {
  return code == 0x09 || code == 0x20 || code == 0xA0 || code == 0x1680 ||
         (code >= 0x2000 && code <= 0x200A) || code == 0x202F || code == 0x205F || code == 0x3000;
}

bool isNewline(char32_t code) {
  return (code >= 0x0A && code <= 0x0D) || code == 0x85 || code == 0x2028 || code == 0x2029;
}

std::size_t firstBadByte(std::string_view text) {
  constexpr std::size_t kBlock = 64;
  std::size_t at = 0;
  while (at < text.size()) {
    const std::size_t size = std::min(kBlock, text.size() - at);
    if (isPlainBlock(text.data() + at, size)) {
      at += size;
      continue;
    }
    for (const std::size_t end = at + size; at < end;) {
      if (isPlainByte(static_cast<unsigned char>(text[at]))) {
        ++at;
        continue;
      }
      const Character c = decode(text.substr(at));
      if (c.code == kNoCharacter || isDisallowed(c.code)) return at;
      at += c.length;
    }
  }
  return std::string_view::npos;
}

bool isKeywordWithoutHash(std::string_view word) {
  constexpr std::size_t kLongest = 5;
  constexpr std::array<std::string_view, 6> kWords{"true", "false", "null", "inf", "-inf", "nan"};
  return word.size() <= kLongest && std::ranges::find(kWords, word) != kWords.end();
}

bool isBareWord(std::string_view text) {
  if (text.empty() || isKeywordWithoutHash(text)) return false;
  std::string_view rest = text;
  if (rest.front() == '+' || rest.front() == '-') rest.remove_prefix(1);
  if (!rest.empty() && rest.front() == '.') rest.remove_prefix(1);
  if (!rest.empty() && isDigit(rest.front())) return false;
  for (std::size_t at = 0; at < text.size();) {
    const auto byte = static_cast<unsigned char>(text[at]);
    if (byte < 0x80) {
      if (!isWordByte(byte)) return false;
      ++at;
      continue;
    }
    const Character c = decode(text.substr(at));
    if (c.code == kNoCharacter || isUnicodeSpace(c.code) || isNewline(c.code) || isDisallowed(c.code))
      return false;
    at += c.length;
  }
  return true;
}

}  // namespace gridbay::kdl
