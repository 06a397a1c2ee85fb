#pragma once

#include <algorithm>
#include <functional>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "pages/host.h"
#include "pages/map_pick.h"

namespace gridbay {

// Fields of a form that hold points together, and how these are pointed at on a map, as those of a cell are.
struct FieldPick {
  std::vector<Control*> fields;
  std::function<CellPick()> wanted;
  std::function<void(std::span<const PickedPlace>)> take;
};

// Stores the places in the fields, whatever was typed there; false where they are not as many as are wanted.
inline bool storePick(const FieldPick& pick, std::span<const PickedPlace> places) {
  const CellPick wanted = pick.wanted();
  if (places.size() < wanted.least || places.size() > wanted.most) return false;
  for (Control* field : pick.fields) field->fault.clear();
  pick.take(places);
  return true;
}

// A host that has a map, on which points of a form's fields are pointed at while it is shown.
class MapHost {
 public:
  virtual bool editFormWithPicks(std::string_view title, Form& form, std::span<const FieldPick> picks,
                                 const std::function<std::string()>& fault) = 0;

 protected:
  ~MapHost() = default;
};

// Shows a form by its host, as `editForm` does, with the picks of its fields where there is a map.
inline bool editForm(SetupHost& host, std::string_view title, Form& form, std::span<const FieldPick> picks,
                     const std::function<std::string()>& fault) {
  auto* map = dynamic_cast<MapHost*>(&host);
  return map == nullptr ? host.editForm(title, form, fault)
                        : map->editFormWithPicks(title, form, picks, fault);
}

}  // namespace gridbay
