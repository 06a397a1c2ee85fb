#include "core/kdl_reader.h"

#include <charconv>
#include <limits>
#include <utility>
#include <vector>

#include "core/kdl_characters.h"

namespace gridbay {
namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

// Where the reader gave up; it never leaves this file.
struct Fault {
  const char* at;
  std::string expected;
  std::string found;
};

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}
bool isDigitOr_(char c) {
  return isDigit(c) || c == '_';
}

int digitValue(char c) {
  if (isDigit(c)) return c - '0';
  const char small = static_cast<char>(c | 0x20);
  return small >= 'a' && small <= 'f' ? small - 'a' + 10 : 99;
}

class Reader {
 public:
  Reader(ParameterTree& tree, std::string_view text)
      : tree_(tree), at_(text.data()), end_(at_ + text.size()) {}

  void read() {
    open_.push_back({.section = &tree_.root()});
    for (;;) {
      while (*at_ == ' ' || *at_ == '\n') ++at_;
      if (readPlainNode()) continue;
      skipLineSpace();
      if (at_ == end_) break;
      if (*at_ == '}') {
        if (open_.size() == 1) fail("a section or keyword; no block is open here");
        ++at_;
        NodeState owner = open_.back().owner;
        open_.pop_back();
        owner.hasAnyBlock = true;
        readRest(owner);
      } else {
        readNode();
      }
    }
    if (open_.size() > 1) {
      fail("\"}\" to close the block of \"" + std::string(open_.back().owner.name) + "\"");
    }
  }

  const char* at() const { return at_; }

 private:
  // A value as it is read.
  struct Read {
    ValueKind kind;
    std::string_view text;
  };
  // A node while it is being read.
  struct NodeState {
    std::string_view name;
    bool keep = true;          // false where a slashdash comments it out
    bool hasBlock = false;     // a block that counts
    bool hasAnyBlock = false;  // after any block no values may come
  };
  // A block while it is being read.
  struct Block {
    NodeState owner = {};
    Node* section = nullptr;
    Node* last = nullptr;
    bool keep = true;
  };

  [[noreturn]] void fail(std::string expected) const { failAt(at_, std::move(expected)); }
  [[noreturn]] static void failAt(const char* at, std::string expected, std::string found = {}) {
    throw Fault{at, std::move(expected), std::move(found)};
  }

  std::string_view rest() const { return {at_, static_cast<std::size_t>(end_ - at_)}; }
  bool startsWith(std::string_view text) const { return rest().starts_with(text); }

  std::size_t newlineLength() const {
    const auto byte = static_cast<unsigned char>(*at_);
    if (byte == '\r') return at_[1] == '\n' ? 2 : 1;
    if (byte >= '\n' && byte < '\r') return 1;
    return byte >= 0x80 ? wideLength(kdl::isNewline) : 0;
  }
  std::size_t spaceLength() const {
    const auto byte = static_cast<unsigned char>(*at_);
    if (byte == ' ' || byte == '\t') return 1;
    return byte >= 0x80 ? wideLength(kdl::isUnicodeSpace) : 0;
  }
  std::size_t wideLength(bool (*is)(char32_t)) const {
    const kdl::Character c = kdl::decode(rest());
    return is(c.code) ? c.length : 0;
  }

  void skipToLineEnd() {
    while (at_ != end_ && newlineLength() == 0) ++at_;
  }

  void skipBlockComment() {
    const char* start = at_;
    std::size_t depth = 0;
    do {
      if (at_ == end_) failAt(start, "\"*/\" to end this comment", "the end of the file");
      if (startsWith("/*")) {
        ++depth;
        at_ += 2;
      } else if (startsWith("*/")) {
        --depth;
        at_ += 2;
      } else {
        ++at_;
      }
    } while (depth > 0);
  }

  bool skipSpace() {
    const char* start = at_;
    for (;;) {
      if (const std::size_t n = spaceLength(); n > 0) {
        at_ += n;
      } else if (*at_ == '/' && at_[1] == '*') {
        skipBlockComment();
      } else {
        return at_ != start;
      }
    }
  }

