#pragma once

namespace gridbay {

// Calls with each list in `held` that has an entry for each area: what follows the count of areas is such a
// list, or has some beside what else it holds, or in each of its own entries.
template <class Held, class Visit>
void visitAreaLists(Held& held, const Visit& visit) {
  const auto inEach = [&visit](auto& entries) {
    for (int number = 1; number <= entries.GetCount(); ++number) visitAreaLists(entries.at(number), visit);
  };
  if constexpr (requires { held.hotStarts; }) {
    visit(held.hotStarts);
  } else if constexpr (requires { held.filesX; }) {
    visit(held.filesX);
    visit(held.filesY);
  } else if constexpr (requires { held.surface; }) {
    inEach(held.surface);
    inEach(held.soil);
  } else if constexpr (requires { held.thicknesses; }) {
    inEach(held.components);
    inEach(held.thicknesses);
  } else if constexpr (requires { held.shearStress; }) {
    visit(held.shearStress);
  } else if constexpr (requires { held.bedComposition; }) {
    visit(held.bedComposition);
    visit(held.erosion);
  } else if constexpr (requires { held.variable.GetCount(); }) {
    visitAreaLists(held.constant, visit);
    visit(held.variable);
  } else if constexpr (requires { held.files; }) {
    visit(held.files);
  } else if constexpr (
      requires { held.at(1).GetCount(); } || requires { held.at(1).SetNoAreas(1); }) {
    inEach(held);
  } else {
    visit(held);
  }
}

}  // namespace gridbay
