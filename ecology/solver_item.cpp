#include "ecology/solver_item.h"

#include <algorithm>
#include <array>

#include "core/parameter_tree.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr std::string_view kTransportedClass = "ADVECTION_DISPERSION";
constexpr std::string_view kWaterColumnScope = "WC";

std::string textAt(KvsSection from, std::string_view keyword) {
  std::string text;
  kvsGetParam(from, keyword, &text, 1, 1);
  return text;
}

char upper(char letter) {
  return letter >= 'a' && letter <= 'z' ? static_cast<char>(letter - 'a' + 'A') : letter;
}

bool isYes(std::string_view text) {
  return std::ranges::equal(text, std::string_view("YES"), {}, upper);
}

// What the engine works out by itself.
bool isKnownBuiltIn(std::int32_t id) {
  return (id >= 1 && id <= 4) || (id >= 7 && id <= 22) || id == 64 || id == 65;
}

// Built-in forcings that the user has to give all the same.
bool isAlwaysUsers(std::int32_t id) {
  return id == 5 || id == 6 || id == 23;
}

}  // namespace

CSolverItem::CSolverItem(std::uint32_t declaredKind, KvsSection from) : kind(declaredKind) {
  const bool hasValue = kind == kStateVariable || kind == kConstant || kind == kForcing;
  const bool isGiven = kind == kConstant || kind == kForcing;
  const bool isWorkedOut = kind == kAuxiliaryVariable || kind == kProcess;
  if (from != nullptr) {
    if (kind != kDerivedOutput) symbol = textAt(from, "SYMBOL");
    kvsGetParam(from, "ID", &id, 1, 1);
    description = textAt(from, "DESCRIPTION");
    onlineHelp = textAt(from, "ONLINE_HELP");
    documentation = textAt(from, "DOCUMENTATION");
    scope = textAt(from, "SCOPE");
    unit = textAt(from, "UNIT");
    if (hasValue) {
      kvsGetParam(from, "QUN_TYPE", &quantityCode, 1, 1);
      kvsGetParam(from, "DEFAULT_VALUE", &defaultValue, 1, 1);
      kvsGetParam(from, "MIN_VALUE", &minimum, 1, 1);
      kvsGetParam(from, "MAX_VALUE", &maximum, 1, 1);
    } else {
      SetExpression(textAt(from, "EXPRESSION"));
    }
    if (kind == kStateVariable) classText = textAt(from, "TRANSPORT");
    if (kind == kProcess) classText = textAt(from, "PROCESS_TYPE");
    if (kind == kDerivedOutput) classText = textAt(from, "FORMAT");
    if (isGiven) {
      userSpecified = isYes(textAt(from, "IS_USER_SPECIFIED"));
      kvsGetParam(from, "BUILT_IN_ID", &builtInId, 1, 1);
    }
    if (kind != kStateVariable) spatialVariationText = textAt(from, "SPATIAL_VARIATION");
    if (isWorkedOut) output = isYes(textAt(from, "OUTPUT"));
  }
  if (isGiven) output = true;
  if (kind == kStateVariable) {
    spatialVariation = scope == kWaterColumnScope ? kWaterColumn : kHorizontal;
  } else {
    spatialVariation = spatialVariationText == "NONE" ? kNone : kHorizontal;
  }
  if (Quantity() != 0) unit = qunBaseUnit(quantityCode)->symbol;
  if (isGiven && !isKnownBuiltIn(builtInId)) userSpecified = true;
  if (kind == kForcing && isAlwaysUsers(builtInId)) userSpecified = true;
}

bool CSolverItem::IsTransported() const {
  return classText == kTransportedClass;
}

int CSolverItem::Quantity() const {
  return quantityCode != kNoQuantity && qunBaseUnit(quantityCode) != nullptr ? quantityCode : 0;
}

void CSolverItem::SetExpression(std::string text) {
  std::erase(text, '"');
  expression = std::move(text);
}

}  // namespace gridbay
