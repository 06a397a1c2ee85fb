#pragma once

#include <charconv>
#include <optional>
#include <string_view>

#include "core/edition.h"
#include "core/item_list.h"
#include "core/keyword_table.h"
#include "core/name_bytes.h"
#include "core/string_table.h"

// The rows of tables that hold lists: their counts, and the numbered sections of their items.

namespace gridbay {

// A count in a file is believed as far as the sections beside it bear it out, and this much further.
inline constexpr int kCountSlack = 2048;
// The highest count that can be set by its path.
inline constexpr int kMostItems = 65535;

// As much of a count as the section bears out; what is left off is told.
template <class Show>
int believedCount(int count, KvsSection section, const Show& show) {
  const int sections = static_cast<int>(section->sectionCount());
  const int believed = std::min(count, sections + kCountSlack);
  if (believed < count) {
    show(formatted(texts::countNotBorneOut, std::string(section->name()), count, sections, believed));
  }
  return believed;
}

// The list of a holder that has one.
struct OwnList {
  static auto& of(auto& object) { return object.itemList(); }
  static void setCount(auto& object, int count) { object.SetCount(count); }
};
// One of the lists of a holder, by its member.
template <class Object, class Item>
struct ListMember {
  ItemList<Item> Object::*member;

  auto& of(auto& object) const { return object.*member; }
  void setCount(auto& object, int count) const { (object.*member).SetCount(count); }
};

// The row of the count. A count that the file lacks is 0, and a negative one leaves the list as it is.
template <class List>
struct CountRow {
  static constexpr int kMost = kMostItems;

  std::string_view name;
  List list;

  void save(const auto& object, KvsFile& file, const std::string&) const {
    kvsPutParam(file, name, list.of(object).GetCount());
  }
  void load(auto& object, KvsSection from, const std::string&) const {
    int count = 0;
    kvsGetParam(from, name, &count, 1, 1);
    if (count < 0) return;
    list.setCount(object, believedCount(count, from, [&](const std::string& text) { object.Tell(text); }));
  }
  void copy(auto&, const auto&) const {}
  constexpr auto members() const { return std::tuple(); }
  void set(auto& object, KvsSection from, const std::string&) const {
    int count = -1;
    kvsGetParam(from, name, &count, 1, 1);
    if (count <= kMost) list.setCount(object, count);
  }
};
constexpr CountRow<OwnList> count(std::string_view name) {
  return {name, {}};
}
template <class Object, class Item>
constexpr CountRow<ListMember<Object, Item>> count(std::string_view name, ItemList<Item> Object::*member) {
  return {name, {member}};
}

// A count that the Wetland Sweep Kit fixes, on file and after a load.
struct PinnedCountRow {
  std::string_view name;
  int fixed = 0;

  constexpr CountRow<OwnList> row() const { return {name, {}}; }
  void save(const auto& list, KvsFile& file, const std::string& documentPath) const {
    if (theEdition.wetlandSweepKit) {
      kvsPutParam(file, name, fixed);
    } else {
      row().save(list, file, documentPath);
    }
  }
  void load(auto& list, KvsSection from, const std::string& documentPath) const {
    if (theEdition.wetlandSweepKit) {
      list.SetCount(fixed);
    } else {
      row().load(list, from, documentPath);
    }
  }
  void copy(auto&, const auto&) const {}
  constexpr auto members() const { return std::tuple(); }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    if (!sameName(path, name)) return false;
    access.isPinned = theEdition.wetlandSweepKit;
    if (access.what == PathAccess::What::write) save(object, *access.out, *access.documentPath);
    if (access.what == PathAccess::What::set && !access.isPinned)
      row().set(object, access.in, *access.documentPath);
    return true;
  }
};
constexpr PinnedCountRow pinnedCount(std::string_view name, int fixed) {
  return {name, fixed};
}

