#pragma once

#include <pybind11/pybind11.h>

#include <string>
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

}  // namespace gridbay::python
