#include "scripting/scripted_model.h"

#include <cstdio>
#include <exception>

#include "basic/module_selection.h"
#include "platform/files/paths.h"

namespace gridbay {

ScriptedModel::ScriptedModel(bool isInlandFlood) : isInlandFlood_(isInlandFlood) {
  clearFeatures();
}

void ScriptedModel::clearFeatures() {
  if (!isInlandFlood_) return;
  root.moduleSelection->highPrecision = false;
  root.moduleSelection->hydrodynamicFeatures = 0;
}

std::unique_lock<std::mutex> ScriptedModel::lockDataFiles() {
  static std::mutex dataFiles;
  return std::unique_lock(dataFiles);
}

void ScriptedModel::show(const std::string& text) {
  const scripting::MessageBox box = show_;
  struct Freed {
    std::recursive_mutex& mutex;

    explicit Freed(std::recursive_mutex& held) : mutex(held) { mutex.unlock(); }
    Freed(const Freed&) = delete;
    Freed& operator=(const Freed&) = delete;
    ~Freed() { mutex.lock(); }
  };
  const Freed freed(mutex_);
  if (box) {
    box(text);
  } else {
    std::fprintf(stderr, "%s\n", text.c_str());
  }
}

ScriptedModel::Loaded ScriptedModel::load(const std::string& fileName) {
  KvsHandle file = kvsLoadFile(fileName, 0);
  Loaded loaded{.isRead = kvsPeekErrorGlb() == kKvsNoError};
  if (loaded.isRead) {
    if (kvsTargetByNameNum(*file, CGlobalKvs::kTarget, 1) == nullptr) {
      loaded.fault =
          "\"" + fileName + "\" is not a setup: it has no section " + std::string(CGlobalKvs::kTarget);
    } else {
      if (!documentPath_.empty()) {  // a root takes one load
        root.AssignState(CGlobalKvs());
        clearFeatures();
      }
      documentPath_ = absolutePath(fileName, {});
    }
    root.Load(&file->tree().root(), fileName);
  } else {
    loaded.fault = kvsGetErrorText();
    if (kvsGetErrorGlb() == kKvsSyntaxError) {
      int line = 0;
      int column = 0;
      std::string text;
      kvsGetSyntaxErr(file.get(), &line, &column, &text);
      show(text);
    }
  }
  kvsClose(&file);
  const auto dataFiles = lockDataFiles();
  ValidationList dropped;
  root.Validate(dropped, 1);
  return loaded;
}

std::string ScriptedModel::errorTexts() {
  const auto dataFiles = lockDataFiles();
  ValidationList messages;
  root.Validate(messages, 1);
  std::string lines;
  for (const CMessage& message : messages) {
    if (!lines.empty()) lines += '\n';
    lines += "VANE 27: " + message.text;
  }
  return lines;
}

Outcome ScriptedModel::save(const std::string& fileName, const std::string& texts) {
  // A message box that throws does not keep the setup from being written.
  std::exception_ptr thrown;
  try {
    if (!texts.empty()) show(texts);
  } catch (...) {
    thrown = std::current_exception();
  }
  Outcome written = write(fileName);
  if (!written) show(written.error());
  if (thrown) std::rethrow_exception(thrown);
  return written;
}

Outcome ScriptedModel::write(const std::string& fileName) {
  KvsHandle file = kvsCreate();
  root.Save(*file, fileName);
  if (kvsWrite(*file, fileName)) return {};
  kvsGetErrorGlb();
  return Failure{kvsGetErrorText()};
}

void ScriptedModel::setSelection(UTsbSelection& selection, const std::string& fileName, int item) const {
  setFileName(selection.fileName, fileName);
  selection.SetNoItems(1);
  selection.items.front() = static_cast<std::uint32_t>(item);
}

}  // namespace gridbay
