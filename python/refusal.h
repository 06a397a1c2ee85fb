#pragma once

#include <pybind11/pybind11.h>

#include <string>
#include <string_view>

namespace gridbay::python {

// What becomes an exception of the package, by the name of its class there (gridbay_setup/errors.py), with
// the path that it is about, what was given and what is allowed, as far as each applies.
struct Refusal {
  std::string_view kind;
  std::string text;
  std::string path = {};
  std::string given = {};
  std::string allowed = {};
};

inline constexpr std::string_view kFileError = "FileError";
inline constexpr std::string_view kPathError = "PathError";
inline constexpr std::string_view kRangeError = "RangeError";
inline constexpr std::string_view kWrongType = "WrongType";
inline constexpr std::string_view kWrongValue = "WrongValue";
inline constexpr std::string_view kStopped = "Stopped";

// "PATH: GIVEN was given; allowed is ALLOWED".
Refusal refusal(std::string_view kind, const std::string& path, const std::string& given,
                const std::string& allowed);
// As Python shows it, with its type; of a long one the beginning.
std::string shown(pybind11::handle value);

// Each adds what its source has to the module.
void addDocument(pybind11::module_& module);
void addConversions(pybind11::module_& module);
void addDataFiles(pybind11::module_& module);
void addExportedClasses(pybind11::module_& module);
void addKeywordList(pybind11::module_& module);

}  // namespace gridbay::python
