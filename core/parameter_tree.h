#pragma once

#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "core/arena.h"
#include "core/section_index.h"
#include "platform/files/read_file.h"

namespace gridbay {

// The kinds of value that a keyword can hold. Single and double precision share one kind: they differ only in
// how many digits a writer gives them.
enum class ValueKind : std::uint8_t { boolean, integer, real, string, fileName, resultFileName };

// One value of a keyword, held as its text: "true" or "false", the decimal digits of a number (or "inf",
// "-inf", "nan"), the characters of a string or path without quotes and escapes. It is made by a tree, which
// holds the text. A file may have very many values, so one is eight bytes: the address of the text (a program
// has 48 bits of them), the kind, and the length, which stands with the address elsewhere when it is long.
class Value {
 public:
  ValueKind kind() const { return static_cast<ValueKind>(bits_ >> kAddressBits & kKindMask); }
  std::string_view text() const {
    const std::uint64_t address = bits_ & ((std::uint64_t{1} << kAddressBits) - 1);
    const std::uint64_t length = bits_ >> (kAddressBits + kKindBits);
    if (length < kLong) return {reinterpret_cast<const char*>(address), length};
    return *reinterpret_cast<const std::string_view*>(address);
  }

 private:
  friend class ParameterTree;

  static constexpr unsigned kAddressBits = 48;
  static constexpr unsigned kKindBits = 3;
  static constexpr std::uint64_t kKindMask = (1U << kKindBits) - 1;
  static constexpr std::uint64_t kLong = (std::uint64_t{1} << (64 - kAddressBits - kKindBits)) - 1;

  Value(ValueKind kind, const void* address, std::uint64_t length)
      : bits_(reinterpret_cast<std::uint64_t>(address) | static_cast<std::uint64_t>(kind) << kAddressBits |
              length << (kAddressBits + kKindBits)) {}

  std::uint64_t bits_;
};

// The values of a keyword while it is being read or written. Many of them are held in pieces, so that their
// number does not double for a moment.
class ValueList {
 public:
  void push(Value value) {
    if (first_.size() < kFirst) {
      first_.push_back(value);
    } else {
      pushFurther(value);
    }
  }
  bool empty() const { return first_.empty(); }
  void clear() {
    first_.clear();
    further_.clear();
    count_ = 0;
  }

 private:
  friend class ParameterTree;

  static constexpr std::size_t kFirst = 1 << 16;
  static constexpr std::size_t kPiece = kLargeMemory / sizeof(Value);

  void pushFurther(Value value);

  std::vector<Value> first_;
  std::vector<LargeBytes> further_;  // of `kPiece` values each
  std::size_t count_ = 0;            // in `further_`
};

class Node;
class ParameterTree;

// What a section (or target, or the file itself) holds: sections and keywords in the order of the file, and
// the index by which a name is found, made at the first lookup that pays for it.
struct SectionBody {
  ParameterTree* tree = nullptr;
  Node* first = nullptr;
  SectionIndex* index = nullptr;
  std::uint32_t sections = 0;
  std::uint32_t keywords = 0;
};

// A section with its body or a keyword with its values.
class Node {
 public:
  // NOLINTNEXTLINE(cppcoreguidelines-pro-type-member-init): the body and the values share one place
  Node(std::string_view name, SectionBody* body)
      : name_(name.data()), nameLength_(static_cast<std::uint32_t>(name.size())), kind_(1), body_(body) {}
  Node(std::string_view name, std::span<const Value> values)
      : name_(name.data()),
        nameLength_(static_cast<std::uint32_t>(name.size())),
        valueCount_(static_cast<std::uint32_t>(values.size()) & 0x7FFFFFFFU),
        values_(values.data()) {}

  std::string_view name() const { return {name_, nameLength_}; }
  bool isSection() const { return kind_ == 1; }
  const Node* next() const { return next_; }

  // Of a section.
  const Node* first() const { return body_->first; }
  std::uint32_t sectionCount() const { return body_->sections; }
  std::uint32_t keywordCount() const { return body_->keywords; }
  // The occurrence-th section or keyword of a name (counted from 1; case, and blanks at the
  // end, ignored), or null. The time does not depend on how many siblings there are, but for the first lookup
  // in a section.
  const Node* section(std::string_view name, std::uint32_t occurrence = 1) const;
  const Node* keyword(std::string_view name, std::uint32_t occurrence = 1) const;

  // Of a keyword.
  std::span<const Value> values() const { return {values_, valueCount_}; }

 private:
  friend class ParameterTree;

  const Node* find(std::string_view name, std::uint32_t occurrence, bool wantSection) const;

  const char* name_;
  std::uint32_t nameLength_;
  std::uint32_t valueCount_ : 31 = 0;
  std::uint32_t kind_ : 1 = 0;
  union {
    SectionBody* body_ = nullptr;
    const Value* values_;
  };
  Node* next_ = nullptr;
};

// A parameter file as a tree. The root is the file itself; its sections are the targets. Nodes, values and
// made-up texts live in an arena; names and values of a file that was read point into its text.
class ParameterTree {
 public:
  explicit ParameterTree(FileText text = FileText());
  ParameterTree(const ParameterTree&) = delete;
  ParameterTree& operator=(const ParameterTree&) = delete;
  ~ParameterTree();

  const Node& root() const { return *root_; }
  Node& root() { return *root_; }
  std::string_view sourceText() const { return text_.view(); }

  // Making nodes. Texts given here must outlive the tree: `keep` copies one into it.
  std::string_view keep(std::string_view text);
  Value makeValue(ValueKind kind, std::string_view text) {
    if (text.size() < Value::kLong) return {kind, text.data(), text.size()};
    return {kind, arena_.make<std::string_view>(text), Value::kLong};
  }
  Node* makeSection(std::string_view name) { return arena_.make<Node>(name, &empty_); }
  // The list is empty afterwards.
  Node* makeKeyword(std::string_view name, ValueList& values);
  Node* makeKeyword(std::string_view name, Value value) {
    return arena_.make<Node>(name, std::span<const Value>(arena_.make<Value>(value), 1));
  }
  // Appends a node to a section behind `last`, the section's last node so far (null when it is empty).
  static void append(Node& section, Node* last, Node& node) {
    ParameterTree& tree = *section.body_->tree;
    if (section.body_ == &tree.empty_) section.body_ = tree.arena_.make<SectionBody>(tree.empty_);
    SectionBody& body = *section.body_;
    (last == nullptr ? body.first : last->next_) = &node;
    ++(node.isSection() ? body.sections : body.keywords);
    if (body.index != nullptr) {
      body.index->add(node);
    } else if (body.sections + body.keywords == kLarge) {
      body.index = tree.makeIndex(section);
    }
  }

 private:
  friend class Node;

  // From this many nodes on a section's index grows with it; a smaller one has one once it is asked.
  static constexpr std::uint32_t kLarge = 64;

  SectionIndex* makeIndex(const Node& section);

  FileText text_;
  Arena arena_;
  SectionBody empty_{.tree = this};  // of all sections that hold nothing
  Node* root_;
  std::vector<std::unique_ptr<SectionIndex>> indexes_;
};

// Whether two names are the same but for the case of the letters A to Z and blanks at their ends.
bool sameName(std::string_view a, std::string_view b);

// Whether two trees hold the same sections, keywords and values in the same order (names by letter).
bool sameTree(const Node& a, const Node& b);

}  // namespace gridbay
