#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "ecology/solver_item.h"

namespace gridbay {

// What a model definition file declares, in its order; or nothing, and why. It does not change once it is
// read, so that copies of a model share it.
struct ModelDefinition {
  // A file beyond these limits is refused, so that no file can take all memory.
  static constexpr std::size_t kMostBytes = std::size_t{64} << 20U;
  static constexpr int kMostDeclarations = 200'000;

  ModelDefinition() = default;
  ModelDefinition(const ModelDefinition&) = delete;
  ModelDefinition& operator=(const ModelDefinition&) = delete;
  ~ModelDefinition() = default;

  std::string name;
  std::array<std::vector<CSolverItem>, CSolverItem::kKinds> items;  // by kind
  // Places (from 0) of the state variables that are carried with the water.
  std::vector<std::int32_t> transported;
  // What can be written beside the state variables: auxiliary variables, then processes, each if it is for
  // output, then all derived outputs.
  std::vector<const CSolverItem*> outputItems;
  // Why the file could not be read, with line and column where they are known; empty for one that was.
  std::string fault;

  bool IsEmpty() const;
};

// Whether two declare the same to the last word, as two readings of a file do; a default or limit
// that is not a number is no other's. By this the exact states of models are compared.
bool sameValue(const std::shared_ptr<const ModelDefinition>& a,
               const std::shared_ptr<const ModelDefinition>& b);

// Reads a file. An empty path gives an empty definition without a fault.
std::shared_ptr<const ModelDefinition> readModelDefinition(const std::string& path);

}  // namespace gridbay
