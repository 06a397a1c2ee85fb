#include "platform/units/units.h"

#include <udunits2.h>

#include <string>

namespace gridbay {
namespace {

struct FreeSystem {
  void operator()(ut_system* system) const { ut_free_system(system); }
};
struct FreeUnit {
  void operator()(ut_unit* unit) const { ut_free(unit); }
};
struct FreeConverter {
  void operator()(cv_converter* converter) const { cv_free(converter); }
};
using Unit = std::unique_ptr<ut_unit, FreeUnit>;

// The unit system is read from the library's database once, at the first question.
ut_system* unitSystem() {
  static const std::unique_ptr<ut_system, FreeSystem> system = [] {
    ut_set_error_message_handler(ut_ignore);
    return std::unique_ptr<ut_system, FreeSystem>(ut_read_xml(nullptr));
  }();
  return system.get();
}

Unit parseUnit(std::string_view text) {
  ut_system* system = unitSystem();
  if (system == nullptr) return nullptr;
  return Unit(ut_parse(system, std::string(text).c_str(), UT_UTF8));
}

std::string_view textOf(int code) {
  const QunUnit* found = qunFindUnit(code);
  return found == nullptr ? "no unit" : found->text;
}

}  // namespace

struct CVdUnitConverter::State {
  std::unique_ptr<cv_converter, FreeConverter> converter;
};

CVdUnitConverter::CVdUnitConverter(int fromUnit, int toUnit)
    : CVdUnitConverter(textOf(fromUnit), textOf(toUnit)) {}

CVdUnitConverter::CVdUnitConverter(std::string_view fromText, std::string_view toText)
    : state_(std::make_unique<State>()) {
  const Unit from = parseUnit(fromText);
  const Unit to = parseUnit(toText);
  if (from && to && ut_are_convertible(from.get(), to.get()) != 0) {
    state_->converter.reset(ut_get_converter(from.get(), to.get()));
  }
}

CVdUnitConverter::CVdUnitConverter(CVdUnitConverter&&) noexcept = default;
CVdUnitConverter& CVdUnitConverter::operator=(CVdUnitConverter&&) noexcept = default;
CVdUnitConverter::~CVdUnitConverter() = default;

bool CVdUnitConverter::IsValid() const {
  return state_->converter != nullptr;
}

double CVdUnitConverter::Convert(double value) const {
  return IsValid() ? cv_convert_double(state_->converter.get(), value) : value;
}

std::optional<double> qunConvertUnit(int fromUnit, int toUnit, double value) {
  const CVdUnitConverter converter(fromUnit, toUnit);
  return converter.IsValid() ? std::optional(converter.Convert(value)) : std::nullopt;
}

bool qunAreEquivalent(std::string_view unitText, std::string_view otherText) {
  if (unitText == otherText) return true;
  const Unit one = parseUnit(unitText);
  const Unit other = parseUnit(otherText);
  return one && other && ut_are_convertible(one.get(), other.get()) != 0;
}

bool qunIsUnit(std::string_view unitText) {
  return parseUnit(unitText) != nullptr;
}

}  // namespace gridbay
