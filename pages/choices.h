#pragma once

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace gridbay {

// One choice of a list: the value that is stored, and the text that is shown. One without a text is shown
// nowhere; it only has a place, so that its value is kept.
struct Choice {
  std::int32_t value;
  std::string text;
};

// The choices of a radio group, a drop-down list or a cell, in their order.
class Choices {
 public:
  Choices() = default;
  Choices(std::initializer_list<Choice> choices) : choices_(choices) {}
  explicit Choices(std::vector<Choice> choices) : choices_(std::move(choices)) {}
  // Texts whose values are their places, from `first` on.
  static Choices numbered(const std::vector<std::string>& texts, std::int32_t first = 0);
  // As the list of a grid's cells is told: in one text, with a choice on each line.
  static Choices lines(std::string_view text, std::int32_t first = 0);
  static Choices lines(std::string_view text, std::initializer_list<std::int32_t> values);

  // The place, from 0, that stands for a value which is no choice. Without it such a value shows nothing, and
  // is kept until there is a choice.
  Choices& Otherwise(int place) {
    otherwise_ = place;
    return *this;
  }
  void Add(Choice choice) { choices_.push_back(std::move(choice)); }
  // The first n of them.
  Choices first(std::size_t n) const;

  // The place of a value or of a text; -1 for one that has none.
  int placeOf(std::int32_t value) const;
  int placeOfText(std::string_view text) const;
  // What is stored for a place; nothing for one that is not there.
  std::optional<std::int32_t> valueAt(int place) const;
  // What is shown for a value.
  std::string textOf(std::int32_t value) const;
  std::vector<std::string> texts() const;

 private:
  const Choice* at(int place) const;

  std::vector<Choice> choices_;
  int otherwise_ = -1;
};

}  // namespace gridbay
