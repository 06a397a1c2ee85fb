#pragma once

#include <array>
#include <functional>
#include <string>
#include <string_view>

#include "core/file_selector.h"
#include "core/message.h"
#include "pages/form.h"

namespace gridbay {

// A start of the engine: its name, the saved file, and what the command passes on.
struct EngineStart {
  std::string engine;
  std::string input;
  int flag;  // 0 when Shift was held, else 1
  std::string text;
  std::array<int, 3> further;
};

// What a file is chosen for: the title of the dialog, the filter and the extension as of the plain one, and a
// name by which the place of the last choice is remembered.
struct FileQuestion {
  std::string_view title;
  std::string_view filter;
  std::string_view extension;
  std::string_view purpose;
};

// Told by long work how much of it is done, 0 to 1; false when it is to stop.
using Progress = std::function<bool(double done)>;

// What pages and documents ask of the program around them: dialogs and other documents. The desktop shows
// windows; tests answer by themselves.
class SetupHost : public MessageHost, public FileChooser {
 public:
  // A question with Yes and No.
  virtual bool askYesNo(const std::string& question) = 0;
  // A plain file dialog with a filter ("Grids (*.tsb2)|*.tsb2||") and the extension to add; false when it is
  // left.
  virtual bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) = 0;
  // The same for a file that is to be written; the name gets the extension where it has none.
  virtual bool chooseSaveFile(std::string_view filter, std::string_view extension, std::string* name) = 0;
  // A file dialog with a few controls of its own below the files. It starts from the file that was accepted
  // last for this purpose; on OK the name is the one that is chosen, and is remembered.
  virtual bool chooseFileWithForm(const FileQuestion& question, Form& panel, std::string* name) = 0;
  // Does work that may take long, shows how far it is under a title, and lets the user stop it.
  virtual void doLongWork(std::string_view title, const std::function<void(const Progress&)>& work) = 0;
  // A text in a field is no value. Where the field itself shows that, there is nothing more to show.
  virtual void showFieldFault(const std::string& text) { show(text); }
  // Shows a few controls with OK and Cancel; true for OK. `fault` says what is wrong with what the controls
  // show, and OK does nothing but tell it, until it is empty.
  virtual bool editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) = 0;
  // Opens a file as a document or in a viewer, which shows the item (from 1) at once; 0 for none in
  // particular.
  virtual void openFile(const std::string& path, int item) = 0;
  // Shows what a check found; each message leads to its page.
  virtual void showMessages(const ValidationList& messages, unsigned faults) = 0;
  // Asked before a save writes over a file, which another program may have changed meanwhile.
  virtual bool mayWriteOver(const std::string& /*path*/) { return true; }
  virtual void startEngine(const EngineStart& start) = 0;
  virtual bool isShiftHeld() = 0;
};

}  // namespace gridbay
