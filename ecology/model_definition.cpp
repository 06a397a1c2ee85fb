#include "ecology/model_definition.h"

#include <algorithm>
#include <array>
#include <filesystem>

#include "core/item_rows.h"
#include "core/model_root.h"
#include "core/table_code.h"
#include "ecology/ecology_parts.h"
#include "ecology/texts.h"
#include "platform/files/program_path.h"

namespace gridbay {
namespace {

constexpr std::string_view kTemplateFolder = "Templates/BIORig";
constexpr std::string_view kExtension = ".biorig";
constexpr Text kStateVariable{"STATE_VARIABLE_%d"};

void writeStateVariable(const CSolverItem& variable, KvsFile& file) {
  kvsAddSection(file, formatted(kStateVariable, variable.id));
  kvsPutParam(file, "ID", variable.id);
  kvsPutParam(file, "Transport", variable.IsTransported() ? "AD" : "NONE");
  kvsPutParam(file, "Description", std::string_view(variable.description));
  kvsPutParam(file, "QUN_Type", variable.quantityCode);
  kvsPutParam(file, "Unit", std::string_view(variable.unit));
  kvsEndSection(file);
}

// The definitions in a folder, in the order of their names; none for a folder that is not there.
std::vector<std::filesystem::path> definitionsIn(const std::string& folder) {
  std::vector<std::filesystem::path> files;
  std::error_code error;
  for (std::filesystem::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
    const std::filesystem::path& path = it->path();
    std::error_code unreadable;
    if (it->is_directory(unreadable) || path.filename().string().starts_with('.')) continue;
    if (sameName(path.extension().string(), kExtension)) files.push_back(path);
  }
  std::ranges::sort(files);
  return files;
}

}  // namespace

CWQSModelDefinitionKvs::CWQSModelDefinitionKvs(CKvsBase* parent)
    : TableKvs(parent), definition_(readModelDefinition({})) {}

void CWQSModelDefinitionKvs::Load(KvsSection section, const std::string& documentPath) {
  TableKvs::Load(section, documentPath);
  Read();
  if (!definition_->fault.empty()) Tell(formatted(texts::definitionNotRead, definition_->fault));
}

void CWQSModelDefinitionKvs::Read() {
  definition_ = readModelDefinition(modelFile.absolute());
  const std::array counts{GetNoTransported()};
  if (auto* root = parts<ModelRoot>()) root->TellFollowers(*this, counts);
}

unsigned CWQSModelDefinitionKvs::Validate(ValidationList& messages, int) {
  const auto fault = [&messages](const Text& text) {
    return report(messages, PageId::ecoModelDefinition, Severity::fault, text);
  };
  unsigned faults = 0;
  if (definition_->IsEmpty()) faults += fault(texts::noModelDefinition);
  if (frequency < 1) faults += fault(texts::invalidUpdateFrequency);
  return faults;
}

const CSolverItem* CWQSModelDefinitionKvs::item(CSolverItem::Kind kind, int number) const {
  const std::vector<CSolverItem>& declared = items(kind);
  const bool isThere = number >= 1 && number <= static_cast<int>(declared.size());
  return isThere ? &declared[static_cast<std::size_t>(number) - 1] : nullptr;
}

const CSolverItem* CWQSModelDefinitionKvs::Transported(int number) const {
  if (number < 1 || number > GetNoTransported()) return nullptr;
  return StateVariable(transported()[static_cast<std::size_t>(number) - 1] + 1);
}

const std::vector<ModelTemplate>& CWQSModelDefinitionKvs::templates() {
  if (templates_.empty()) FindTemplates(CKTOConfigFiles::GetProgramPath(1) + std::string(kTemplateFolder));
  return templates_;
}

void CWQSModelDefinitionKvs::FindTemplates(const std::string& folder) {
  templates_.clear();
  for (const std::filesystem::path& path : definitionsIn(folder)) {
    const std::string name = readModelDefinition(path.string())->name;
    templates_.push_back({path.string(), name.empty() ? path.filename().string() : name});
  }
  templates_.push_back({{}, std::string(texts::fromFile.format)});
}

void CWQSModelDefinitionKvs::StateVariablesRow::save(const CWQSModelDefinitionKvs& object, KvsFile& file,
                                                     const std::string&) const {
  kvsAddSection(file, "STATE_VARIABLES");
  kvsPutParam(file, "NoOfComponents", object.GetNoStateVariables());
  for (const CSolverItem& variable : object.stateVariables()) writeStateVariable(variable, file);
  kvsEndSection(file);
}

bool CWQSModelDefinitionKvs::StateVariablesRow::access(CWQSModelDefinitionKvs& object, std::string_view path,
                                                       PathAccess& access) const {
  const PathStep step = stepOf(path);
  if (!sameName(step.first, "STATE_VARIABLES")) return false;
  if (step.isLast()) {
    access.isSection = true;
    if (access.what == PathAccess::What::write) save(object, *access.out, *access.documentPath);
    return true;
  }
  // One variable. What an earlier model had here is not missed.
  const PathStep inner = stepOf(step.rest);
  const std::optional<int> number = numberIn(inner.first, kStateVariable);
  if (!number || !inner.isLast()) return false;
  const auto found = std::ranges::find(object.stateVariables(), *number, &CSolverItem::id);
  if (found == object.stateVariables().end() && access.what != PathAccess::What::look) return false;
  access.isSection = true;
  if (access.what == PathAccess::What::write) writeStateVariable(*found, *access.out);
  return true;
}

CWQSModelDefinitionKvs* modelDefinitionOf(CKvsBase& object) {
  auto* module = object.parts<EcologyParts>();
  return module == nullptr ? nullptr : module->wqsModelDefinition.get();
}

}  // namespace gridbay
