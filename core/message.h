#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "core/page_id.h"
#include "core/string_table.h"

namespace gridbay {

enum class Severity : std::int32_t {
  fault = 1,         // an ordinary fault
  dependedUpon = 2,  // a fault in a thing that others depend on
};

// One validation message: the page to open for it, the finished text, the severity.
struct CMessage {
  PageId page{};
  std::string text;
  Severity severity = Severity::fault;

  bool operator==(const CMessage&) const = default;
};

// Messages in the order in which the checks ran.
using ValidationList = std::vector<CMessage>;

// Appends a message and returns 1, for the sum of faults.
template <class... Args>
unsigned report(ValidationList& messages, PageId page, Severity severity, const Text& text,
                const Args&... args) {
  messages.push_back({page, formatted(text, args...), severity});
  return 1;
}

// What a data file selector has to say of a file: the result of its check and the lines to show.
class CValidationMessageBuffer {
 public:
  void AddValidationMessage(bool result, const std::vector<std::string>& lines) {
    valid_ = valid_ && result;
    lines_.insert(lines_.end(), lines.begin(), lines.end());
  }

  bool valid() const { return valid_; }
  const std::vector<std::string>& lines() const { return lines_; }
  std::string text() const;

 private:
  bool valid_ = true;
  std::vector<std::string> lines_;
};

// Where a text that stops the user for a moment is shown: a dialog, standard error, a list in tests. Showing
// a text returns once it has been seen.
class MessageHost {
 public:
  virtual ~MessageHost() = default;
  virtual void show(const std::string& text) = 0;
};

// Shows texts that belong together, as what a load has to say, as one list: each as it stands, where it came
// first, and behind it how often it came where that is more than once. An empty line parts them where one of
// them has lines of its own.
void showTogether(MessageHost& host, const std::vector<std::string>& texts);

// Keeps the texts, for a caller who shows them together.
class CollectingMessageHost : public MessageHost {
 public:
  void show(const std::string& text) override { texts.push_back(text); }

  std::vector<std::string> texts;
};

}  // namespace gridbay
