#pragma once

#include <unordered_map>

#include "core/item_rows.h"
#include "ecology/transported.h"
#include "families/area_values.h"

namespace gridbay {

// The sections of a list with an item for each transported state variable. They go by the number that the
// definition gives the variable, and one that is missing is passed over.
template <class List>
struct VariableItemsRow : ListRow<List> {
  using ListRow<List>::list;

  static constexpr Text kSection{"STATE_VARIABLE_%d"};

  static int idOf(const CKvsBase& object, int entry) {
    return WqsVariables::id(const_cast<CKvsBase&>(object), entry);  // to ask its model
  }
  void save(const auto& object, KvsFile& file, const std::string& documentPath) const {
    auto& items = const_cast<std::remove_cvref_t<decltype(list.of(object))>&>(list.of(object));
    NumberedText name(kSection);
    for (int entry = 1; entry <= items.GetCount(); ++entry) {
      kvsAddSection(file, name.of(idOf(object, entry)));
      items.GetItem(entry)->Save(file, documentPath);
      kvsEndSection(file);
    }
  }
  void load(auto& object, KvsSection from, const std::string& documentPath) const {
    auto& items = list.of(object);
    NumberedText name(kSection);
    std::unordered_map<int, int> occurrences;  // of variables that have a number in common
    for (int entry = 1; entry <= items.GetCount(); ++entry) {
      const int id = idOf(object, entry);
      const KvsSection section = kvsSectionByNameNum(from, name.of(id), ++occurrences[id]);
      if (section != nullptr) items.GetItem(entry)->Load(section, documentPath);
    }
  }
  bool access(auto& object, std::string_view path, PathAccess& access) const {
    const PathStep step = stepOf(path);
    const std::optional<int> id = numberIn(step.first, kSection);
    auto& items = list.of(object);
    int entry = 1;
    while (id && entry <= items.GetCount() && idOf(object, entry) != *id) ++entry;
    auto* item = id ? items.GetItem(entry) : nullptr;
    if (item == nullptr) return false;
    if (!step.isLast()) return item->AccessPath(step.rest, access);
    access.isSection = true;
    if (access.what == PathAccess::What::write) {
      kvsAddSection(*access.out, formatted(kSection, *id));
      item->Save(*access.out, *access.documentPath);
      kvsEndSection(*access.out);
    }
    return true;
  }
};
constexpr VariableItemsRow<OwnList> variableItems() {
  return {};
}
template <class Object, class Item>
constexpr VariableItemsRow<ListMember<Object, Item>> variableItems(ItemList<Item> Object::*member) {
  return {{{member}}};
}

// The values of one transported state variable, one for each area; `Item` is a ValueOrFileKvs of doubles. Its
// owner tells it which variable it is for, and then how many areas there are.
template <class Self, class Item>
class VariableAreasKvs : public AreaValuesKvs<Self, Item> {
 public:
  using AreaValuesKvs<Self, Item>::AreaValuesKvs;

  std::int32_t variable = 0;  // its place among the transported ones, from 1

  static constexpr auto table() { return keywords(items("AREA_%d"), offFile(&VariableAreasKvs::variable)); }
  void initialise(Item& item, int) { item.value = WqsVariables::defaultValue(*this, variable); }
};

}  // namespace gridbay
