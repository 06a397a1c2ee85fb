#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

#include "setup/dlg_enumerator.h"
#include "setup/navigation_tree.h"
#include "setup/setup_doc.h"

namespace gridbay {

// A command of the document's "&Run" menu.
struct DocCommand {
  int id;
  std::string_view text;
};

// The document of the flow model.
class CGridbayDoc final : public CV27SetupDoc {
 public:
  static constexpr int kAutomaticValidation = 46017;
  static constexpr int kStartSimulation = 46018;
  static constexpr int kValidate = 46019;
  static constexpr std::string_view kMenu = "&Run";
  static constexpr std::array<DocCommand, 3> kCommands{{{kAutomaticValidation, "&Automatic Validation"},
                                                        {kValidate, "&Validate"},
                                                        {kStartSimulation, "&Start simulation ..."}}};

  explicit CGridbayDoc(SetupHost& host);

  // The extension of its files without the dot.
  const std::string& fileKind() const { return fileKind_; }
  const CDlgEnumerator& enumerator() const { return enumerator_; }

  // Does a command of the menu; false for an id that is none.
  bool OnCommand(int id);
  // Whether a command's item shows a check mark.
  bool IsChecked(int id) const { return id == kAutomaticValidation && automaticValidation_ == 1; }

  std::int32_t automaticValidation() const { return automaticValidation_; }
  void SetAutomaticValidation(std::int32_t flag) { automaticValidation_ = flag; }

  // Starts the engine on the saved file. With automatic validation on, a model with faults is shown them and
  // is not started. The flag is 1 for a start as usual, 0 when Shift was held; text and the further flags are
  // passed on.
  void RunEngineApv2(int flag, std::string_view text, int a, int b, int c);

 private:
  CDlgEnumerator enumerator_;
  std::string fileKind_;
  std::int32_t automaticValidation_ = 0;
};

}  // namespace gridbay
