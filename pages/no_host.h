#pragma once

#include "pages/host.h"

namespace gridbay {

// A host with no user: what pages ask is declined, but for a question that may be agreed to; what they tell
// is dropped.
class NoHost : public SetupHost {
 public:
  explicit NoHost(bool agrees = false) : agrees_(agrees) {}

  void show(const std::string&) override {}
  bool choose(CVdFileSelectorDlg&) override { return false; }
  bool askYesNo(const std::string&) override { return agrees_; }
  bool chooseFile(std::string_view, std::string_view, std::string*) override { return false; }
  bool chooseSaveFile(std::string_view, std::string_view, std::string*) override { return false; }
  bool chooseFileWithForm(const FileQuestion&, Form&, std::string*) override { return false; }
  void doLongWork(std::string_view, const std::function<void(const Progress&)>&) override {}
  bool editForm(std::string_view, Form&, const std::function<std::string()>&) override { return false; }
  void openFile(const std::string&, int) override {}
  void showMessages(const ValidationList&, unsigned) override {}
  void startEngine(const EngineStart&) override {}
  bool isShiftHeld() override { return false; }

 private:
  bool agrees_;
};

}  // namespace gridbay
