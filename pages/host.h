#pragma once

#include <string>
#include <string_view>

#include "core/file_selector.h"
#include "core/message.h"
#include "pages/form.h"

namespace gridbay {

// What pages and documents ask of the program around them: dialogs and other documents. The desktop shows
// windows; tests answer by themselves.
class SetupHost : public MessageHost, public FileChooser {
 public:
  // A question with Yes and No.
  virtual bool askYesNo(const std::string& question) = 0;
  // A plain file dialog with a filter ("Grids (*.tsb2)|*.tsb2||") and the extension to add; false when it is
  // left.
  virtual bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) = 0;
  // Shows a few controls with OK and Cancel; true for OK.
  virtual bool editForm(std::string_view title, Form& form) = 0;
  // Opens a file as a document or in a viewer.
  virtual void openFile(const std::string& path) = 0;
};

}  // namespace gridbay
