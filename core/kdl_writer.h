#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "core/parameter_tree.h"
#include "core/text_output.h"
#include "platform/result.h"

namespace gridbay {

// Writes KDL 2.0 as its parts come, four blanks for each level: an empty section as NAME {}, texts in quotes,
// file names behind (file) and result file names behind (result).
class KdlWriter {
 public:
  // The sink must outlive the writer.
  explicit KdlWriter(TextSink& sink) : out_(sink) {}

  void open(std::string_view section);
  // Closes the section that was opened last; nothing where none is open.
  void close();
  void startKeyword(std::string_view name);
  // A value of the keyword that was started last; nothing behind anything else. Its text is that of a
  // `Value`.
  void add(ValueKind kind, std::string_view text);
  // A keyword with one value.
  void put(std::string_view name, ValueKind kind, std::string_view text);

  // Ends the line and the sections that are open, and gives the sink all. Fails where the sink did, and once
  // a text came that is not UTF-8.
  Outcome finish();
  // The same for what has been written so far, with nothing ended.
  Outcome flush();
  // What is still to come to end the line and the sections that are open.
  std::string closing() const;

 private:
  // What the text so far ends with.
  enum class End : std::uint8_t { line, keyword, opening };

  void startLine(std::string_view name);
  void addValue(std::string_view keyword, ValueKind kind, std::string_view text);
  void check(bool isUtf8, std::string_view name);

  TextOutput out_;
  std::size_t depth_ = 0;
  End end_ = End::line;
  std::string keyword_;  // that is being filled
  Outcome outcome_;
};

// Writes what a section holds. Fails where the sink does, and for a text that is not UTF-8.
Outcome writeKdl(const Node& section, TextSink& sink);
void writeKdl(const Node& section, KdlWriter& writer);

// The same as one text; what a user reads or an error in it.
Result<std::string> kdlText(const Node& section);

// One value as it stands on file.
std::string valueText(const Value& value);

}  // namespace gridbay
