#include "ecology/model_definition_file.h"

#include <algorithm>
#include <filesystem>
#include <string_view>
#include <unordered_map>

#include "core/parameter_tree.h"
#include "core/string_table.h"
#include "ecology/texts.h"

namespace gridbay {
namespace {

constexpr std::string_view kTarget = "BIO_RIG_SETUP";

struct KindOfSection {
  std::uint32_t kind;
  std::string_view list;
  Text item;
};
constexpr KindOfSection kSections[] = {
    {CSolverItem::kStateVariable, "STATE_VARIABLES", {"STATE_VARIABLE_%d"}},
    {CSolverItem::kConstant, "CONSTANTS", {"CONSTANT_%d"}},
    {CSolverItem::kForcing, "FORCINGS", {"FORCING_%d"}},
    {CSolverItem::kAuxiliaryVariable, "AUXILIARY_VARIABLES", {"AUXILIARY_VARIABLE_%d"}},
    {CSolverItem::kProcess, "PROCESSES", {"PROCESS_%d"}},
    {CSolverItem::kDerivedOutput, "DERIVED_OUTPUTS", {"DERIVED_OUTPUT_%d"}},
};
constexpr std::string_view kEquations = "STATE_VARIABLE_EQUATIONS";
constexpr Text kEquation{"STATE_VARIABLE_EQUATION_%d"};

// The numbered sub-sections of a section, from 1 until a number has none.
template <class Take>
void forEachNumbered(KvsSection section, const Text& item, const Take& take) {
  if (section == nullptr) return;
  NumberedText name(item);
  for (int number = 1;; ++number) {
    const KvsSection found = kvsSectionByNameNum(section, name.of(number), 1);
    if (found == nullptr || !take(found)) return;
  }
}

// A name as lookups see it: its case, and blanks at its end, do not count.
std::string lookupName(std::string_view name) {
  std::string plain(name.substr(0, name.find_last_not_of(' ') + 1));
  std::ranges::transform(plain, plain.begin(), [](char letter) {
    return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
  });
  return plain;
}

// Each equation is that of the first state variable whose symbol is a keyword of its section.
void takeEquations(KvsSection target, std::vector<CSolverItem>& variables) {
  std::unordered_map<std::string, std::size_t> placeOf;
  for (std::size_t place = 0; place < variables.size(); ++place)
    placeOf.try_emplace(lookupName(variables[place].symbol), place);
  forEachNumbered(kvsSectionByNameNum(target, kEquations, 1), kEquation, [&](KvsSection equation) {
    std::size_t first = variables.size();
    for (const Node* node = equation->first(); node != nullptr; node = node->next()) {
      if (node->isSection()) continue;
      const auto found = placeOf.find(lookupName(node->name()));
      if (found != placeOf.end()) first = std::min(first, found->second);
    }
    if (first < variables.size()) {
      std::string text = variables[first].expression;
      kvsGetParam(equation, variables[first].symbol, &text, 1, 1);
      variables[first].SetExpression(std::move(text));
    }
    return true;
  });
}

// False when there are more declarations than may be.
bool takeDeclarations(KvsSection target, ModelDefinition& definition) {
  int left = ModelDefinition::kMostDeclarations;
  for (const KindOfSection& section : kSections) {
    auto& items = definition.items[section.kind];
    const KvsSection list = kvsSectionByNameNum(target, section.list, 1);
    if (list != nullptr)
      items.reserve(std::min<std::size_t>(list->sectionCount(), ModelDefinition::kMostDeclarations));
    forEachNumbered(list, section.item, [&](KvsSection found) {
      if (--left < 0) return false;
      items.emplace_back(section.kind, found);
      return true;
    });
  }
  return left >= 0;
}

void listWhatFollows(ModelDefinition& definition) {
  const auto& variables = definition.items[CSolverItem::kStateVariable];
  for (std::size_t place = 0; place < variables.size(); ++place) {
    if (variables[place].IsTransported()) definition.transported.push_back(static_cast<std::int32_t>(place));
  }
  for (const std::uint32_t kind :
       {CSolverItem::kAuxiliaryVariable, CSolverItem::kProcess, CSolverItem::kDerivedOutput}) {
    for (const CSolverItem& item : definition.items[kind]) {
      if (item.output || kind == CSolverItem::kDerivedOutput) definition.outputItems.push_back(&item);
    }
  }
}

// What is wrong with the file; empty for nothing.
std::string faultOf(const std::string& path, ModelDefinition& definition) {
  std::error_code error;
  const std::uintmax_t size = std::filesystem::file_size(path, error);
  if (!error && size > ModelDefinition::kMostBytes)
    return formatted(texts::definitionTooLarge, path, static_cast<int>(ModelDefinition::kMostBytes >> 20U));
  KvsHandle file = kvsLoadFile(path, 0);
  if (kvsGetErrorGlb() != kKvsNoError) return kvsGetErrorText();
  const KvsSection target = kvsTargetByNameNum(*file, kTarget, 1);
  if (target == nullptr) return formatted(texts::noDefinitionTarget, path);
  kvsGetParam(target, "DESCRIPTION", &definition.name, 1, 1);
  if (!takeDeclarations(target, definition)) {
    for (auto& items : definition.items) items.clear();
    return formatted(texts::tooManyDeclarations, path, ModelDefinition::kMostDeclarations);
  }
  takeEquations(target, definition.items[CSolverItem::kStateVariable]);
  kvsClose(&file);
  return {};
}

}  // namespace

bool ModelDefinition::IsEmpty() const {
  return std::ranges::all_of(items, [](const auto& declared) { return declared.empty(); });
}

bool sameValue(const std::shared_ptr<const ModelDefinition>& a,
               const std::shared_ptr<const ModelDefinition>& b) {
  if (a == b) return true;
  const auto isSame = [](const CSolverItem* item, const CSolverItem* other) { return *item == *other; };
  return a->name == b->name && a->items == b->items && a->transported == b->transported &&
         std::ranges::equal(a->outputItems, b->outputItems, isSame) && a->fault == b->fault;
}

std::shared_ptr<const ModelDefinition> readModelDefinition(const std::string& path) {
  auto definition = std::make_shared<ModelDefinition>();
  if (!path.empty()) {
    definition->fault = faultOf(path, *definition);
    listWhatFollows(*definition);
  }
  return definition;
}

}  // namespace gridbay
