#pragma once

#include <cstdint>
#include <memory>
#include <memory_resource>
#include <span>
#include <string>
#include <string_view>

#include "platform/files/read_file.h"

namespace gridbay {

// The kinds of value that a keyword can hold. Single and double precision share one kind: they differ only in
// how many digits a writer gives them.
enum class ValueKind : std::uint8_t { boolean, integer, real, string, fileName, resultFileName };

// One value of a keyword, held as its text: "true" or "false", the decimal digits of a number (or "inf",
// "-inf", "nan"), the characters of a string or path without quotes and escapes.
class Value {
 public:
  Value(ValueKind kind, std::string_view text)
      : text_(text.data()), length_(static_cast<std::uint32_t>(text.size())), kind_(kind) {}

  ValueKind kind() const { return kind_; }
  std::string_view text() const { return {text_, length_}; }

 private:
  const char* text_;
  std::uint32_t length_;
  ValueKind kind_;
};

class Node;
class ParameterTree;

// What a section (or target, or the file itself) holds: sections and keywords in the order of the file, and
// the index by which a name is found, made at the first lookup that pays for it.
struct SectionBody {
  ParameterTree* tree = nullptr;
  Node* first = nullptr;
  const class SectionIndex* index = nullptr;
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
  // The occurrence-th section or keyword of a name (counted from 1, case ignored), or null. The time does not
  // depend on how many siblings there are, but for the first lookup in a section.
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
  ~ParameterTree() = default;

  const Node& root() const { return *root_; }
  Node& root() { return *root_; }
  std::string_view sourceText() const { return text_.view(); }

  // Making nodes. Texts given here must outlive the tree: `keep` copies one into it.
  std::string_view keep(std::string_view text);
  std::span<const Value> keep(std::span<const Value> values);
  Node* makeSection(std::string_view name);
  Node* makeKeyword(std::string_view name, std::span<const Value> values);
  // Appends a node to a section behind `last`, the section's last node so far (null when it is empty).
  static void append(Node& section, Node* last, Node& node);

  std::pmr::memory_resource& arena() { return arena_; }

 private:
  // Makes a thing in the arena, which frees it without a word: things with something to free don't go here.
  template <class T, class... Args>
  T* make(Args&&... args);

  FileText text_;
  std::pmr::monotonic_buffer_resource arena_;
  Node* root_;
};

// Whether two names are the same but for the case of the letters A to Z.
bool sameName(std::string_view a, std::string_view b);

// Whether two trees hold the same sections, keywords and values in the same order (names by letter).
bool sameTree(const Node& a, const Node& b);

}  // namespace gridbay
