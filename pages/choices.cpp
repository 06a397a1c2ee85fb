#include "pages/choices.h"

#include <algorithm>

namespace gridbay {

Choices Choices::numbered(const std::vector<std::string>& texts, std::int32_t first) {
  Choices choices;
  for (const std::string& text : texts) choices.Add({first++, text});
  return choices;
}

Choices Choices::lines(std::string_view text, std::int32_t first) {
  constexpr std::string_view kEnd = "\r\n";
  Choices choices;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find(kEnd), text.size());
    choices.Add({first++, std::string(text.substr(0, end))});
    text.remove_prefix(std::min(end + kEnd.size(), text.size()));
  }
  return choices;
}

Choices Choices::lines(std::string_view text, std::initializer_list<std::int32_t> values) {
  Choices choices = lines(text);
  std::ranges::transform(choices.choices_, values, choices.choices_.begin(),
                         [](Choice choice, std::int32_t value) {
                           return Choice{value, std::move(choice.text)};
                         });
  return choices;
}

Choices Choices::first(std::size_t n) const {
  Choices few = *this;
  few.choices_.resize(std::min(n, choices_.size()));
  return few;
}

int Choices::placeOf(std::int32_t value) const {
  const auto found = std::ranges::find(choices_, value, &Choice::value);
  return found == choices_.end() ? otherwise_ : static_cast<int>(found - choices_.begin());
}

int Choices::placeOfText(std::string_view text) const {
  const auto found = std::ranges::find(choices_, text, &Choice::text);
  return text.empty() || found == choices_.end() ? -1 : static_cast<int>(found - choices_.begin());
}

const Choice* Choices::at(int place) const {
  return place >= 0 && place < static_cast<int>(choices_.size()) ? &choices_[static_cast<std::size_t>(place)]
                                                                 : nullptr;
}

std::optional<std::int32_t> Choices::valueAt(int place) const {
  const Choice* choice = at(place);
  if (choice == nullptr) choice = at(otherwise_);
  return choice == nullptr ? std::nullopt : std::optional(choice->value);
}

std::string Choices::textOf(std::int32_t value) const {
  const Choice* choice = at(placeOf(value));
  return choice == nullptr ? std::string() : choice->text;
}

std::vector<std::string> Choices::texts() const {
  std::vector<std::string> texts;
  for (const Choice& choice : choices_) {
    if (!choice.text.empty()) texts.push_back(choice.text);
  }
  return texts;
}

}  // namespace gridbay
