#pragma once

#include <string>
#include <string_view>
#include <tuple>

#include "core/date_time.h"
#include "core/edition.h"
#include "core/file_name.h"
#include "core/grid_point.h"
#include "core/kvs.h"
#include "core/selections.h"

// A data object names each field once, in a table in file order that ties keyword, type and member together:
//
//   static constexpr auto table() {
//     return section("FLOOD_AND_DRY",
//                    keyword("Drying_Depth", &CAreaDescriptionKvs::dryingDepth),
//                    keyword("Flooding_Depth", &CAreaDescriptionKvs::floodingDepth));
//   }
//
// Saving, loading and copying come from it. A row is any type with `save`, `load` and `copy`; the rows that
// occur again and again are made by the functions below.

namespace gridbay {

// How a type stands on file.
inline void putValue(KvsFile& file, std::string_view name, const auto& value, const std::string&) {
  kvsPutParam(file, name, value);
}
inline void putValue(KvsFile& file, std::string_view name, const std::string& value, const std::string&) {
  kvsPutParam(file, name, std::string_view(value));
}
inline void putValue(KvsFile& file, std::string_view name, const GridPoint& value, const std::string&) {
  kvsPutListParam(file, name, "ii", value.j, value.k);
}
inline void putValue(KvsFile& file, std::string_view name, const DateTime& value, const std::string&) {
  const auto [year, month, day, hour, minute, second] =
      value.parts().value_or(std::array{-1, -1, -1, -1, -1, -1});
  kvsPutListParam(file, name, "iiiiii", year, month, day, hour, minute, second);
}
inline void putValue(KvsFile& file, std::string_view name, const UFileName& value,
                     const std::string& documentPath) {
  value.Save(file, documentPath, name);
}

inline void getValue(KvsSection from, std::string_view name, auto& value, const std::string&) {
  kvsGetParam(from, name, &value, 1, 1);
}
inline void getValue(KvsSection from, std::string_view name, GridPoint& value, const std::string&) {
  kvsGetListParam(from, name, 1, "ii", &value.j, &value.k);
}
inline void getValue(KvsSection from, std::string_view name, DateTime& value, const std::string&) {
  if (kvsKeywordByNameNum(from, name, 1) == nullptr) return;
  std::array parts{-1, -1, -1, -1, -1, -1};
  kvsGetListParam(from, name, 1, "iiiiii", &parts[0], &parts[1], &parts[2], &parts[3], &parts[4], &parts[5]);
  value = DateTime::of(parts);
}
inline void getValue(KvsSection from, std::string_view name, UFileName& value,
                     const std::string& documentPath) {
  value.Load(from, documentPath, name);
}

// A keyword and the member that holds its value.
template <class Object, class T>
struct Keyword {
  std::string_view name;
  T Object::*member;

  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    putValue(file, name, object.*member, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    getValue(from, name, object.*member, documentPath);
  }
  void copy(Object& object, const Object& other) const { object.*member = other.*member; }
};

template <class Object, class T>
constexpr Keyword<Object, T> keyword(std::string_view name, T Object::*member) {
  return {name, member};
}

// A data file with its items, under keywords of its own.
template <class Object>
struct SelectionRow {
  UTsbSelection Object::*member;
  int noItems;

  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    (object.*member).Save(file, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    (object.*member).Load(from, documentPath, noItems);
  }
  void copy(Object& object, const Object& other) const { (object.*member).UpdateData(other.*member); }
};

template <class Object>
constexpr SelectionRow<Object> selection(UTsbSelection Object::*member, int noItems) {
  return {member, noItems};
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

// A keyword that the Wetland Sweep Kit does not offer: there it is written with a fixed value, and has that
// value after a load whatever the file says.
template <class Object, class T>
struct Pinned {
  Keyword<Object, T> row;
  T fixed;

  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    putValue(file, row.name, theEdition.wetlandSweepKit ? fixed : object.*row.member, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    row.load(object, from, documentPath);
    if (theEdition.wetlandSweepKit) object.*row.member = fixed;
  }
  void copy(Object& object, const Object& other) const { row.copy(object, other); }
};

template <class Object, class T>
constexpr Pinned<Object, T> pinned(Keyword<Object, T> row, T fixed) {
  return {row, fixed};
}

// Rows in file order, inside a section of their own unless the name is empty.
template <class... Rows>
struct KeywordTable {
  std::string_view name;
  std::tuple<Rows...> rows;

  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    if (!name.empty()) kvsAddSection(file, name);
    std::apply([&](const auto&... row) { (row.save(object, file, documentPath), ...); }, rows);
    if (!name.empty()) kvsEndSection(file);
  }
  // A section that is missing leaves the object as it is; false then.
  bool load(auto& object, KvsSection from, const std::string& documentPath) const {
    if (!name.empty()) from = kvsSectionByNameNum(from, name, 1);
    if (from == nullptr) return false;
    std::apply([&](const auto&... row) { (row.load(object, from, documentPath), ...); }, rows);
    return true;
  }
  void copy(auto& object, const auto& other) const {
    std::apply([&](const auto&... row) { (row.copy(object, other), ...); }, rows);
  }
};

// The table of an object with its own section, or of a sub-section within another table.
template <class... Rows>
constexpr KeywordTable<Rows...> section(std::string_view name, Rows... rows) {
  return {name, {rows...}};
}

// The table of an object whose section its owner opens.
template <class... Rows>
constexpr KeywordTable<Rows...> keywords(Rows... rows) {
  return {{}, {rows...}};
}

}  // namespace gridbay
