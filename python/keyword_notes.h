#pragma once

#include <map>
#include <optional>
#include <string>
#include <unordered_map>
#include <unordered_set>

#include "python/keyword_list.h"
#include "python/model_snapshot.h"

namespace gridbay::python {

// A value that an edit has changed. Where the values are others in number it is the first that stands for
// all.
struct Change {
  std::size_t note;  // the place of its keyword among the notes
  std::size_t value;
  ValueKind kind;
  std::string before;
  std::string after;
  bool ofFurtherItem = false;  // not in the first item of each list, which stands for all
};

// How surely a label is that of a value: it was one of several that changed with a choice; one of several
// numbers in the text that was typed; in a dialog or on the page the one that was meant.
enum class Sureness { none, together, amongNumbers, inDialog, onPage };

// What is known so far of the keywords and lists of an edition.
class KeywordNotes {
 public:
  // Keywords and lists that were not there yet, of what a save of the model would write.
  void take(CGlobalKvs& model, const Snapshot& shot);
  // What follows from other values for one module or task may be set for another.
  void takeWhatCanBeSet(CGlobalKvs& model);

  // By the path in the first items; null, or none, where it isn't known.
  const KeywordNote* find(const std::string& path) const;
  std::optional<std::size_t> placeOf(const std::string& path) const;
  const KeywordNote& at(std::size_t place) const { return list_.keywords[place]; }
  ListNote& list(const std::string& name);

  // Notes what a value is called and measured in; null where it is known more surely already.
  ValueNote* add(const Change& change, const ValueNote& found, const std::string& page, Sureness sureness);

  // All of it; what is known of the first of those that are numbered holds for the others.
  KeywordList finished() &&;

 private:
  void fillNumbered();

  KeywordList list_;
  std::unordered_set<std::string> seen_;  // paths of keywords, and of sections with a slash
  std::unordered_map<std::string, std::size_t> places_;
  std::map<std::string, ListNote> lists_;
  std::map<std::pair<std::size_t, std::size_t>, Sureness> known_;  // by keyword and value
};

// That a value is called so, if that was not noted yet.
void addChoice(ValueNote& note, const std::string& value, const std::string& choice);

}  // namespace gridbay::python
