#pragma once

#include <charconv>
#include <concepts>
#include <cstdint>
#include <initializer_list>
#include <string>
#include <string_view>
#include <variant>

namespace gridbay {

// A text that the program shows, with printf placeholders; odd forms are meant. The id is that of the string
// resource, 0 where none is known outside.
struct Text {
  std::string_view format;
  int id = 0;
};

// The texts of a format that ends in its one number, "POINT_%d", for many numbers.
class NumberedText {
 public:
  explicit NumberedText(const Text& text)
      : text_(text.format.substr(0, text.format.rfind('%'))), prefix_(text_.size()) {
    text_.resize(prefix_ + kMostDigits);
  }

  // Holds until the next number is asked for.
  std::string_view of(int number) {
    const char* end = std::to_chars(text_.data() + prefix_, text_.data() + text_.size(), number).ptr;
    return {text_.data(), static_cast<std::size_t>(end - text_.data())};
  }

 private:
  static constexpr std::size_t kMostDigits = 11;  // with a sign

  std::string text_;
  std::size_t prefix_;
};

// What stands for a placeholder: a whole number, a real one or a text.
class TextArgument {
 public:
  TextArgument(std::integral auto number) : value_(static_cast<std::int64_t>(number)) {}
  TextArgument(std::floating_point auto number) : value_(double{number}) {}
  TextArgument(std::string_view text) : value_(text) {}
  TextArgument(const std::string& text) : value_(std::string_view(text)) {}
  TextArgument(const char* text) : value_(std::string_view(text)) {}

  const auto& value() const { return value_; }

 private:
  std::variant<std::int64_t, double, std::string_view> value_;
};

// A printf format with its placeholders filled in.
std::string formattedText(std::string_view format, std::initializer_list<TextArgument> arguments);

template <class... Args>
std::string formatted(const Text& text, const Args&... args) {
  return formattedText(text.format, {TextArgument(args)...});
}

namespace texts {

inline constexpr Text dataFileNotValid{"Data file  \" %s\"  is not valid"};
inline constexpr Text errorMessage{"  Error Message: "};
inline constexpr Text countNotBorneOut{
    "Error in the KVS-FILE\nSection %s says %d, which is far more than the %d sections that follow; %d are "
    "kept"};

// Help file, default name, new-file name, filter label, filter extension, registry type id, type name.
inline constexpr Text flowModelDocument{
    "V27Nested.chm\nUntitled\nVANE 27 Flow model\nVANE 27 Flow Model "
    "(*.v27)\n.v27\nVANE27FlowModel.Document\n"
    "Flow Model",
    18951};
inline constexpr Text wetlandSweepKitDocument{
    "V27WSK.chm\nUntitled\nVANE 27 Wetland Sweep Kit\nVANE 27 Wetland Sweep Kit (*.v27wsk)\n.v27wsk\n"
    "VANE27FlowModelWSK.Document\nWetland Sweep Kit",
    19200};
inline constexpr Text flowModel{"Flow Model", 19276};
inline constexpr Text wetlandSweepKit{"Wetland Sweep Kit"};

}  // namespace texts
}  // namespace gridbay
