#pragma once

#include <cstddef>
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

// An entry of a list: its number, from 1, and how many there are.
struct ListEntry {
  int number = 0;
  int count = 0;

  bool operator==(const ListEntry&) const = default;
};

// One validation message: the page to open for it, the finished text, the severity.
struct CMessage {
  PageId page{};
  std::string text;
  Severity severity = Severity::fault;
  // What it speaks of, as the entry of a list and, in that, of a list of its own. It is told beside the
  // message, and no part of it.
  std::vector<ListEntry> entries = {};

  bool operator==(const CMessage& other) const {
    return page == other.page && text == other.text && severity == other.severity;
  }
};

// A data file that a check has looked at, as the model uses it.
struct CheckedFile {
  PageId page{};
  std::string name;  // as the page shows it
  std::string path;
  std::vector<std::uint32_t> items = {};  // from 1; empty for all
  bool coversRun = false;                 // its values go on in time, through the whole run
  std::vector<ListEntry> entries = {};    // as of a message
};

// Messages in the order in which the checks ran, and the data files that these have looked at.
struct ValidationList : std::vector<CMessage> {
  using std::vector<CMessage>::vector;

  std::vector<CheckedFile> files;
};

// Appends a message and returns 1, for the sum of faults.
template <class... Args>
unsigned report(ValidationList& messages, PageId page, Severity severity, const Text& text,
                const Args&... args) {
  messages.push_back({page, formatted(text, args...), severity});
  return 1;
}

// Runs the check of an entry of a list, and tells what it appends of which entry that is.
unsigned checkedEntry(ValidationList& messages, ListEntry entry, auto&& check) {
  const std::size_t messagesBefore = messages.size();
  const std::size_t filesBefore = messages.files.size();
  const unsigned faults = check();
  const auto tell = [entry](auto& list, std::size_t from) {
    for (; from < list.size(); ++from) list[from].entries.insert(list[from].entries.begin(), entry);
  };
  tell(messages, messagesBefore);
  tell(messages.files, filesBefore);
  return faults;
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
