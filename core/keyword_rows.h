#pragma once

#include <string>
#include <string_view>
#include <tuple>

#include "core/edition.h"
#include "core/keyword_table.h"
#include "core/selections.h"

// The rows of tables that tie keywords to members.

namespace gridbay {

// A keyword and the member that holds its value.
template <class Object, class T>
struct Keyword {
  std::string_view name;
  T Object::*member;

  void put(KvsFile& file, const T& value, const std::string& documentPath) const {
    putValue(file, name, value, documentPath);
  }
  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    put(file, object.*member, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    getValue(from, name, object.*member, documentPath);
  }
  void copy(Object& object, const Object& other) const { object.*member = other.*member; }
  constexpr auto members() const { return std::tuple(member); }
};

template <class Object, class T>
constexpr Keyword<Object, T> keyword(std::string_view name, T Object::*member) {
  return {name, member};
}

// A list of numbers under one keyword, which takes as many as are given.
template <class Object, class T>
struct NumbersRow : Keyword<Object, std::vector<T>> {
  bool access(Object& object, std::string_view path, PathAccess& access) const {
    access.takesAnyNumber = sameName(path, this->name);
    return table_detail::accessRow(static_cast<const Keyword<Object, std::vector<T>>&>(*this), object, path,
                                   access);
  }
};

template <class Object, class T>
constexpr NumbersRow<Object, T> numbers(std::string_view name, std::vector<T> Object::*member) {
  return {{name, member}};
}

// Numbers of several members under one keyword, in order. Those that the keyword lacks stay as they are.
template <class... Members>
struct ValuesRow {
  std::string_view name;
  std::tuple<Members...> pointers;

  void save(const auto& object, KvsFile& file, const std::string&) const {
    kvsAddKeyword(file, name);
    std::apply([&](const auto... member) { (addValue(file, object.*member), ...); }, pointers);
  }
  void load(auto& object, KvsSection from, const std::string&) const {
    int number = 0;
    std::apply([&](const auto... member) { (kvsGetParam(from, name, &(object.*member), 1, ++number), ...); },
               pointers);
  }
  void copy(auto& object, const auto& other) const {
    std::apply([&](const auto... member) { ((object.*member = other.*member), ...); }, pointers);
  }
  constexpr auto members() const { return pointers; }
};

template <class... Members>
constexpr ValuesRow<Members...> values(std::string_view name, Members... members) {
  return {name, {members...}};
}

// A whole number in the model that is true or false on file, where anything but 0 is true.
template <class Object>
struct FlagRow {
  std::string_view name;
  std::int32_t Object::*member;

