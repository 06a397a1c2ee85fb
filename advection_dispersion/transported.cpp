#include "advection_dispersion/transported.h"

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/component.h"
#include "basic/basic_parts.h"
#include "basic/source_sink.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Component = CNadComponentObjectKvs;

std::int32_t typeOf(CKvsBase& object, int number) {
  CNadComponentKvs* components = componentsOf(object);
  const Component* component = components == nullptr ? nullptr : components->GetItem(number);
  return component == nullptr ? std::int32_t{Component::kConservative} : component->type;
}

bool isHeat(std::int32_t type) {
  return type == Component::kHeatDissipating || type == Component::kHeatExchange;
}

const Text& descriptionOf(std::int32_t type) {
  switch (type) {
    case Component::kDecaying:
      return texts::decayingRequest;
    case Component::kHeatDissipating:
      return texts::dissipatingRequest;
    case Component::kHeatExchange:
      return texts::exchangeRequest;
    default:
      return texts::conservativeRequest;
  }
}

bool isPair(CKvsBase& object, int source) {
  auto* basic = object.parts<BasicParts>();
  const CSourceSinkObjectKvs* location = basic == nullptr ? nullptr : basic->sourceSink->GetItem(source);
  return location != nullptr && location->type == CSourceSinkObjectKvs::kPair;
}

void requestItem(CVdFileSelectorDlg& selector, std::int32_t type, int heat) {
  CVdRqTsbItem& request = selector.AddRequest();
  request.SetSelectionDescr(descriptionOf(type).format);
  request.SetQunType(isHeat(type) ? heat : item::kConcentration);
}

void requestAll(CVdFileSelectorDlg& selector, CKvsBase& object, int heat) {
  const int components = AdComponents::count(object);
  selector.SetNoItems(components);
  for (int number = 1; number <= components; ++number) requestItem(selector, typeOf(object, number), heat);
}

}  // namespace

CNadComponentKvs* componentsOf(CKvsBase& object) {
  auto* module = object.parts<AdvectionDispersionParts>();
  return module == nullptr ? nullptr : module->nadComponent.get();
}

int AdComponents::count(CKvsBase& object) {
  const CNadComponentKvs* components = componentsOf(object);
  return components == nullptr ? 0 : components->GetCount();
}

std::string AdComponents::name(CKvsBase& object, int component) {
  CNadComponentKvs* components = componentsOf(object);
  const Component* found = components == nullptr ? nullptr : components->GetItem(component);
  return found == nullptr ? std::string() : found->name;
}

int AdComponents::quantity(CKvsBase& object, int component) {
  const std::int32_t type = typeOf(object, component);
  const bool isSubstance = type == Component::kConservative || type == Component::kDecaying;
  return isSubstance ? item::kConcentration : item::kTemperature;
}

int AdComponents::itemQuantity(CKvsBase& object, int component) {
  return isHeat(typeOf(object, component)) ? item::kTemperature : item::kConcentration;
}

int AdComponents::sourceQuantity(CKvsBase& object, int component, int source) {
  const int quantityOfWater = quantity(object, component);
  const bool isDifference = quantityOfWater == item::kTemperature && isPair(object, source);
  return isDifference ? item::kTemperatureDifference : quantityOfWater;
}

void AdComponents::requestItems(CVdFileSelectorDlg& selector, CKvsBase& object) {
  requestAll(selector, object, item::kTemperature);
}

void AdComponents::requestSourceItems(CVdFileSelectorDlg& selector, CKvsBase& object, int source) {
  requestAll(selector, object, isPair(object, source) ? item::kTemperatureDifference : item::kTemperature);
}

}  // namespace gridbay