// The number in a name such as "AREA_12" of the format "AREA_%d"; nothing for any other name.
inline std::optional<int> numberIn(std::string_view name, const Text& format) {
  name = names::trimmed(name);
  const std::string_view prefix = format.format.substr(0, format.format.rfind('%'));
  if (name.size() <= prefix.size() || !sameName(name.substr(0, prefix.size()), prefix)) return std::nullopt;
  int number = 0;
  const char* end = name.data() + name.size();
  const auto [rest, error] = std::from_chars(name.data() + prefix.size(), end, number);
  return error == std::errc() && rest == end ? std::optional(number) : std::nullopt;
}

// What an item's Save and Load get beside the file: nothing.
struct NoArgument {};

// What all rows of items do with their list.
template <class List>
struct ListRow {
  List list;

  void copy(auto& object, const auto& other) const { list.of(object).CopyFrom(list.of(other)); }
  bool same(const auto& a, const auto& b, StateScope scope) const {
    return scope == StateScope::withoutItems || list.of(a).same(list.of(b));
  }
  void assign(auto& object, const auto& other, StateScope scope) const {
    if (scope == StateScope::whole) list.of(object).assign(list.of(other));
  }
  void refresh(auto& object, const auto& other) const { list.of(object).refresh(list.of(other)); }
  void visitLists(auto& object, auto& other, auto&& visit) const { visit(list.of(object), list.of(other)); }
};

// The row of the items: their numbered sections, and the text shown for a section that is missing; without
// one it is passed over in silence. An argument goes to each item's Save and Load.
template <class List, class Argument = NoArgument>
struct ItemsRow : ListRow<List> {
  using ListRow<List>::list;

  Text sectionName;
  Text missing;
  [[no_unique_address]] Argument argument = {};

  void saveItem(auto& item, KvsFile& file, const std::string& documentPath) const {
    if constexpr (std::is_same_v<Argument, NoArgument>) {
      item.Save(file, documentPath);
    } else {
      item.Save(file, documentPath, argument);
    }
  }
  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    // Saving an item may change it, as a filter of what can't be written does.
    auto& items = const_cast<std::remove_cvref_t<decltype(list.of(object))>&>(list.of(object));
    NumberedText name(sectionName);
    for (int number = 1; number <= items.GetCount(); ++number) {
      kvsAddSection(file, name.of(number));
      saveItem(*items.GetItem(number), file, documentPath);
      kvsEndSection(file);
    }
  }
  void load(auto& object, KvsSection section, const std::string& documentPath) const {
    auto& items = list.of(object);
    NumberedText name(sectionName);
    for (int number = 1; number <= items.GetCount(); ++number) {
      const KvsSection itemSection = kvsSectionByNameNum(section, name.of(number), 1);
      if (itemSection == nullptr) {
        if (!missing.format.empty()) object.Tell(formatted(missing));
      } else if constexpr (std::is_same_v<Argument, NoArgument>) {
        items.GetItem(number)->Load(itemSection, documentPath);
      } else {
        items.GetItem(number)->Load(itemSection, documentPath, argument);
      }
    }
  }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    const PathStep step = stepOf(path);
    const std::optional<int> number = numberIn(step.first, sectionName);
    auto* item = number ? list.of(object).GetItem(*number) : nullptr;
    if (item == nullptr) return false;
    if (!step.isLast()) return item->AccessPath(step.rest, access);
    access.isSection = true;
    if (access.what == PathAccess::What::write) {
      kvsAddSection(*access.out, formatted(sectionName, *number));
      saveItem(*item, *access.out, *access.documentPath);
      kvsEndSection(*access.out);
    }
    return true;
  }
};
constexpr ItemsRow<OwnList> items(std::string_view sectionName, Text missing = {}) {
  return {{}, {sectionName}, missing, {}};
}
template <class Object, class Item>
constexpr ItemsRow<ListMember<Object, Item>> items(std::string_view sectionName,
                                                   ItemList<Item> Object::*member, Text missing = {}) {
  return {{{member}}, {sectionName}, missing, {}};
}
template <class Object, class Item, class Argument>
constexpr ItemsRow<ListMember<Object, Item>, Argument> itemsWith(Argument argument,
                                                                 std::string_view sectionName,
                                                                 ItemList<Item> Object::*member,
                                                                 Text missing = {}) {
  return {{{member}}, {sectionName}, missing, argument};
}

