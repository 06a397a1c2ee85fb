#pragma once

#include <pybind11/pybind11.h>

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "core/kvs.h"

namespace gridbay::python {

// The values of a keyword in Python's types: bool, int, float, str; a file as a pathlib.Path, None for no
// file; six whole numbers as a datetime, None for no date; several values as a tuple, a list that takes any
// number of them as a list.
pybind11::object objectOf(const Node& keyword, bool takesAnyNumber);

// What Python gives as the values of a keyword, of the kinds that it has now. The path is for errors. Throws
// a Refusal for a value of a wrong type, for one out of range, and for a wrong number of them.
std::vector<Value> valuesOf(pybind11::handle given, const Node& keyword, bool takesAnyNumber,
                            const std::string& path, ParameterTree& keeper);

// The rules for one value, each with the same errors.
bool isBool(pybind11::handle given);
bool boolOf(pybind11::handle given, const std::string& path);
std::int32_t wholeOf(pybind11::handle given, const std::string& path);
double realOf(pybind11::handle given, const std::string& path);
std::string textOf(pybind11::handle given, const std::string& path);
// Of a str or a path; empty for None.
std::string fileOf(pybind11::handle given, const std::string& path);
// Year to second of a datetime that has neither a time zone nor a part of a second.
std::array<std::int32_t, 6> momentOf(pybind11::handle given, const std::string& path);
// The pieces of what can be walked and is no text.
std::vector<pybind11::object> piecesOf(pybind11::handle given, const std::string& path,
                                       const std::string& allowed);

// A text as a str; bytes that are no UTF-8 as Python keeps those of file names.
pybind11::object textObject(std::string_view text);

}  // namespace gridbay::python
