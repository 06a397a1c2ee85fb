#include "core/kdl_writer.h"

#include <fmt/format.h>

#include <vector>

#include "core/kdl_characters.h"

namespace gridbay {
namespace {

constexpr std::size_t kIndent = 4;

// False when the text is not UTF-8.
bool appendQuoted(std::string& out, std::string_view text) {
  out.push_back('"');
  for (std::size_t i = 0; i < text.size();) {
    const char byte = text[i];
    if (byte >= 0x20 && byte != '"' && byte != '\\' && byte != 0x7F) {
      out.push_back(byte);
      ++i;
      continue;
    }
    const kdl::Character c = kdl::decode(text.substr(i));
    if (c.code == kdl::kNoCharacter) return false;
    switch (c.code) {
      case U'"':
        out += "\\\"";
        break;
      case U'\\':
        out += "\\\\";
        break;
      case U'\b':
        out += "\\b";
        break;
      case U'\f':
        out += "\\f";
        break;
      case U'\n':
        out += "\\n";
        break;
      case U'\r':
        out += "\\r";
        break;
      case U'\t':
        out += "\\t";
        break;
      default:
        if (kdl::isDisallowed(c.code) || kdl::isNewline(c.code)) {
          out += fmt::format("\\u{{{:x}}}", static_cast<std::uint32_t>(c.code));
        } else {
          out.append(text.substr(i, c.length));
        }
    }
    i += c.length;
  }
  out.push_back('"');
  return true;
}

bool appendName(std::string& out, std::string_view name) {
  if (!kdl::isBareWord(name)) return appendQuoted(out, name);
  out.append(name);
  return true;
}

bool appendValue(std::string& out, const Value& value) {
  const std::string_view text = value.text();
  switch (value.kind()) {
    case ValueKind::boolean:
      out.append("#").append(text);
      return true;
    case ValueKind::integer:
      out.append(text);
      return true;
    case ValueKind::real:
      if (text == "inf" || text == "-inf" || text == "nan") out.push_back('#');
      out.append(text);
      return true;
    case ValueKind::string:
      return appendQuoted(out, text);
    case ValueKind::fileName:
      out.append("(file)");
      return appendQuoted(out, text);
    case ValueKind::resultFileName:
      out.append("(result)");
      return appendQuoted(out, text);
  }
  return false;
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
  constexpr std::size_t kPiece = 1 << 14;
  std::string line;
  std::vector<const Node*> open{section.first()};
  for (;;) {
    const Node* node = open.back();
    if (node == nullptr) {
      open.pop_back();
      if (open.empty()) break;
      line.append((open.size() - 1) * kIndent, ' ').append("}\n");
      continue;
    }
    open.back() = node->next();
    line.append((open.size() - 1) * kIndent, ' ');
    bool good = appendName(line, node->name());
    if (node->isSection()) {
      const bool empty = node->first() == nullptr;
      line.append(empty ? " {}\n" : " {\n");
      if (!empty) open.push_back(node->first());
    } else {
      for (const Value& value : node->values()) {
        line.push_back(' ');
        good = appendValue(line, value) && good;
      }
      line.push_back('\n');
    }
    if (!good) return Failure{"a name or text of \"" + std::string(node->name()) + "\" is not UTF-8"};
    if (line.size() >= kPiece) {
      if (Outcome written = sink.write(line); !written) return written;
      line.clear();
    }
  }
  return sink.write(line);
}

Result<std::string> kdlText(const Node& section) {
  StringSink sink;
  if (Outcome written = writeKdl(section, sink); !written) return Failure{written.error()};
  return sink.take();
}

std::string valueText(const Value& value) {
  std::string text;
  appendValue(text, value);
  return text;
}

}  // namespace gridbay
