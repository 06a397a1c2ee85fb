#pragma once

#include "python/arguments.h"

namespace gridbay::python {

// A quantity as a function of conversions takes it: its code, its name or the beginning of that.
struct ItemTypeText {
  std::string text;

  static bool isOne(pybind11::handle value) {
    return PyUnicode_Check(value.ptr()) != 0 || (PyIndex_Check(value.ptr()) != 0 && !isBool(value));
  }
};

template <>
struct Taken<ItemTypeText> {
  static constexpr const char* kName = "str | int";
  static ItemTypeText from(const Given& given) {
    if (!ItemTypeText::isOne(given.value))
      throw refusal(kWrongType, given.path, shown(given.value), "the code or name of an item type");
    if (PyUnicode_Check(given.value.ptr()) != 0) return {textOf(given.value, given.path)};
    return {std::to_string(wholeOf(given.value, given.path))};
  }
};

}  // namespace gridbay::python
