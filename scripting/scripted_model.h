#pragma once

#include <mutex>
#include <string>

#include "core/date_time.h"
#include "core/selections.h"
#include "gridbay_setup/types.h"
#include "platform/result.h"
#include "setup/global_kvs.h"

namespace gridbay {

// The model that scripting objects share, with what they do alike.
class ScriptedModel {
 public:
  // A default model; of inland flooding it has no high precision and no features beside the flow.
  explicit ScriptedModel(bool isInlandFlood);

  CGlobalKvs root;

  // Keeps other threads from the model while it lives.
  std::unique_lock<std::recursive_mutex> lock() { return std::unique_lock(mutex_); }
  // Keeps other threads from data files, whose libraries serve one at a time.
  static std::unique_lock<std::mutex> lockDataFiles();

  void setMessageBox(scripting::MessageBox show) { show_ = std::move(show); }
  // For as long as the message is shown the model is free for other threads: the one that reads it may use
  // it. To be called under one lock.
  void show(const std::string& text);

  // What came of a load: whether the file could be read, and else why not; also what it lacks to be a setup.
  struct Loaded {
    bool isRead = false;
    std::string fault = {};
  };

  // Reads a setup into the model: what it lacks keeps its value, but where another setup was read before, the
  // default. A syntax error is shown. Then the model is checked, so that the areas have their grids.
  Loaded load(const std::string& fileName);
  // What validation finds, each in a line.
  std::string errorTexts();
  // Shows the texts, if any, and writes the file all the same; why it can't be written is shown too. Throws
  // what a save of the model throws, and what a message box threw at the texts.
  Outcome save(const std::string& fileName, const std::string& texts);
  // Writes the file. Throws what a save of the model throws.
  Outcome write(const std::string& fileName);

  // Names a file as a caller does: from the folder of the setup that was loaded, if one was.
  template <class FileName>
  void setFileName(FileName& file, const std::string& name) const {
    if (documentPath_.empty()) {
      file = name;
    } else {
      file.Set(name, documentPath_);
    }
  }
  // A file with one item.
  void setSelection(UTsbSelection& selection, const std::string& fileName, int item) const;

 private:
  void clearFeatures();

  bool isInlandFlood_;
  std::recursive_mutex mutex_;
  scripting::MessageBox show_;
  std::string documentPath_;  // empty in a model that was not loaded
};

inline DateTime modelTime(scripting::DateTime moment) {
  return {moment.day, moment.status};
}
inline scripting::DateTime scriptTime(DateTime moment) {
  return {moment.day, moment.status};
}

}  // namespace gridbay
