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
// "FAULT; allowed is ALLOWED", of a file that can't be used: the fault names it.
Refusal fileRefusal(const std::string& path, const std::string& fault, std::string_view allowed);
inline constexpr std::string_view kReadableSetup = "a setup that can be read";
inline constexpr std::string_view kReadableData = "a data file that can be read (*.tsb0, *.tsb1, *.tsb2)";
inline constexpr std::string_view kReadableGrid = "a grid that can be read (*.tsb2)";
inline constexpr std::string_view kNewFile = "a file that is not there yet, or force=True";
inline constexpr std::string_view kWritableFile = "a file that can be written";
// As Python shows it, with its type; of a long one the beginning.
std::string shown(pybind11::handle value);

// Each adds what its source has to the module.
void addDocument(pybind11::module_& module);
void addConversions(pybind11::module_& module);
void addDataFiles(pybind11::module_& module);
void addFloodModels(pybind11::module_& module);
void addClimateChange(pybind11::module_& module);
void addKeywordList(pybind11::module_& module);

}  // namespace gridbay::python
