#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "advice/advice.h"
#include "compare/setup_comparison.h"
#include "core/message.h"
#include "map/map_editor.h"
#include "pages/form.h"
#include "pages/grid_wnd.h"
#include "pages/host.h"
#include "plugin/series_places.h"
#include "plugin/setup_summary.h"

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

  // An edit by its page and name.
  struct Edit {
    std::int32_t page;
    std::string name;
  };
  // What the pane shows before a page is chosen: a picture, or else a text.
  struct FirstView {
    std::optional<std::string> picture;
    std::string text;
  };

  // What an item without a page of its own shows.
  struct Cover {
    std::string title;
    std::string text;     // Markdown
    std::string picture;  // the name of the drawing above it
  };

  virtual ~SetupEditor() = default;

  virtual bool open(const std::string& path) = 0;
  virtual bool save(const std::string& path) = 0;
  virtual std::string path() const = 0;
  virtual std::string fileKind() const = 0;
  virtual bool isModified() const = 0;
  // Tells the states of the model apart: another one after each edit, and the old one again once the edit has
  // been taken back.
  virtual std::uint64_t modelState() const = 0;

  // Writes what a save would to another file; what is wrong, or empty. Takes such a file up as unsaved edits
  // of the setup at `path`, which is empty for one that was never saved.
  virtual std::string writeRecoveryCopy(const std::string& copy) = 0;
  virtual bool recover(const std::string& copy, const std::string& path) = 0;

  // The edit that would be taken back or done again next.
  virtual std::optional<Edit> undoable() const = 0;
  virtual std::optional<Edit> redoable() const = 0;
  virtual void undo() = 0;
  virtual void redo() = 0;

  virtual FirstView firstView() const = 0;
  virtual SetupSummary summary() = 0;
  // What the setup places, on a map, and what can be grasped there. An edit is shown by the open page too.
  virtual MapEditor& map() = 0;
  virtual std::vector<Item> items() const = 0;
  // Works out anew which items are visible; done by itself after each change.
  virtual void applyRules() = 0;
  // Opens the page of an item; null for one without a page in this version. The form lives until the next
  // call.
  virtual Form* openPage(std::int32_t id) = 0;
  // Shows the model's values anew, as after a change of units.
  virtual void refreshPage() = 0;
  virtual Cover cover(std::int32_t id) const = 0;
  // The number of an item's help topic; 0 for one that has no page.
  virtual std::int32_t helpTopic(std::int32_t id) const = 0;

  // Where what a message of a check speaks of is edited.
  virtual PagePlace placeOf(const CMessage& message) const = 0;
  // What is doubtful in the setup as it is now, by what is known of its data files.
  virtual std::vector<Advice> advice() = 0;
  // Whether the last advice knew all that it asked for. Else reads in data files about so long; true once
  // there is nothing more to read, when the next advice knows all.
  virtual bool isAdviceWhole() const = 0;
  virtual bool readForAdvice(int milliseconds) = 0;
  // Makes the fix of an advice as one step, after which the open page's form shows the model anew. False
  // where it can't be made, which has been said.
  virtual bool makeFix(const Advice& advice) = 0;

  virtual std::vector<Command> commands() const = 0;
  // Does a command, after which the open page's form shows the model anew.
  virtual bool command(int id) = 0;
  // The units that quantities are shown in.
  virtual const UnitChoices& units() const = 0;
  virtual void setUnits(const UnitChoices& units) = 0;

  // Called after each change of the model or its page.
  virtual void onChange(std::function<void()> changed) = 0;
  // Called after each save, whoever has asked for it.
  virtual void onSave(std::function<void()> saved) = 0;

  // Where the setup takes the time series in a file (an absolute path), as it is now or with another format.
  // Puts it there as one step, which the open page shows too; what is wrong, or empty.
  virtual SeriesPlaces seriesPlaces(const std::string& file) = 0;
  virtual std::string useSeries(const std::string& file, const SeriesPlace& place) = 0;

  // Another setup beside this one. What is taken over is shown by the open page too.
  virtual SetupComparison& comparison() = 0;
};

std::unique_ptr<SetupEditor> makeSetupEditor(SetupHost& host);

}  // namespace gridbay