  bool skipNodeSpace() {
    const char* start = at_;
    for (;;) {
      skipSpace();
      if (*at_ != '\\') return at_ != start;
      ++at_;
      skipSpace();
      if (startsWith("//")) skipToLineEnd();
      if (at_ == end_) continue;
      const std::size_t n = newlineLength();
      if (n == 0) fail("the end of the line after \"\\\"");
      at_ += n;
    }
  }

  void skipLineSpace() {
    for (;;) {
      if (const std::size_t n = newlineLength(); n > 0) {
        at_ += n;
      } else if (*at_ == '/' && at_[1] == '/') {
        skipToLineEnd();
      } else if (!skipNodeSpace()) {
        return;
      }
    }
  }

  bool skipSlashdash() {
    if (*at_ != '/' || at_[1] != '-') return false;
    at_ += 2;
    skipLineSpace();
    return true;
  }

  // What nearly all of a large file consists of: a bare name and then a block or one decimal number, to the
  // end of the line; or the end of such a block. Whatever is not just so is left for the rules below, which
  // begin at the same place.
  bool readPlainNode() {
    if (!open_.back().keep) return false;
    if (*at_ == '}') return closePlainBlock();
    const char* at = at_;
    if (!kdl::isWordByte(static_cast<unsigned char>(*at)) || isDigit(*at) || *at == '-' || *at == '+' ||
        *at == '.')
      return false;
    while (kdl::isWordByte(static_cast<unsigned char>(*at))) ++at;
    const std::string_view name(at_, static_cast<std::size_t>(at - at_));
    if (*at != ' ' || kdl::isKeywordWithoutHash(name)) return false;
    const char* start = ++at;
    if (*at == '{' && at[1] == '\n') {
      values_.clear();
      at_ = at;
      openBlock({.name = name}, false);
      return true;
    }
    if (*at == '-') ++at;
    ValueKind kind = ValueKind::integer;
    const auto skipDigits = [&at] {
      const char* first = at;
      while (isDigit(*at)) ++at;
      return at != first;
    };
    if (!skipDigits()) return false;
    if (*at == '.') {
      ++at;
      kind = ValueKind::real;
      if (!skipDigits()) return false;
    }
    if (*at == 'e' || *at == 'E') {
      ++at;
      kind = ValueKind::real;
      if (*at == '+' || *at == '-') ++at;
      if (!skipDigits()) return false;
    }
    if (*at != '\n') return false;
    append(*tree_.makeKeyword(name, tree_.makeValue(kind, {start, static_cast<std::size_t>(at - start)})));
    at_ = at + 1;
    return true;
  }

  bool closePlainBlock() {
    if (at_[1] != '\n' || open_.size() == 1) return false;
    at_ += 2;
    open_.pop_back();
    return true;
  }

  void readNode() {
    NodeState node;
    node.keep = !skipSlashdash() && open_.back().keep;
    const char* start = at_;
    if (*at_ == '(') {
      readAnnotation();
      if (node.keep)
        failAt(start, "a section or keyword", "a type annotation, which a name here cannot have");
    }
    if (isDigit(*at_)) fail("a name; a name that begins with a digit stands in quotes");
    node.name = readString("a section or keyword");
    if (node.keep) values_.clear();
    readRest(node);
  }

  // What follows a node's name, or one of its blocks, up to its end or the start of a block.
  void readRest(NodeState& node) {
    for (;;) {
      const bool spaced = skipNodeSpace();
      if (at_ == end_ || *at_ == '}' || newlineLength() > 0 || (*at_ == '/' && at_[1] == '/'))
        return finish(node);
      if (*at_ == ';') {
        ++at_;
        return finish(node);
      }
      const bool dropped = skipSlashdash();
      if (*at_ == '{') return openBlock(node, dropped);
      if (node.hasAnyBlock) fail("the end of the line, \";\" or \"}\" after a block");
      if (!spaced && !dropped) fail("a space, the end of the line, \";\" or \"{\"");
      readEntry(node.keep && !dropped);
    }
  }

