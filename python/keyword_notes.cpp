#include "python/keyword_notes.h"

#include <algorithm>
#include <regex>

#include "setup/member_keyword.h"
#include "setup/setup_path.h"

namespace gridbay::python {

void KeywordNotes::take(CGlobalKvs& model, const Snapshot& shot) {
  for (const Keyword& keyword : shot.keywords) {
    if (!seen_.insert(keyword.path).second || !isOfFirstItems(keyword.path) || isOption(keyword.path))
      continue;
    places_[keyword.path] = list_.keywords.size();
    KeywordNote note;
    note.path = keyword.path;
    note.values = keyword.values;
    const Result<MemberKeyword> member = findKeyword(model, keyword.path, {});
    note.canBeSet = static_cast<bool>(member);
    note.takesAnyNumber = member && member->takesAnyNumber();
    note.parts.resize(note.takesAnyNumber ? 1 : std::max<std::size_t>(note.values.size(), 1));
    list_.keywords.push_back(std::move(note));
  }
  for (const std::string& section : shot.sections) {
    if (!seen_.insert(section + "/").second) continue;
    const auto item = itemOf(nameOf(section));
    const std::string parent = parentOf(section);
    if (!item || !isOfFirstItems(parent + "/x")) continue;
    const std::string name = parent.empty() ? item->list : parent + "/" + item->list;
    lists_.try_emplace(name, ListNote{.name = name, .count = {}, .followed = {}});
  }
}

void KeywordNotes::takeWhatCanBeSet(CGlobalKvs& model) {
  for (KeywordNote& note : list_.keywords) note.canBeSet = note.canBeSet || findKeyword(model, note.path, {});
}

const KeywordNote* KeywordNotes::find(const std::string& path) const {
  const auto place = placeOf(path);
  return place ? &at(*place) : nullptr;
}

std::optional<std::size_t> KeywordNotes::placeOf(const std::string& path) const {
  const auto known = places_.find(path);
  return known == places_.end() ? std::nullopt : std::optional(known->second);
}

ListNote& KeywordNotes::list(const std::string& name) {
  return lists_.try_emplace(name, ListNote{.name = name, .count = {}, .followed = {}}).first->second;
}

ValueNote* KeywordNotes::add(const Change& change, const ValueNote& found, const std::string& page,
                             Sureness sureness) {
  if (change.ofFurtherItem) sureness = Sureness::together;
  Sureness& known = known_[{change.note, change.value}];
  KeywordNote& keyword = list_.keywords[change.note];
  ValueNote& held = keyword.parts[change.value];
  if (sureness < known || (sureness == known && held.label != found.label)) return nullptr;
  known = sureness;
  if (held.label != found.label) held = {.label = found.label, .quantity = {}, .unit = {}, .choices = {}};
  keyword.page = page;
  if (held.quantity.empty()) {
    held.quantity = found.quantity;
    held.unit = found.unit;
  }
  return &held;
}

void addChoice(ValueNote& note, const std::string& value, const std::string& choice) {
  const std::pair<std::string, std::string> entry(value, choice);
  if (std::ranges::find(note.choices, entry) == note.choices.end()) note.choices.push_back(entry);
}

void KeywordNotes::fillNumbered() {
  std::unordered_map<std::string, const KeywordNote*> known;
  static const std::regex kNumber("_[0-9]+(?=_|$)");
  const auto hasLabel = [](const KeywordNote& note) { return !note.parts.front().label.empty(); };
  for (const KeywordNote& note : list_.keywords) {
    if (hasLabel(note)) known.emplace(note.path, &note);
  }
  for (KeywordNote& note : list_.keywords) {
    if (hasLabel(note)) continue;
    const std::string name = nameOf(note.path);
    const std::string first = std::regex_replace(name, kNumber, "_1");
    const auto found = known.find(note.path.substr(0, note.path.size() - name.size()) + first);
    if (found == known.end()) continue;
    note.page = found->second->page;
    note.parts = found->second->parts;
    // "Fraction 1" of Fraction_1 is "Fraction 3" of Fraction_3.
    std::string& label = note.parts.front().label;
    const std::string number = name.substr(name.rfind('_') + 1);
    if (label.ends_with(" 1") && first == name.substr(0, name.size() - number.size()) + "1")
      label.replace(label.size() - 1, 1, number);
  }
}

KeywordList KeywordNotes::finished() && {
  fillNumbered();
  for (auto& [name, note] : lists_) list_.lists.push_back(std::move(note));
  return std::move(list_);
}

}  // namespace gridbay::python