  void put(KvsFile& file, std::int32_t value, const std::string&) const {
    kvsPutParam(file, name, value != 0);
  }
  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    put(file, object.*member, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string&) const {
    bool flag = object.*member != 0;
    kvsGetParam(from, name, &flag, 1, 1);
    if (flag != (object.*member != 0)) object.*member = flag ? 1 : 0;
  }
  void copy(Object& object, const Object& other) const { object.*member = other.*member; }
  constexpr auto members() const { return std::tuple(member); }
};

template <class Object>
constexpr FlagRow<Object> flag(std::string_view name, std::int32_t Object::*member) {
  return {name, member};
}

// A data file with its items, under keywords of its own.
template <class Object>
struct SelectionRow {
  UTsbSelection Object::*member;
  std::optional<int> noItems;

  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    (object.*member).Save(file, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    (object.*member).Load(from, documentPath, noItems);
  }
  void copy(Object& object, const Object& other) const { (object.*member).UpdateData(other.*member); }
  constexpr auto members() const { return std::tuple(member); }
  bool access(Object& object, std::string_view path, PathAccess& access) const {
    return (object.*member).Access(path, access);
  }
};

// On load it has at most `noItems` items.
template <class Object>
constexpr SelectionRow<Object> selection(UTsbSelection Object::*member, int noItems) {
  return {member, noItems};
}

// It takes as many items as the file gives.
template <class Object>
constexpr SelectionRow<Object> selection(UTsbSelection Object::*member) {
  return {member, std::nullopt};
}

// First, last and interval along X and along Y, three numbers for each.
template <class Object>
struct SubAreaRow {
  std::string_view xName;
  std::string_view yName;
  USubArea Object::*member;

  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    putValue(file, xName, (object.*member).x, documentPath);
    putValue(file, yName, (object.*member).y, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    getValue(from, xName, (object.*member).x, documentPath);
    getValue(from, yName, (object.*member).y, documentPath);
  }
  void copy(Object& object, const Object& other) const { (object.*member).UpdateData(other.*member); }
  constexpr auto members() const { return std::tuple(member); }
  bool access(Object& object, std::string_view path, PathAccess& access) const {
    const bool isX = sameName(path, xName);
    if (!isX && !sameName(path, yName)) return false;
    USubLine& line = isX ? (object.*member).x : (object.*member).y;
    if (access.what == PathAccess::What::write)
      putValue(*access.out, isX ? xName : yName, line, *access.documentPath);
    if (access.what == PathAccess::What::set)
      getValue(access.in, isX ? xName : yName, line, *access.documentPath);
    return true;
  }
};

template <class Object>
constexpr SubAreaRow<Object> subArea(std::string_view xName, std::string_view yName,
                                     USubArea Object::*member) {
  return {xName, yName, member};
}

// First, last and interval, a keyword each. A part that is not on file has an empty name.
template <class Object>
struct SubLineRow {
  std::array<std::string_view, 3> names;
  USubLine Object::*member;

  static constexpr std::array kParts{&USubLine::first, &USubLine::last, &USubLine::interval};
  void save(const Object& object, KvsFile& file, const std::string&) const {
    for (std::size_t i = 0; i < names.size(); ++i) {
      if (!names[i].empty()) kvsPutParam(file, names[i], object.*member.*kParts[i]);
    }
  }
  void load(Object& object, KvsSection from, const std::string&) const {
    for (std::size_t i = 0; i < names.size(); ++i) {
      if (!names[i].empty()) kvsGetParam(from, names[i], &(object.*member.*kParts[i]), 1, 1);
    }
  }
  void copy(Object& object, const Object& other) const { (object.*member).UpdateData(other.*member); }
  constexpr auto members() const { return std::tuple(member); }
  bool access(Object& object, std::string_view path, PathAccess& access) const {
    for (std::size_t i = 0; i < names.size(); ++i) {
      if (names[i].empty() || !sameName(path, names[i])) continue;
      std::int32_t& part = object.*member.*kParts[i];
      if (access.what == PathAccess::What::write) kvsPutParam(*access.out, names[i], part);
      if (access.what == PathAccess::What::set) kvsGetParam(access.in, names[i], &part, 1, 1);
      return true;
    }
    return false;
  }
};

template <class Object>
constexpr SubLineRow<Object> subLine(std::string_view first, std::string_view last, std::string_view interval,
                                     USubLine Object::*member) {
  return {{first, last, interval}, member};
}

// A row that CopyFrom leaves out.
template <class Row>
struct NotCopied : Row {
  void copy(auto&, const auto&) const {}
};

template <class Row>
constexpr NotCopied<Row> notCopied(Row row) {
  return {row};
}

// A row that takes part in files only while a condition of the object holds: bool (*)(const Object&).
template <class Row, class Predicate>
struct OnlyIf : Row {
  Predicate applies;

  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    if (applies(object)) Row::save(object, file, documentPath);
  }
  void load(auto& object, KvsSection from, const std::string& documentPath) const {
    if (applies(object)) Row::load(object, from, documentPath);
  }
  // By its path it is there all the same.
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    return table_detail::accessRow(static_cast<const Row&>(*this), object, path, access);
  }
};

template <class Row, class Predicate>
constexpr OnlyIf<Row, Predicate> onlyIf(Predicate applies, Row row) {
  return {row, applies};
}