  void openBlock(NodeState node, bool dropped) {
    if (node.hasBlock && !dropped) fail("the end of the line: a section has one block");
    const bool keep = node.keep && !dropped;
    if (keep && !values_.empty()) {
      fail("the end of the line: \"" + std::string(node.name) +
           "\" has values, and so it cannot have a block");
    }
    if (open_.size() > kDeepestBlock) {
      failAt(at_, "no more than " + std::to_string(kDeepestBlock) + " blocks inside each other",
             "another block");
    }
    ++at_;
    node.hasBlock = node.hasBlock || !dropped;
    Node* section = nullptr;
    if (keep) {
      section = tree_.makeSection(node.name);
      append(*section);
    }
    open_.push_back({.owner = node, .section = section, .keep = keep});
  }

  void finish(const NodeState& node) {
    if (!node.keep || node.hasBlock) return;
    append(*tree_.makeKeyword(node.name, values_));
  }

  void append(Node& node) {
    Block& block = open_.back();
    ParameterTree::append(*block.section, block.last, node);
    block.last = &node;
  }

  void readEntry(bool keep) {
    const char* start = at_;
    if (*at_ == '(') {
      const std::string_view annotation = readAnnotation();
      skipNodeSpace();
      const Read value = readValue(keep);
      if (!keep) return;
      if (value.kind != ValueKind::string || (annotation != "file" && annotation != "result")) {
        failAt(start, "a plain value, (file)\"...\" or (result)\"...\"",
               "the type annotation (" + std::string(annotation) + ")");
      }
      const ValueKind kind = annotation == "file" ? ValueKind::fileName : ValueKind::resultFileName;
      values_.push(tree_.makeValue(kind, value.text));
      return;
    }
    const Read value = readValue(keep);
    if (value.kind == ValueKind::string) {
      const char* behind = at_;
      skipNodeSpace();
      if (*at_ == '=') {
        ++at_;
        skipNodeSpace();
        if (*at_ == '(') {
          readAnnotation();
          skipNodeSpace();
        }
        readValue(false);
        if (keep) failAt(start, "a value", "a property (name=value), which a setup does not have");
        return;
      }
      at_ = behind;
    }
    if (keep) values_.push(tree_.makeValue(value.kind, value.text));
  }

  std::string_view readAnnotation() {
    ++at_;
    skipNodeSpace();
    const std::string_view name = readString("the name of a type");
    skipNodeSpace();
    if (*at_ != ')') fail("\")\"");
    ++at_;
    return name;
  }

  Read readValue(bool keep) {
    if (*at_ == '#' && at_[1] != '"' && at_[1] != '#') return readHashWord(keep);
    const char* number = *at_ == '-' || *at_ == '+' ? at_ + 1 : at_;
    if (isDigit(*number)) return readNumber(number);
    return {ValueKind::string, readString("a value")};
  }

  Read readHashWord(bool keep) {
    constexpr std::pair<std::string_view, ValueKind> kWords[] = {
        {"#true", ValueKind::boolean}, {"#false", ValueKind::boolean}, {"#inf", ValueKind::real},
        {"#-inf", ValueKind::real},    {"#nan", ValueKind::real},      {"#null", ValueKind::string},
    };
    const char* start = at_;
    const char* behind = at_ + 1;
    while (kdl::isWordByte(static_cast<unsigned char>(*behind))) ++behind;
    const std::string_view word(start, static_cast<std::size_t>(behind - start));
    for (const auto& [text, kind] : kWords) {
      if (word != text) continue;
      if (keep && text == "#null") failAt(start, "a value", "#null, which a setup does not have");
      at_ = behind;
      // The null of a commented-out value must not be taken for the name of a property.
      return {kind == ValueKind::string ? ValueKind::boolean : kind, text.substr(1)};
    }
    failAt(start, "#true, #false, #inf, #-inf, #nan or a raw string", "\"" + std::string(word) + "\"");
  }

