#pragma once

#include <cstdint>
#include <string>

#include "core/kvs.h"

namespace gridbay {

// One declaration of a model definition file. Equations are texts that the engine reads; here they are shown.
class CSolverItem {
 public:
  enum Kind : std::uint32_t {
    kStateVariable,
    kConstant,
    kForcing,
    kAuxiliaryVariable,
    kProcess,
    kDerivedOutput,
  };
  static constexpr std::size_t kKinds = 6;
  static constexpr std::int32_t kNoQuantity = 999;
  enum SpatialVariation : std::int32_t { kNone = 0, kHorizontal = 2, kWaterColumn = 3 };

  // The declaration in a sub-section of the file; what it lacks has its default.
  CSolverItem(std::uint32_t declaredKind, KvsSection from);
  explicit CSolverItem(std::uint32_t declaredKind) : CSolverItem(declaredKind, nullptr) {}
  CSolverItem(const CSolverItem&) = default;
  CSolverItem(CSolverItem&&) = default;
  CSolverItem& operator=(const CSolverItem&) = default;
  CSolverItem& operator=(CSolverItem&&) = default;
  virtual ~CSolverItem() = default;

  std::uint32_t kind;
  std::string symbol;
  std::int32_t id = 0;
  std::string description;
  std::string onlineHelp;
  std::string documentation;
  bool output = false;
  std::string scope;
  std::int32_t quantityCode = kNoQuantity;
  double defaultValue = 0;  // base units of the quantity, or in `unit`
  double minimum = 1;       // above the maximum where no limits are given
  double maximum = 0;
  std::string expression;
  std::string classText;
  bool userSpecified = false;
  std::int32_t builtInId = 0;
  std::string spatialVariationText;
  std::int32_t spatialVariation = kHorizontal;
  std::string unit;  // of the values as they are held and on file

  bool operator==(const CSolverItem&) const = default;

  // Whether the variable is carried with the water.
  bool IsTransported() const;
  // The item code for columns and fields, which convert to the user's unit; 0 for a quantity that the units
  // library does not know.
  int Quantity() const;
  // Whether limits are given; and whether a value lies between them, which none does where there are none.
  bool HasLimits() const { return maximum >= minimum; }
  bool IsInRange(double value) const { return value >= minimum && value <= maximum; }
  // Takes a text of the file as the expression, without its double quotes.
  void SetExpression(std::string text);
};

}  // namespace gridbay
