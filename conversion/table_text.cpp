#include "conversion/table_text.h"

#include <iconv.h>

#include <algorithm>
#include <cerrno>
#include <optional>

namespace gridbay {
namespace {

constexpr std::string_view kMark = "\xef\xbb\xbf";
constexpr std::string_view kPlain = "UTF-8";

// By the C library; nothing where the bytes are not of that encoding.
std::optional<std::string> converted(std::string_view bytes, const char* encoding) {
  const iconv_t conversion = ::iconv_open("UTF-8", encoding);
  if (conversion == iconv_t(-1)) return std::nullopt;
  std::string text(bytes.size() + bytes.size() / 2 + 16, '\0');
  char* in = const_cast<char*>(bytes.data());  // which it only reads
  std::size_t inLeft = bytes.size();
  std::size_t done = 0;
  bool isGood = true;
  while (isGood && inLeft > 0) {
    char* out = text.data() + done;
    std::size_t outLeft = text.size() - done;
    const bool isWhole = ::iconv(conversion, &in, &inLeft, &out, &outLeft) != static_cast<std::size_t>(-1);
    done = text.size() - outLeft;
    isGood = isWhole || errno == E2BIG;
    if (isGood && !isWhole) text.resize(2 * text.size());
  }
  ::iconv_close(conversion);
  if (!isGood) return std::nullopt;
  text.resize(done);
  return text;
}

// Where every other byte of the beginning is zero, as of digits and separators.
const char* encodingOf(std::string_view bytes) {
  if (bytes.starts_with("\xff\xfe")) return "UTF-16LE";
  if (bytes.starts_with("\xfe\xff")) return "UTF-16BE";
  constexpr std::size_t kSample = 4096;
  std::size_t zeros[2] = {0, 0};
  const std::size_t size = std::min(bytes.size(), kSample) / 2 * 2;
  for (std::size_t i = 0; i < size; ++i) zeros[i % 2] += bytes[i] == '\0' ? 1 : 0;
  const std::size_t most = size / 4;  // a half of them
  if (zeros[0] == 0 && zeros[1] > most) return "UTF-16LE";
  if (zeros[1] == 0 && zeros[0] > most) return "UTF-16BE";
  return kPlain.data();
}

}  // namespace

Result<std::string> tableText(std::string_view bytes) {
  const char* encoding = encodingOf(bytes);
  const bool isPlain = encoding == kPlain && std::ranges::all_of(bytes, [](char c) {
                         return static_cast<unsigned char>(c) < 0x80;
                       });
  std::optional<std::string> text = isPlain ? std::optional(std::string(bytes)) : converted(bytes, encoding);
  if (!text && encoding == kPlain) text = converted(bytes, "WINDOWS-1252");
  if (!text || text->find('\0') != text->npos) return Failure{"it is no text"};
  if (text->starts_with(kMark)) text->erase(0, kMark.size());
  if (text->find('\n') == text->npos) std::ranges::replace(*text, '\r', '\n');
  return std::move(*text);
}

}  // namespace gridbay
