#include "core/kdl_writer.h"

#include <fmt/format.h>

#include <vector>

#include "core/kdl_characters.h"

namespace gridbay {
namespace {

constexpr std::size_t kIndent = 4;

void putEscaped(TextOutput& out, kdl::Character c, std::string_view bytes) {
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
bool putQuoted(TextOutput& out, std::string_view text) {
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

bool putName(TextOutput& out, std::string_view name) {
  if (!isPlainName(name)) return putQuoted(out, name);
  out.put(name);
  return true;
}

bool putValue(TextOutput& out, ValueKind kind, std::string_view text) {
  switch (kind) {
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

}  // namespace

void KdlWriter::open(std::string_view section) {
  startLine(section);
  out_.put(" {");
  end_ = End::opening;
  ++depth_;
}

void KdlWriter::close() {
  if (depth_ == 0) return;
  --depth_;
  if (end_ != End::opening) {
    if (end_ == End::keyword) out_.put('\n');
    out_.blanks(depth_ * kIndent);
  }
  out_.put("}\n");
  end_ = End::line;
}

void KdlWriter::startKeyword(std::string_view name) {
  startLine(name);
  keyword_ = name;
  end_ = End::keyword;
}

void KdlWriter::add(ValueKind kind, std::string_view text) {
  if (end_ == End::keyword) addValue(keyword_, kind, text);
}

void KdlWriter::put(std::string_view name, ValueKind kind, std::string_view text) {
  startLine(name);
  addValue(name, kind, text);
  out_.put('\n');
  end_ = End::line;
}

Outcome KdlWriter::finish() {
  out_.put(closing());
  end_ = End::line;
  depth_ = 0;
  return flush();
}

Outcome KdlWriter::flush() {
  out_.flush();
  return outcome_ ? out_.outcome() : outcome_;
}

std::string KdlWriter::closing() const {
  std::string text = end_ == End::keyword ? "\n" : "";
  for (std::size_t depth = depth_; depth > 0; --depth) {
    if (end_ != End::opening || depth < depth_) text.append((depth - 1) * kIndent, ' ');
    text += "}\n";
  }
  return text;
}

void KdlWriter::startLine(std::string_view name) {
  if (end_ != End::line) out_.put('\n');
  out_.blanks(depth_ * kIndent);
  check(putName(out_, name), name);
}

void KdlWriter::addValue(std::string_view keyword, ValueKind kind, std::string_view text) {
  out_.put(' ');
  check(putValue(out_, kind, text), keyword);
}

void KdlWriter::check(bool isUtf8, std::string_view name) {
  if (isUtf8 || !outcome_) return;
  outcome_ = Failure{"a name or text of \"" + std::string(name) + "\" is not UTF-8"};
}

void writeKdl(const Node& section, KdlWriter& writer) {
  std::vector<const Node*> open{section.first()};
  while (true) {
    const Node* node = open.back();
    if (node == nullptr) {
      open.pop_back();
      if (open.empty()) return;
      writer.close();
      continue;
    }
    open.back() = node->next();
    if (node->isSection()) {
      writer.open(node->name());
      open.push_back(node->first());
    } else if (node->values().size() == 1) {
      writer.put(node->name(), node->values().front().kind(), node->values().front().text());
    } else {
      writer.startKeyword(node->name());
      for (const Value& value : node->values()) writer.add(value.kind(), value.text());
    }
  }
}

Outcome writeKdl(const Node& section, TextSink& sink) {
  KdlWriter writer(sink);
  writeKdl(section, writer);
  return writer.finish();
}

Result<std::string> kdlText(const Node& section) {
  StringSink sink;
  if (Outcome written = writeKdl(section, sink); !written) return Failure{written.error()};
  return sink.take();
}

std::string valueText(const Value& value) {
  StringSink sink;
  TextOutput out(sink);
  putValue(out, value.kind(), value.text());
  out.flush();
  return sink.take();
}

}  // namespace gridbay
