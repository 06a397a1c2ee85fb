#pragma once

#include <algorithm>
#include <cstdint>
#include <string_view>
#include <tuple>
#include <vector>

#include "core/keyword_table.h"

// Which entries of a module's list, as its components, an output is for.

namespace gridbay {

// One flag for each entry, in the order of the list.
using EntryFlags = std::vector<std::uint8_t>;

inline int chosenCount(const EntryFlags& flags) {
  return static_cast<int>(flags.size() - static_cast<std::size_t>(std::ranges::count(flags, 0)));
}

// The numbers (from 1) of the entries that are chosen, and how many they are. Numbers without a flag are
// passed over on load, and so are those beyond the count.
template <class Object>
struct ChosenRow {
  std::string_view countName;
  std::string_view numbersName;
  EntryFlags Object::*member;

  void saveCount(const Object& object, KvsFile& file) const {
    kvsPutParam(file, countName, chosenCount(object.*member));
  }
  void saveNumbers(const Object& object, KvsFile& file) const {
    kvsAddKeyword(file, numbersName);
    for (std::size_t i = 0; i < (object.*member).size(); ++i) {
      if ((object.*member)[i] != 0) kvsAddInt(file, static_cast<std::int32_t>(i) + 1);
    }
  }
  // The first `most` of the numbers that stand there.
  void loadNumbers(Object& object, KvsSection from, int most) const {
    EntryFlags& flags = object.*member;
    std::ranges::fill(flags, std::uint8_t{0});
    const KvsKeyword numbers = kvsKeywordByNameNum(from, numbersName, 1);
    if (numbers == nullptr) return;
    for (int place = 1; place <= std::min(most, kvsGetNoParams(numbers)); ++place) {
      const std::int32_t number = kvsGetInt(kvsParamByNum(numbers, place));
      if (1 <= number && number <= static_cast<std::int32_t>(flags.size()))
        flags[static_cast<std::size_t>(number) - 1] = 1;
    }
  }
  void copy(Object& object, const Object& other) const { object.*member = other.*member; }
  constexpr auto members() const { return std::tuple(member); }
  // The numbers are set, and the count follows from them.
  bool access(Object& object, std::string_view path, PathAccess& access) const {
    if (sameName(path, countName)) {
      access.isWrittenOnly = true;
      if (access.what == PathAccess::What::write) saveCount(object, *access.out);
      return true;
    }
    if (!sameName(path, numbersName)) return false;
    access.takesAnyNumber = true;
    if (access.what == PathAccess::What::write) saveNumbers(object, *access.out);
    if (access.what == PathAccess::What::set)
      loadNumbers(object, access.in, static_cast<int>((object.*member).size()));
    return true;
  }
};

// A flag for each entry, 0 or 1, all under one keyword. On load flags that it lacks stay as they are, and
// those without an entry are passed over.
template <class Object>
struct FlagsRow {
  std::string_view name;
  EntryFlags Object::*member;

  void save(const Object& object, KvsFile& file, const std::string&) const {
    kvsAddKeyword(file, name);
    for (const std::uint8_t flag : object.*member) kvsAddInt(file, flag);
  }
  void load(Object& object, KvsSection from, const std::string&) const {
    const KvsKeyword flags = kvsKeywordByNameNum(from, name, 1);
    if (flags == nullptr) return;
    int place = 0;
    for (std::uint8_t& flag : object.*member) {
      if (++place > kvsGetNoParams(flags)) break;
      flag = kvsGetInt(kvsParamByNum(flags, place)) != 0 ? 1 : 0;
    }
  }
  void copy(Object& object, const Object& other) const { object.*member = other.*member; }
  constexpr auto members() const { return std::tuple(member); }
};

template <class Object>
constexpr FlagsRow<Object> entryFlags(std::string_view name, EntryFlags Object::*member) {
  return {name, member};
}

// The numbers, and then their count. A load begins with no entry chosen.
template <class Object>
struct NumbersThenCount : ChosenRow<Object> {
  void save(const Object& object, KvsFile& file, const std::string&) const {
    this->saveNumbers(object, file);
    this->saveCount(object, file);
  }
  void load(Object& object, KvsSection from, const std::string&) const {
    std::int32_t count = 0;
    kvsGetParam(from, this->countName, &count, 1, 1);
    this->loadNumbers(object, from, count);
  }
};

template <class Object>
constexpr NumbersThenCount<Object> numbersThenCount(std::string_view numbers, std::string_view count,
                                                    EntryFlags Object::*member) {
  return {{count, numbers, member}};
}

// The count, and the numbers where there are any. Where the file has no count the choice stays. `entryCount`
// of the object says how many flags there are to be after a load.
template <class Object>
struct CountThenNumbers : ChosenRow<Object> {
  void save(const Object& object, KvsFile& file, const std::string&) const {
    this->saveCount(object, file);
    if (chosenCount(object.*(this->member)) > 0) this->saveNumbers(object, file);
  }
  void load(auto& object, KvsSection from, const std::string&) const {
    if (kvsKeywordByNameNum(from, this->countName, 1) == nullptr) return;
    std::int32_t count = 0;
    kvsGetParam(from, this->countName, &count, 1, 1);
    (object.*(this->member)).resize(static_cast<std::size_t>(object.entryCount()));
    this->loadNumbers(object, from, count);
  }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    if (access.what == PathAccess::What::set && sameName(path, this->numbersName))
      (object.*(this->member)).resize(static_cast<std::size_t>(object.entryCount()));
    return ChosenRow<Object>::access(object, path, access);
  }
};

template <class Object>
constexpr CountThenNumbers<Object> countThenNumbers(std::string_view count, std::string_view numbers,
                                                    EntryFlags Object::*member) {
  return {{count, numbers, member}};
}

}  // namespace gridbay
