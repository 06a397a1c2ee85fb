#pragma once

#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>

#include "core/keyword_values.h"
#include "core/object_state.h"

// A data object names each field once, in a table in file order that ties keyword, type and member together:
//
//   static constexpr auto table() {
//     return section("FLOOD_AND_DRY",
//                    keyword("Drying_Depth", &CAreaDescriptionKvs::dryingDepth),
//                    keyword("Flooding_Depth", &CAreaDescriptionKvs::floodingDepth));
//   }
//
// Saving, loading and copying come from it; so do the object's exact state, which is copied and compared, and
// the way from a keyword's path to its member. A row is any type with `save`, `load` and `copy`; the rows
// that occur again and again are made by the functions of core/keyword_rows.h and core/item_rows.h. What a
// row has further:
//   members()                    the members that are its part of the state, as a tuple of pointers
//   name, and set(object, section, path) where taking a value is not what its load does
//   access(object, path, PathAccess&)   for a row of several keywords, or of a section
//   visitLists(object, other, visit)    for a row of items

namespace gridbay {
namespace table_detail {

template <class Row>
bool sameRow(const Row& row, const auto& a, const auto& b, StateScope scope) {
  if constexpr (requires { row.same(a, b, scope); }) {
    return row.same(a, b, scope);
  } else {
    return std::apply([&](const auto... member) { return (sameValue(a.*member, b.*member) && ...); },
                      row.members());
  }
}

template <class Row>
void assignRow(const Row& row, auto& object, const auto& other, StateScope scope) {
  if constexpr (requires { row.assign(object, other, scope); }) {
    row.assign(object, other, scope);
  } else {
    std::apply([&](const auto... member) { ((object.*member = other.*member), ...); }, row.members());
  }
}

template <class Row>
void refreshRow(const Row& row, auto& object, const auto& other) {
  if constexpr (requires { row.refresh(object, other); }) row.refresh(object, other);
}

template <class Row>
bool accessRow(const Row& row, auto& object, std::string_view path, PathAccess& access) {
  if constexpr (requires { row.access(object, path, access); }) {
    return row.access(object, path, access);
  } else if constexpr (requires { row.name; }) {
    if (access.onlySections || !sameName(path, row.name)) return false;
    if constexpr (requires { Row::kMost; }) access.most = Row::kMost;
    if (access.what == PathAccess::What::write) row.save(object, *access.out, *access.documentPath);
    if (access.what != PathAccess::What::set) return true;
    if constexpr (requires { row.set(object, access.in, *access.documentPath); }) {
      row.set(object, access.in, *access.documentPath);
    } else {
      row.load(object, access.in, *access.documentPath);
    }
    return true;
  } else {
    return false;
  }
}

}  // namespace table_detail

// Rows in file order, inside a section of their own unless the name is empty.
template <class... Rows>
struct KeywordTable {
  std::string_view sectionName;
  std::tuple<Rows...> rows;

  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    if (!sectionName.empty()) kvsAddSection(file, sectionName);
    std::apply([&](const auto&... row) { (row.save(object, file, documentPath), ...); }, rows);
    if (!sectionName.empty()) kvsEndSection(file);
  }
  // A section that is missing leaves the object as it is; false then.
  bool load(auto& object, KvsSection from, const std::string& documentPath) const {
    if (!sectionName.empty()) from = kvsSectionByNameNum(from, sectionName, 1);
    if (from == nullptr) return false;
    std::apply([&](const auto&... row) { (row.load(object, from, documentPath), ...); }, rows);
    return true;
  }
  void copy(auto& object, const auto& other) const {
    std::apply([&](const auto&... row) { (row.copy(object, other), ...); }, rows);
  }

  bool same(const auto& a, const auto& b, StateScope scope) const {
    return std::apply([&](const auto&... row) { return (table_detail::sameRow(row, a, b, scope) && ...); },
                      rows);
  }
  void assign(auto& object, const auto& other, StateScope scope) const {
    std::apply([&](const auto&... row) { (table_detail::assignRow(row, object, other, scope), ...); }, rows);
  }
  // Takes over what was read from other files, which is never a difference.
  void refresh(auto& object, const auto& other) const {
    std::apply([&](const auto&... row) { (table_detail::refreshRow(row, object, other), ...); }, rows);
  }
  void visitLists(auto& object, auto& other, auto&& visit) const {
    const auto each = [&](const auto& row) {
      if constexpr (requires { row.visitLists(object, other, visit); }) row.visitLists(object, other, visit);
    };
    std::apply([&](const auto&... row) { (each(row), ...); }, rows);
  }
  // Finds what the path names; false when there is no such thing.
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    if (!sectionName.empty()) {
      const PathStep step = stepOf(path);
      if (!sameName(step.first, sectionName)) return false;
      if (step.isLast()) {
        access.isSection = true;
        if (access.what == PathAccess::What::write) save(object, *access.out, *access.documentPath);
        return true;
      }
      path = step.rest;
    }
    return std::apply(
        [&](const auto&... row) { return (table_detail::accessRow(row, object, path, access) || ...); },
        rows);
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
