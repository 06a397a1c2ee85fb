#pragma once

#include <string_view>

#include "core/list_kvs.h"
#include "ecology/model_definition.h"
#include "families/area_values.h"

// What the definition asks of the user for its processes, constants and forcings: for each declaration a
// value or files, unless it is built in, when the engine works it out.

namespace gridbay {

template <class Self, CSolverItem::Kind kind>
class GivenItemKvs : public TableKvs<Self> {
 public:
  static constexpr std::int32_t kConstant = 0;

  using TableKvs<Self>::TableKvs;
  using TableKvs<Self>::Validate;

  std::int32_t number = 0;  // of its declaration, from 1
  std::int32_t format = kConstant;
  double value = 0;

  // Null where the definition has no such one.
  const CSolverItem* Declaration() const {
    const auto* model = modelDefinitionOf(const_cast<GivenItemKvs&>(*this));  // to ask its model
    return model == nullptr ? nullptr : model->item(kind, number);
  }
  bool IsUserSpecified() const {
    const CSolverItem* declared = Declaration();
    return declared != nullptr && declared->userSpecified;
  }
  bool IsConstant() const { return format == kConstant; }
  // Whether the value can be given in another way than as a constant everywhere.
  bool HasSpatialVariation() const {
    const CSolverItem* declared = Declaration();
    return declared != nullptr && declared->spatialVariation != CSolverItem::kNone;
  }

 protected:
  // What the section says first. It follows from the declaration.
  static constexpr auto declaredRows() {
    const auto isBuiltIn = [](const Self& item) { return !item.IsUserSpecified(); };
    return keywords(
        writtenOnly("ID", [](const Self& item) { return of(item).id; }),
        writtenOnly("User_Specified", [](const Self& item) { return item.IsUserSpecified(); }),
        onlyIf(isUsers,
               writtenOnly("Spatial_Variation", [](const Self& item) { return of(item).spatialVariation; })),
        onlyIf(isBuiltIn, writtenOnly("Built_In_ID", [](const Self& item) { return of(item).builtInId; })));
  }
  static constexpr auto formatRow() { return onlyIf(isUsers, keyword("Data_Format", &GivenItemKvs::format)); }
  static bool isUsers(const Self& item) { return item.IsUserSpecified(); }

 private:
  static const CSolverItem& of(const Self& item) {
    static const CSolverItem kUndeclared(kind);
    const CSolverItem* declared = item.Declaration();
    return declared == nullptr ? kUndeclared : *declared;
  }
};

// All of a kind, in the section `Self::kSection`, which says how many they are under `Self::kCount`; each has
// a section `Self::kItem`. How many they are is told by the definition alone.
template <class Self, class Item, CSolverItem::Kind kind>
class GivenListKvs : public ListKvs<Self, Item> {
 public:
  using ListKvs<Self, Item>::ListKvs;

  static constexpr auto table() {
    return section(Self::kSection,
                   writtenOnly(Self::kCount, [](const Self& list) { return list.GetCount(); }),
                   items(Self::kItem));
  }
  void initialise(Item& item, int number) {
    item.number = number;
    if (const CSolverItem* declared = item.Declaration()) item.value = declared->defaultValue;
    if constexpr (requires { item.SetNoAreas(0); }) item.SetNoAreas(areaCount(*this));
  }

  void Rebuild() {
    const auto* model = modelDefinitionOf(*this);
    this->SetCount(0);
    if (model != nullptr) this->SetCount(static_cast<int>(model->items(kind).size()));
  }
};

}  // namespace gridbay
