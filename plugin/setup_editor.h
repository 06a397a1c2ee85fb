#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "core/message.h"
#include "pages/form.h"
#include "pages/grid_wnd.h"
#include "pages/host.h"

namespace gridbay {

// An open document as the host sees it: the file, the tree, one page at a time, and commands. All of it is
// virtual, so that a host finds what it needs in the library that it has loaded and links nothing of it.
class SetupEditor {
 public:
  // An item of the tree, in the order of the screen.
  struct Item {
    std::int32_t id;
    std::string caption;
    int depth;
    bool visible;
  };
  struct Command {
    int id;
    std::string text;
    bool checked;
  };

  virtual ~SetupEditor() = default;

  virtual bool open(const std::string& path) = 0;
  virtual bool save(const std::string& path) = 0;
  virtual std::string path() const = 0;
  virtual std::string fileKind() const = 0;
  virtual bool isModified() const = 0;

  virtual std::vector<Item> items() const = 0;
  // Opens the page of an item; null for one without a page in this version. The form lives until the next
  // call.
  virtual Form* openPage(std::int32_t id) = 0;
  // Shows the model's values anew, as after a change of units.
  virtual void refreshPage() = 0;
  // What an item without a page is for, in a few lines.
  virtual std::string cover(std::int32_t id) const = 0;

  virtual std::vector<Command> commands() const = 0;
  virtual bool command(int id) = 0;
  virtual void setUnitSystem(UnitSystem system) = 0;

  // Called after each change of the model or its page.
  virtual void onChange(std::function<void()> changed) = 0;
};

std::unique_ptr<SetupEditor> makeSetupEditor(SetupHost& host);

}  // namespace gridbay