  Read readNumber(const char* digits) {
    const char* start = at_;
    const bool negative = *at_ == '-';
    if (*digits == '0' && (digits[1] == 'x' || digits[1] == 'o' || digits[1] == 'b')) {
      at_ = digits + 2;
      return readBasedNumber(start, negative, digits[1] == 'x' ? 16U : digits[1] == 'o' ? 8U : 2U);
    }
    bool plain = *start != '+';
    at_ = digits;
    const auto readDigits = [&] {
      if (!isDigit(*at_)) fail("a digit");
      for (; isDigitOr_(*at_); ++at_) plain = plain && *at_ != '_';
    };
    readDigits();
    ValueKind kind = ValueKind::integer;
    if (*at_ == '.') {
      ++at_;
      kind = ValueKind::real;
      readDigits();
    }
    if (*at_ == 'e' || *at_ == 'E') {
      ++at_;
      kind = ValueKind::real;
      if (*at_ == '+' || *at_ == '-') ++at_;
      readDigits();
    }
    const std::string_view text(start, static_cast<std::size_t>(at_ - start));
    if (plain) return {kind, text};
    scratch_.clear();
    for (char c : text) {
      if (c != '_') scratch_.push_back(c);
    }
    if (scratch_.front() == '+') scratch_.erase(0, 1);
    return {kind, tree_.keep(scratch_)};
  }

  Read readBasedNumber(const char* start, bool negative, unsigned base) {
    std::uint64_t number = 0;
    bool any = false;
    for (;; ++at_) {
      if (any && *at_ == '_') continue;
      const int digit = digitValue(*at_);
      if (digit >= static_cast<int>(base)) break;
      any = true;
      if (number > (std::numeric_limits<std::uint64_t>::max() - static_cast<unsigned>(digit)) / base) {
        failAt(start, "a number of at most 64 bits", "a longer one");
      }
      number = number * base + static_cast<unsigned>(digit);
    }
    if (!any) fail("a digit");
    scratch_ = (negative ? "-" : "") + std::to_string(number);
    return {ValueKind::integer, tree_.keep(scratch_)};
  }

  std::string_view readString(const char* expected) {
    if (*at_ == '"') return startsWith("\"\"\"") ? readMultiLine(0) : readQuoted();
    if (*at_ == '#') {
      std::size_t hashes = 0;
      while (at_[hashes] == '#') ++hashes;
      if (at_[hashes] != '"') fail(expected);
      at_ += hashes;
      return startsWith("\"\"\"") ? readMultiLine(hashes) : readRaw(hashes);
    }
    return readWord(expected);
  }

  std::string_view readWord(const char* expected) {
    const char* start = at_;
    for (;;) {
      const auto byte = static_cast<unsigned char>(*at_);
      if (kdl::isWordByte(byte)) {
        ++at_;
      } else if (byte < 0x80 || spaceLength() > 0 || newlineLength() > 0) {
        break;
      } else {
        at_ += kdl::decode(rest()).length;
      }
    }
    const std::string_view word(start, static_cast<std::size_t>(at_ - start));
    if (word.empty()) fail(expected);
    const std::size_t dot = word.front() == '+' || word.front() == '-' ? 1 : 0;
    if (word.size() > dot + 1 && word[dot] == '.' && isDigit(word[dot + 1])) {
      failAt(start, "a digit before the decimal point", "\"" + std::string(word) + "\"");
    }
    if (word.size() > dot && isDigit(word[dot])) failAt(start, expected, "a number");
    if (kdl::isKeywordWithoutHash(word)) {
      failAt(start, "#" + std::string(word) + " (or the word in quotes)", "\"" + std::string(word) + "\"");
    }
    return word;
  }

  std::string_view readQuoted() {
    const char* start = ++at_;
    bool escaped = false;
    for (; *at_ != '"'; ++at_) {
      if (at_ == end_) failAt(start - 1, "a closing quote", "the end of the file");
      if (*at_ == '\\') {
        if (at_ + 1 == end_) failAt(start - 1, "a closing quote", "the end of the file");
        escaped = true;
        if (skipSpaceEscape()) {
          --at_;
        } else {
          ++at_;
        }
      } else if (newlineLength() > 0) {
        fail("a closing quote on the same line (a text of several lines stands between \"\"\")");
      }
    }
    const std::string_view body(start, static_cast<std::size_t>(at_ - start));
    ++at_;
    if (!escaped) return body;
    scratch_.clear();
    unescape(withoutSpaceEscapes(body), start, scratch_);
    return tree_.keep(scratch_);
  }

