#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace gridbay::kdl {

inline constexpr char32_t kNoCharacter = 0xFFFFFFFF;

// The character at the start of `at` (which is not empty) and its length in bytes; kNoCharacter where the
// bytes are not UTF-8.
struct Character {
  char32_t code;
  std::size_t length;
};
Character decode(std::string_view at);
void appendUtf8(std::string& text, char32_t code);

// Characters that may not stand in a document at all, not even in strings and comments.
bool isDisallowed(char32_t code);
bool isUnicodeSpace(char32_t code);
bool isNewline(char32_t code);

// The offset of the first byte that may not stand in a document, or npos.
std::size_t firstBadByte(std::string_view text);

// Whether a byte below 0x80 can stand in a bare word; from 0x80 on the character decides.
inline bool isWordByte(unsigned char byte) {
  static constexpr std::array<bool, 256> kWordBytes = [] {
    std::array<bool, 256> table{};
    for (std::size_t code = 0x21; code < 0x7F; ++code) table[code] = true;
    for (const char c : {'\\', '/', '(', ')', '{', '}', ';', '[', ']', '"', '#', '='})
      table[static_cast<unsigned char>(c)] = false;
    return table;
  }();
  return kWordBytes[byte];
}

// Whether a text can be written without quotes.
bool isBareWord(std::string_view text);
// Whether a bare word is one of those that a reader takes for a slip: true, false, null, inf, -inf, nan.
bool isKeywordWithoutHash(std::string_view word);

}  // namespace gridbay::kdl
