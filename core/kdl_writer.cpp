#include "core/kdl_writer.h"

#include <fmt/format.h>

#include <cstring>
#include <memory>
#include <vector>

#include "core/kdl_characters.h"

namespace gridbay {
namespace {

constexpr std::size_t kIndent = 4;

// The text on its way to the sink, in pieces of a size that suits a file.
class Output {
 public:
  explicit Output(TextSink& sink) : sink_(sink), piece_(std::make_unique_for_overwrite<char[]>(kPiece)) {}

  void put(char c) {
    if (size_ == kPiece) flush();
    piece_[size_++] = c;
  }
  void put(std::string_view text) {
    if (text.size() > kPiece - size_) flush();
    if (text.size() > kPiece) {
      take(text);
      return;
    }
    copy(piece_.get() + size_, text);
    size_ += text.size();
  }
  void indent(std::size_t depth) {
    const std::size_t blanks = depth * kIndent;
    if (blanks > kPiece - size_) flush();
    std::memset(piece_.get() + size_, ' ', blanks);
    size_ += blanks;
  }
  // What went wrong first, if anything did.
  Outcome finish() {
    flush();
    return std::move(outcome_);
  }
  bool failed() const { return !outcome_; }

 private:
  // Nearly all texts are a few bytes long: two moves that overlap take less time than a call.
  static void copy(char* to, std::string_view text) {
    const std::size_t n = text.size();
    if (n > 16) {
      std::memcpy(to, text.data(), n);
    } else if (n >= 8) {
      copyEnds<8>(to, text);
    } else if (n >= 4) {
      copyEnds<4>(to, text);
    } else if (n > 0) {
      to[0] = text[0];
      to[n / 2] = text[n / 2];
      to[n - 1] = text[n - 1];
    }
  }
  template <std::size_t size>
  static void copyEnds(char* to, std::string_view text) {
    char head[size];
    char tail[size];
    std::memcpy(head, text.data(), size);
    std::memcpy(tail, text.data() + text.size() - size, size);
    std::memcpy(to, head, size);
    std::memcpy(to + text.size() - size, tail, size);
  }

  // Holds the deepest indent.
  static constexpr std::size_t kPiece = 1 << 15;

  void flush() {
    take({piece_.get(), size_});
    size_ = 0;
  }
  void take(std::string_view text) {
    if (outcome_) outcome_ = sink_.write(text);
  }

  TextSink& sink_;
  std::unique_ptr<char[]> piece_;
  std::size_t size_ = 0;
  Outcome outcome_;
};

void putEscaped(Output& out, kdl::Character c, std::string_view bytes) {
  switch (c.code) {
    case U'"':
      out.put("\\\"");
      break;
    case U'\\':
      out.put("\\\\");
      break;
    case U'\b':
      out.put("\\b");
      break;
    case U'\f':
      out.put("\\f");
      break;
    case U'\n':
      out.put("\\n");
      break;
    case U'\r':
      out.put("\\r");
      break;
    case U'\t':
      out.put("\\t");
      break;
    default:
      if (kdl::isDisallowed(c.code) || kdl::isNewline(c.code)) {
        out.put(fmt::format("\\u{{{:x}}}", static_cast<std::uint32_t>(c.code)));
      } else {
        out.put(bytes);
      }
  }
}

// False when the text is not UTF-8.
bool putQuoted(Output& out, std::string_view text) {
  out.put('"');
  for (std::size_t i = 0; i < text.size();) {
    std::size_t plain = i;
    const auto isPlain = [](char c) { return c >= 0x20 && c != '"' && c != '\\' && c != 0x7F; };
    while (plain < text.size() && isPlain(text[plain])) ++plain;
    out.put(text.substr(i, plain - i));
    i = plain;
    if (i == text.size()) break;
    const kdl::Character c = kdl::decode(text.substr(i));
    if (c.code == kdl::kNoCharacter) return false;
    putEscaped(out, c, text.substr(i, c.length));
    i += c.length;
  }
  out.put('"');
  return true;
}

// The names that a setup has, letters and digits and so on in ASCII, without the rarer rules.
bool isPlainName(std::string_view name) {
  constexpr std::size_t kLongestReserved = 5;
  if (name.size() <= kLongestReserved) return kdl::isBareWord(name);
  const auto first = static_cast<unsigned char>(name.front() | 0x20);
  if (first < 'a' || first > 'z') return kdl::isBareWord(name);
  for (const char c : name) {
    if (!kdl::isWordByte(static_cast<unsigned char>(c))) return kdl::isBareWord(name);
  }
  return true;
}

bool putName(Output& out, std::string_view name) {
  if (!isPlainName(name)) return putQuoted(out, name);
  out.put(name);
  return true;
}

bool putValue(Output& out, const Value& value) {
  const std::string_view text = value.text();
  switch (value.kind()) {
    case ValueKind::boolean:
      out.put('#');
      break;
    case ValueKind::integer:
      break;
    case ValueKind::real:
      if (text.back() == 'f' || text.back() == 'n') out.put('#');  // inf, -inf, nan
      break;
    case ValueKind::string:
      return putQuoted(out, text);
    case ValueKind::fileName:
      out.put("(file)");
      return putQuoted(out, text);
    case ValueKind::resultFileName:
      out.put("(result)");
      return putQuoted(out, text);
  }
  out.put(text);
  return true;
}

class StringSink : public TextSink {
 public:
  Outcome write(std::string_view text) override {
    text_.append(text);
    return {};
  }
  std::string take() { return std::move(text_); }

 private:
  std::string text_;
};

}  // namespace

Outcome writeKdl(const Node& section, TextSink& sink) {
  Output out(sink);
  std::vector<const Node*> open{section.first()};
  while (!out.failed()) {
    const Node* node = open.back();
    if (node == nullptr) {
      open.pop_back();
      if (open.empty()) break;
      out.indent(open.size() - 1);
      out.put("}\n");
      continue;
    }
    open.back() = node->next();
    out.indent(open.size() - 1);
    bool good = putName(out, node->name());
    if (node->isSection()) {
      const bool empty = node->first() == nullptr;
      out.put(empty ? " {}\n" : " {\n");
      if (!empty) open.push_back(node->first());
    } else {
      for (const Value& value : node->values()) {
        out.put(' ');
        good = putValue(out, value) && good;
      }
      out.put('\n');
    }
    if (!good) return Failure{"a name or text of \"" + std::string(node->name()) + "\" is not UTF-8"};
  }
  return out.finish();
}

Result<std::string> kdlText(const Node& section) {
  StringSink sink;
  if (Outcome written = writeKdl(section, sink); !written) return Failure{written.error()};
  return sink.take();
}

std::string valueText(const Value& value) {
  StringSink sink;
  Output out(sink);
  putValue(out, value);
  // A sink in memory takes everything.
  static_cast<void>(static_cast<bool>(out.finish()));
  return sink.take();
}

}  // namespace gridbay