  // A backslash before white space takes all of that away.
  bool skipSpaceEscape() {
    const char* start = at_++;
    for (;;) {
      const std::size_t n = std::max(spaceLength(), newlineLength());
      if (n == 0) break;
      at_ += n;
    }
    if (at_ != start + 1) return true;
    at_ = start;
    return false;
  }

  std::string withoutSpaceEscapes(std::string_view body) {
    const char* resume = at_;
    const char* behind = body.data() + body.size();
    std::string text;
    for (at_ = body.data(); at_ < behind;) {
      if (*at_ != '\\') {
        text.push_back(*at_++);
      } else if (!skipSpaceEscape()) {
        text.append(at_, 2);
        at_ += 2;
      }
    }
    at_ = resume;
    return text;
  }

  static void unescape(std::string_view text, const char* place, std::string& out) {
    for (std::size_t i = 0; i < text.size(); ++i) {
      if (text[i] != '\\') {
        out.push_back(text[i]);
        continue;
      }
      constexpr std::string_view kLetters = "\"\\bfnrts";
      constexpr std::string_view kMeanings = "\"\\\b\f\n\r\t ";
      const char letter = i + 1 < text.size() ? text[++i] : '\0';
      if (const std::size_t k = kLetters.find(letter); k != std::string_view::npos) {
        out.push_back(kMeanings[k]);
        continue;
      }
      const std::size_t close =
          letter == 'u' && text.substr(i + 1).starts_with('{') ? text.find('}', i) : text.npos;
      if (close == text.npos) {
        failAt(place, R"(\n, \r, \t, \b, \f, \s, \", \\ or \u{...})", "an unknown escape in this text");
      }
      const std::string_view digits = text.substr(i + 2, close - i - 2);
      unsigned code = 0;
      const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), code, 16);
      const bool whole = error == std::errc() && end == digits.data() + digits.size() && digits.size() <= 6;
      if (!whole || code > 0x10FFFF || (code >= 0xD800 && code <= 0xDFFF)) {
        failAt(place, "one to six hexadecimal digits of a Unicode character in \\u{...}",
               "\\u{" + std::string(digits.substr(0, 12)) + "}");
      }
      kdl::appendUtf8(out, code);
      i = close;
    }
  }

  std::string_view readRaw(std::size_t hashes) {
    const std::string close = '"' + std::string(hashes, '#');
    const char* start = ++at_;
    while (!startsWith(close)) {
      if (at_ == end_) failAt(start - 1, close + " to end this text", "the end of the file");
      if (newlineLength() > 0) fail(close + " on the same line");
      ++at_;
    }
    const std::string_view body(start, static_cast<std::size_t>(at_ - start));
    at_ += close.size();
    return body;
  }

  // A text of several lines between three quotes. The white space before the closing quotes stands before
  // each line too and is taken away; it is raw when `hashes` is not 0.
  std::string_view readMultiLine(std::size_t hashes) {
    const char* quotes = at_;
    const std::string close = "\"\"\"" + std::string(hashes, '#');
    at_ += 3;
    const std::size_t newline = newlineLength();
    if (newline == 0) fail("the end of the line after \"\"\"");
    at_ += newline;
    const char* start = at_;
    while (!startsWith(close)) {
      if (at_ == end_) failAt(quotes, close + " to end this text", "the end of the file");
      at_ += hashes == 0 && *at_ == '\\' && at_ + 1 != end_ ? 2 : 1;
    }
    const std::string_view body(start, static_cast<std::size_t>(at_ - start));
    at_ += close.size();
    const std::string text = hashes == 0 ? withoutSpaceEscapes(body) : std::string(body);
    scratch_.clear();
    dedent(text, quotes, hashes != 0, scratch_);
    return tree_.keep(scratch_);
  }

  static std::vector<std::string_view> linesOf(std::string_view text) {
    std::vector<std::string_view> lines;
    std::size_t start = 0;
    for (std::size_t i = 0; i < text.size();) {
      const kdl::Character c = kdl::decode(text.substr(i));
      if (!kdl::isNewline(c.code)) {
        i += c.length;
        continue;
      }
      lines.push_back(text.substr(start, i - start));
      i += text.substr(i).starts_with("\r\n") ? 2 : c.length;
      start = i;
    }
    lines.push_back(text.substr(start));
    return lines;
  }

  static bool isAllSpace(std::string_view line) {
    for (std::size_t i = 0; i < line.size();) {
      const kdl::Character c = kdl::decode(line.substr(i));
      if (!kdl::isUnicodeSpace(c.code)) return false;
      i += c.length;
    }
    return true;
  }

  static void dedent(std::string_view text, const char* place, bool raw, std::string& out) {
    std::vector<std::string_view> lines = linesOf(text);
    const std::string_view indent = lines.back();
    lines.pop_back();
    if (!isAllSpace(indent)) failAt(place, "the closing quotes on a line of their own", "text before them");
    for (std::size_t i = 0; i < lines.size(); ++i) {
      if (i > 0) out.push_back('\n');
      if (isAllSpace(lines[i])) continue;
      if (!lines[i].starts_with(indent)) {
        failAt(place, "every line to begin with the white space that stands before the closing quotes",
               "a line that does not");
      }
      const std::string_view line = lines[i].substr(indent.size());
      if (raw) {
        out.append(line);
      } else {
        unescape(line, place, out);
      }
    }
  }

  ParameterTree& tree_;
  const char* at_;
  const char* end_;
  std::vector<Block> open_;
  ValueList values_;
  std::string scratch_;
};

