#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "gridbay_setup/climate_change.h"
#include "gridbay_setup/flood_models.h"
#include "scripting/scripted_model.h"
#include "setup/setup_path.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

// A scripting class with what it did to the model in sight, and its messages in a list.
template <class Scripted>
class Script : public Scripted {
 public:
  Script() { keepMessages(); }
  explicit Script(const scripting::FloodModel& other) : Scripted(other) { keepMessages(); }
  Script(const Script&) = delete;
  Script& operator=(const Script&) = delete;

  CGlobalKvs& root() { return this->model_->root; }
  // The values of a keyword as a save to `documentPath` writes them, by its path.
  std::string at(const std::string& path) {
    const KvsHandle file = kvsCreate();
    root().Save(*file, documentPath);
    const Result<const Node*> found = findPath(*file, path);
    return found ? shownValues(**found) : found.error();
  }
  std::string global(const std::string& path) { return at("NESTED_MODEL_GLOBALS/" + path); }
  std::string flow(const std::string& path) { return at("HYDRODYNAMIC_MODULE/" + path); }
  // "keyword=values" for each of the keywords.
  std::string flow(const std::string& section, const std::vector<std::string>& keywords) {
    std::string all;
    for (const std::string& keyword : keywords) {
      all += (all.empty() ? "" : " ") + keyword;
      all += "=" + flow(section + "/" + keyword);
    }
    return all;
  }

  std::string documentPath = "/case/setup.v27";
  std::vector<std::string> shown;

 private:
  void keepMessages() {
    ShowMessagesWith(*this, [this](const std::string& text) { shown.push_back(text); });
  }
};

}  // namespace gridbay::test
