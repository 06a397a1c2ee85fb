#pragma once

#include <array>
#include <bit>
#include <charconv>
#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "core/kvs.h"

namespace gridbay {

class CKvsBase;

// What an edit has changed in one object, to be taken back and done again.
class StateChange {
 public:
  virtual ~StateChange() = default;
  // Forward from the state before to the one after, else the other way. The object is in the one it starts
  // from.
  virtual void apply(CKvsBase& object, bool forward) const = 0;
  // Memory that it takes, roughly.
  virtual std::size_t bytes() const = 0;
};

// How much of an object: all of it, or all but the items of its lists.
enum class StateScope { whole, withoutItems };

// A look at, or a change of, what a path names in an object. Sections and keywords are between slashes, as on
// file; the n-th of several of one name is "name[n]".
struct PathAccess {
  enum class What {
    write,  // writes the keyword or section under the cursor of `out`
    set,    // takes the keyword from the section `in`
    look,   // only finds out what is there
  };

  What what;
  KvsFile* out = nullptr;
  KvsSection in = nullptr;
  const std::string* documentPath = nullptr;
  bool onlySections = false;  // a keyword is passed over: a section may have its name

  // What was found.
  bool isSection = false;
  bool takesAnyNumber = false;  // of values
  int most = 0;                 // that it can be, of a count; 0 for no count
  bool isPinned = false;        // by the edition: it was not set
  bool isWrittenOnly = false;   // it follows from other values: it was not set
};

// The first step of a path and the rest behind its slash.
struct PathStep {
  std::string_view first;
  std::string_view rest;
  bool isLast() const { return rest.empty(); }
};
inline PathStep stepOf(std::string_view path) {
  const std::size_t slash = path.find('/');
  if (slash == path.npos) return {path, {}};
  return {path.substr(0, slash), path.substr(slash + 1)};
}

// A step that names one of several sections or keywords of a name, as "weir_data[2]", counted from 1; the
// name alone is the first of them. A number that is none is 0, which no occurrence has.
struct NamedOccurrence {
  std::string_view name;
  int number = 1;
};
inline NamedOccurrence occurrenceOf(std::string_view step) {
  const std::size_t bracket = step.rfind('[');
  if (bracket == step.npos || !step.ends_with(']')) return {step, 1};
  int number = 0;
  const char* end = step.data() + step.size() - 1;
  const auto [rest, error] = std::from_chars(step.data() + bracket + 1, end, number);
  return {step.substr(0, bracket), error == std::errc() && rest == end ? number : 0};
}

// Whether two values are the same to the last bit, so that not-a-number is the same as itself.
bool sameValue(const auto& a, const auto& b) {
  return a == b;
}
inline bool sameValue(float a, float b) {
  return std::bit_cast<std::uint32_t>(a) == std::bit_cast<std::uint32_t>(b);
}
inline bool sameValue(double a, double b) {
  return std::bit_cast<std::uint64_t>(a) == std::bit_cast<std::uint64_t>(b);
}
template <class T>
bool sameValue(const std::vector<T>& a, const std::vector<T>& b) {
  if (a.size() != b.size()) return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (!sameValue(a[i], b[i])) return false;
  }
  return true;
}
template <class T, std::size_t n>
bool sameValue(const std::array<T, n>& a, const std::array<T, n>& b) {
  for (std::size_t i = 0; i < n; ++i) {
    if (!sameValue(a[i], b[i])) return false;
  }
  return true;
}

}  // namespace gridbay