std::string describe(std::string_view rest) {
  if (rest.empty()) return "the end of the file";
  const kdl::Character c = kdl::decode(rest);
  if (c.code == kdl::kNoCharacter) return "a byte that is not UTF-8 text";
  if (c.code == 0) return "a zero byte: this is not a text file";
  if (kdl::isNewline(c.code)) return "the end of the line";
  if (kdl::isDisallowed(c.code)) return "a control character";
  return "\"" + std::string(rest.substr(0, c.length)) + "\"";
}

SyntaxError errorAt(std::string_view text, std::size_t offset, std::string expected, std::string found) {
  SyntaxError error{1, 1, std::move(found), std::move(expected)};
  if (error.found.empty()) error.found = describe(text.substr(offset));
  for (std::size_t i = 0; i < offset;) {
    const kdl::Character c = kdl::decode(text.substr(i));
    i += text.substr(i).starts_with("\r\n") ? 2 : c.length;
    if (kdl::isNewline(c.code)) {
      ++error.line;
      error.column = 1;
    } else {
      ++error.column;
    }
  }
  return error;
}

}  // namespace

std::string SyntaxError::text() const {
  return "line " + std::to_string(line) + ", column " + std::to_string(column) + ": found " + found +
         ", expected " + expected;
}

ReadText readKdl(FileText file) {
  auto tree = std::make_unique<ParameterTree>(std::move(file));
  std::string_view text = tree->sourceText();
  if (text.starts_with(kByteOrderMark)) text.remove_prefix(kByteOrderMark.size());
  if (text.size() > std::numeric_limits<std::uint32_t>::max()) {
    return {nullptr, errorAt({}, 0, "a file of less than 4 GiB", "a larger file")};
  }
  if (text.starts_with("\xFF\xFE") || text.starts_with("\xFE\xFF")) {
    return {nullptr, errorAt({}, 0, "UTF-8 text; save the file in that encoding", "UTF-16 text")};
  }
  if (const std::size_t bad = kdl::firstBadByte(text); bad != std::string_view::npos) {
    return {nullptr, errorAt(text, bad, "readable UTF-8 text", {})};
  }
  Reader reader(*tree, text);
  try {
    reader.read();
  } catch (Fault& fault) {
    const auto offset = static_cast<std::size_t>(fault.at - text.data());
    return {nullptr, errorAt(text, offset, std::move(fault.expected), std::move(fault.found))};
  }
  return {std::move(tree), {}};
}

}  // namespace gridbay
