#include "advection_dispersion/entries.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"

namespace gridbay {

int componentCount(CKvsBase& object) {
  auto* transport = object.parts<AdvectionDispersionParts>();
  return transport == nullptr || transport->nadComponent == nullptr ? 0 : transport->nadComponent->GetCount();
}

std::vector<std::string> componentNames(CKvsBase& object) {
  std::vector<std::string> names;
  for (int number = 1; number <= componentCount(object); ++number)
    names.push_back(object.parts<AdvectionDispersionParts>()->nadComponent->at(number).name);
  return names;
}

}  // namespace gridbay