// A row that the Wetland Sweep Kit keeps off its files.
template <class Row>
constexpr auto flowModelOnly(Row row) {
  return onlyIf([](const auto&) { return !theEdition.wetlandSweepKit; }, row);
}

// A row that is read and never written, as a keyword of older files.
template <class Row>
struct ReadOnly : Row {
  void save(const auto&, KvsFile&, const std::string&) const {}
  bool access(auto&, std::string_view, PathAccess&) const { return false; }
};

template <class Row>
constexpr ReadOnly<Row> readOnly(Row row) {
  return {row};
}

// A keyword that follows from other values: written and never read. `value` is a function of the object.
template <class Function>
struct WrittenOnly {
  std::string_view name;
  Function value;

  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    putValue(file, name, value(object), documentPath);
  }
  void load(auto&, KvsSection, const std::string&) const {}
  void copy(auto&, const auto&) const {}
  constexpr auto members() const { return std::tuple(); }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    if (!sameName(path, name)) return false;
    access.isWrittenOnly = true;
    if (access.what == PathAccess::What::write) save(object, *access.out, *access.documentPath);
    return true;
  }
};

template <class Function>
constexpr WrittenOnly<Function> writtenOnly(std::string_view name, Function value) {
  return {name, value};
}

// A keyword that is loaded by a name, or in a way, that a save does not write: `loads` is a row of its own.
template <class Row, class LoadRow>
struct LoadedAs : Row {
  LoadRow loads;

  void load(auto& object, KvsSection from, const std::string& documentPath) const {
    loads.load(object, from, documentPath);
  }
  void set(auto& object, KvsSection from, const std::string& documentPath) const {
    Row::load(object, from, documentPath);
  }
};

template <class Row, class LoadRow>
constexpr LoadedAs<Row, LoadRow> loadedAs(Row row, LoadRow loads) {
  return {row, loads};
}

// What the Wetland Sweep Kit does with a keyword that it does not offer.
enum class Pin {
  onFile,  // it is written with a fixed value, and has that value after a load
  onLoad,  // it has the fixed value after a load, and is written as it is held
};

template <class Row, class T>
struct Pinned : Row {
  T fixed;
  Pin how;

  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    if (theEdition.wetlandSweepKit && how == Pin::onFile) {
      Row::put(file, fixed, documentPath);
    } else {
      Row::save(object, file, documentPath);
    }
  }
  void load(auto& object, KvsSection from, const std::string& documentPath) const {
    Row::load(object, from, documentPath);
    if (theEdition.wetlandSweepKit) object.*Row::member = fixed;
  }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    const bool found = table_detail::accessRow(static_cast<const Row&>(*this), object, path, access);
    if (found && theEdition.wetlandSweepKit) {
      access.isPinned = true;
      object.*Row::member = fixed;
    }
    return found;
  }
};

template <class Row, class T>
constexpr Pinned<Row, T> pinned(Row row, T fixed, Pin how = Pin::onFile) {
  return {row, fixed, how};
}

// Members of the state that stand on no file.
template <class... Members>
struct OffFile {
  std::tuple<Members...> pointers;

  void save(const auto&, KvsFile&, const std::string&) const {}
  void load(auto&, KvsSection, const std::string&) const {}
  void copy(auto&, const auto&) const {}
  constexpr auto members() const { return pointers; }
};

template <class... Members>
constexpr OffFile<Members...> offFile(Members... members) {
  return {{members...}};
}

// Members that were read from other files: they go with the state, and are never a difference of their own.
template <class... Members>
struct FromOtherFiles : OffFile<Members...> {
  bool same(const auto&, const auto&, StateScope) const { return true; }
  void refresh(auto& object, const auto& other) const {
    std::apply([&](const auto... member) { ((object.*member = other.*member), ...); }, this->pointers);
  }
};

template <class... Members>
constexpr FromOtherFiles<Members...> fromOtherFiles(Members... members) {
  return {{{members...}}};
}

}  // namespace gridbay