// The rows of a list whose sections all have one name and are told apart by their order: the count, and the
// items. A load makes the list anew, and each item with what the file has of it: an item whose section is
// missing has its defaults. For a list that no other one follows. An object may have
//   void completeLoaded(Item&, KvsSection)   defaults of what the item's section, or null, lacks
// A path has the number of the item in brackets: "weir_data[2]".
template <class List>
struct RepeatedItemsRow : ListRow<List> {
  using ListRow<List>::list;

  CountRow<List> count;
  std::string_view sectionName;

  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    count.save(object, file, documentPath);
    auto& items = const_cast<std::remove_cvref_t<decltype(list.of(object))>&>(list.of(object));
    for (int number = 1; number <= items.GetCount(); ++number)
      saveItem(*items.GetItem(number), file, documentPath);
  }
  void load(auto& object, KvsSection from, const std::string& documentPath) const {
    int stated = 0;
    kvsGetParam(from, count.name, &stated, 1, 1);
    auto& items = list.of(object);
    items.SetCount(0);
    items.SetCount(
        believedCount(std::max(stated, 0), from, [&](const std::string& text) { object.Tell(text); }));
    for (int number = 1; number <= items.GetCount(); ++number) {
      auto& item = *items.GetItem(number);
      const KvsSection section = kvsSectionByNameNum(from, sectionName, number);
      if (section != nullptr) item.Load(section, documentPath);
      if constexpr (requires { object.completeLoaded(item, section); }) object.completeLoaded(item, section);
    }
  }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    if (table_detail::accessRow(count, object, path, access)) return true;
    const PathStep step = stepOf(path);
    const NamedOccurrence named = occurrenceOf(step.first);
    auto* item = sameName(named.name, sectionName) ? list.of(object).GetItem(named.number) : nullptr;
    if (item == nullptr) return false;
    if (!step.isLast()) return item->AccessPath(step.rest, access);
    access.isSection = true;
    if (access.what == PathAccess::What::write) saveItem(*item, *access.out, *access.documentPath);
    return true;
  }

 private:
  void saveItem(auto& item, KvsFile& file, const std::string& documentPath) const {
    kvsAddSection(file, sectionName);
    item.Save(file, documentPath);
    kvsEndSection(file);
  }
};
constexpr RepeatedItemsRow<OwnList> repeatedItems(std::string_view countName, std::string_view sectionName) {
  return {{}, count(countName), sectionName};
}

// The rows of a list whose count is on file for others alone: the items of a load are found by their
// sections, from 1 until a number has none. They have no defaults that depend on their numbers.
template <class List>
struct FoundCountRow : CountRow<List> {
  void load(auto&, KvsSection, const std::string&) const {}
};
constexpr FoundCountRow<OwnList> foundCount(std::string_view name) {
  return {{name, {}}};
}

template <class List>
struct FoundItemsRow : ItemsRow<List> {
  void load(auto& object, KvsSection section, const std::string& documentPath) const {
    auto& items = this->list.of(object);
    items.SetCount(0);
    NumberedText name(this->sectionName);
    for (int number = 1;; ++number) {
      const KvsSection itemSection = kvsSectionByNameNum(section, name.of(number), 1);
      if (itemSection == nullptr) break;
      items.AppendPlain().Load(itemSection, documentPath);
    }
    this->list.setCount(object, items.GetCount());  // for those who follow
  }
};
constexpr FoundItemsRow<OwnList> foundItems(std::string_view sectionName) {
  return {{{}, {sectionName}, {}, {}}};
}

}  // namespace gridbay
