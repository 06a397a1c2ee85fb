#include "setup/setup_file.h"

#include <array>
#include <utility>

#include "basic/module_selection.h"

namespace gridbay {
namespace {

void listUnknown(KvsSection source, KvsSection saved, const std::string& path,
                 std::vector<std::string>& unknown) {
  for (const Node* node = source->first(); node != nullptr; node = node->next()) {
    if (!node->isSection()) continue;
    const std::string here = path + (path.empty() ? "" : "/") + std::string(node->name());
    const KvsSection twin = kvsSectionByNameNum(saved, node->name(), 1);
    if (twin == nullptr) {
      unknown.push_back(here);
    } else {
      listUnknown(node, twin, here, unknown);
    }
  }
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
  KvsHandle file = kvsCreate();
  model_->Save(*file, path);
  return file;
}

Outcome SetupFile::save(const std::string& path) {
  return saveCopy(path, path);
}

Outcome SetupFile::saveCopy(const std::string& copy, const std::string& path) {
  KvsHandle file = tree(path);
  if (kvsWrite(*file, copy)) return {};
  kvsGetErrorGlb();
  return Failure{kvsGetErrorText()};
}

std::vector<std::string> SetupFile::unknownSections(const std::string& path) {
  std::vector<std::string> unknown;
  const KvsSection target = kvsTargetByNameNum(*source_, CGlobalKvs::kTarget, 1);
  if (target == nullptr) return unknown;
  const KvsHandle saved = tree(path);
  listUnknown(target, kvsTargetByNameNum(*saved, CGlobalKvs::kTarget, 1), {}, unknown);
  std::erase_if(unknown, [this](const std::string& name) {
    return isOfOtherModule(std::string_view(name).substr(0, name.find('/')),
                           model_->moduleSelection->simulationType);
  });
  return unknown;
}

}  // namespace gridbay
