#include "setup/setup_file.h"

#include <array>
#include <exception>
#include <unordered_map>
#include <utility>

#include "basic/module_selection.h"

namespace gridbay {
namespace {

constexpr std::string_view kOptionParameters = "OPTION_PARAMETERS";

void listUnknown(KvsSection source, CGlobalKvs& model, const std::string& path,
                 std::vector<std::string>& unknown) {
  std::unordered_map<const Node*, int> repeats;  // of the first section of a name
  for (const Node* node = source->first(); node != nullptr; node = node->next()) {
    if (!node->isSection()) continue;
    std::string here = path + (path.empty() ? "" : "/") + std::string(node->name());
    if (const Node* first = source->section(node->name()); first != node)
      here += "[" + std::to_string(++repeats[first] + 1) + "]";
    const bool isOptions = sameName(node->name(), kOptionParameters);
    if (!model.KnowsSection(here)) {
      if (!isOptions || node->first() != nullptr) unknown.push_back(here);
    } else if (!isOptions) {
      listUnknown(node, model, here, unknown);
    }
  }
}

Outcome write(KvsFile& file, const std::string& path) {
  if (kvsWrite(file, path)) return {};
  kvsGetErrorGlb();
  return Failure{kvsGetErrorText()};
}

bool isOfOtherModule(std::string_view name, std::int32_t selected) {
  constexpr std::array<std::pair<std::string_view, std::int32_t>, 4> kModules{{
      {"ADVECTION_DISPERSION_MODULE", module::kAdvectionDispersion},
      {"MUD_TRANSPORT_MODULE", module::kMudTransport},
      {"MUD_TRANSPORT_EXPANDED_MODULE", module::kMudTransportExpanded},
      {"BIO_RIG_MODULE", module::kEcological},
  }};
  for (const auto& [section, code] : kModules) {
    if (sameName(name, section)) return code != selected;
  }
  return false;
}

}  // namespace

SetupFile::SetupFile(MessageHost* host) : source_(kvsCreate()), model_(std::make_unique<CGlobalKvs>(host)) {}

Result<SetupFile> SetupFile::open(const std::string& path, MessageHost* host,
                                  const std::optional<std::string>& documentPath) {
  KvsHandle file = kvsLoadFile(path, 0);
  if (kvsPeekErrorGlb() != kKvsNoError) {
    kvsGetErrorGlb();
    return Failure{kvsGetErrorText()};
  }
  if (kvsTargetByNameNum(*file, CGlobalKvs::kTarget, 1) == nullptr) {
    return Failure{"\"" + path + "\" is not a setup: it has no section " + std::string(CGlobalKvs::kTarget)};
  }
  return fromTree(std::move(file), documentPath.value_or(path), host);
}

SetupFile SetupFile::fromTree(KvsHandle tree, const std::string& path, MessageHost* host) {
  CollectingMessageHost said;
  SetupFile setup(&said);
  setup.source_ = std::move(tree);
  setup.model_->Load(&setup.source_->tree().root(), path);
  setup.model_->SetMessageHost(host);
  if (host != nullptr) showTogether(*host, said.texts);
  setup.model_->SetSourceFile(setup.source_.get());
  return setup;
}

KvsHandle SetupFile::tree(const std::string& path) {
  CGlobalKvs copy;
  copy.AssignState(*model_);
  copy.SetSourceFile(source_.get());
  KvsHandle file = kvsCreate();
  copy.Save(*file, path);
  return file;
}

// Nothing reaches the disk before the whole text is there.
Outcome SetupFile::save(const std::string& path) {
  try {
    KvsHandle file = kvsCreate();
    model_->Save(*file, path);
    return write(*file, path);
  } catch (const std::exception& fault) {
    return Failure{"The setup cannot be written: " + std::string(fault.what())};
  }
}

Outcome SetupFile::saveCopy(const std::string& copy, const std::string& path) {
  return write(*tree(path), copy);
}

void SetupFile::replaceSource(KvsHandle source) {
  source_ = std::move(source);
  model_->SetSourceFile(source_.get());
}

std::vector<std::string> SetupFile::unknownSections() {
  std::vector<std::string> unknown;
  const KvsSection target = kvsTargetByNameNum(*source_, CGlobalKvs::kTarget, 1);
  if (target == nullptr) return unknown;
  listUnknown(target, *model_, {}, unknown);
  std::erase_if(unknown, [this](const std::string& name) {
    return isOfOtherModule(std::string_view(name).substr(0, name.find('/')),
                           model_->moduleSelection->simulationType);
  });
  if (unknown.empty()) return unknown;
  // What a fresh load still holds has been taken out since, as the last items of a list that was shortened.
  CGlobalKvs loaded;
  loaded.Load(&source_->tree().root(), {});
  std::erase_if(unknown, [&loaded](const std::string& name) { return loaded.KnowsSection(name); });
  return unknown;
}

}  // namespace gridbay
