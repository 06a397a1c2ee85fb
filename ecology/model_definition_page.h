#pragma once

#include <string>

#include "core/file_name.h"
#include "pages/form_view.h"

namespace gridbay {

// Which ecological model runs, and how it is solved. Another model is read as soon as it is named.
class CWQSModelDefinitionDlg final : public Page<18947, PageId::ecoModelDefinition> {
  using Page::Page;
  void DoDataExchange(Form& form) override;

  Choices models();
  // The place of the model among those to choose from; the last is that of a file.
  int chosenPlace();
  bool isFromFile();
  void choosePlace(int place);
  void typeFile(const std::string& name);
  void browse();
  void take(const UFileName& file);

  const Control* modelList_ = nullptr;
  const Control* fileEdit_ = nullptr;
  bool fromFile_ = false;  // chosen by the user, while the file may still be that of another entry
};

}  // namespace gridbay
