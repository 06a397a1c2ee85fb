#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "core/global_kvs.h"
#include "core/page_id.h"
#include "core/setup_file.h"
#include "pages/edit_history.h"
#include "pages/host.h"
#include "platform/units/edit_style.h"

namespace gridbay {

class CV27SetupFormView;
class CV27SetupGridWnd;

// A document: a model that is never without its parts, the file it is saved in, and what the pages of one
// setup share. It knows of no window.
class CV27SetupDoc {
 public:
  explicit CV27SetupDoc(SetupHost& host);
  CV27SetupDoc(const CV27SetupDoc&) = delete;
  CV27SetupDoc& operator=(const CV27SetupDoc&) = delete;
  virtual ~CV27SetupDoc() = default;

  CGlobalKvs& root() { return setup_.model(); }
  SetupHost& host() { return host_; }
  UnitChoices& units() { return units_; }
  const UnitChoices& units() const { return units_; }

  // A fresh model without a file.
  virtual bool OnNewDocument();
  // Reads a setup. On failure the reason is shown, and the document is as it was.
  bool OnOpenDocument(const std::string& path);
  // Writes the setup and makes the path the document's own. On failure the reason is shown. A setup that was
  // read with sections which this version does not know is not written without them unless the user agrees.
  bool OnSaveDocument(const std::string& path);
  // Called after each save.
  void OnSaved(std::function<void()> saved) { saved_ = std::move(saved); }
  const std::string& path() const { return path_; }

  // All faults of the model.
  unsigned ValidateData(ValidationList& messages) { return root().Validate(messages, 1); }
  void SetEngine(std::string name) { engine_ = std::move(name); }
  const std::string& engine() const { return engine_; }

  // The absolute form of a file name in the setup.
  std::string getAbsoluteFilepath(const std::string& name) const;

  // Writes what a save would to another file, for when this program ends before the save; and takes such a
  // file up again as unsaved edits of the setup at `path`, which may be empty.
  Outcome WriteRecoveryCopy(const std::string& copy);
  bool OnRecoverDocument(const std::string& copy, const std::string& path);

  // A page has brought an edit into the model: it can be taken back by this name. An edit that continues a
  // like one is taken back with it.
  void RecordEdit(PageId page, std::string name, bool continues = false);
  // The step that comes next; null when there is none.
  const EditHistory::Step* UndoStep() const { return history_.undoStep(); }
  const EditHistory::Step* RedoStep() const { return history_.redoStep(); }
  void Undo();
  void Redo();

  // Tells the states of the model apart: another one after each edit, the old one once it is taken back.
  std::uint64_t ModelState() const { return history_.state(); }

  bool IsModified() const { return modified_; }
  void SetModifiedFlag(bool modified = true) { modified_ = modified; }

  // Whether the user has worked on a page: then derived defaults leave its values alone.
  bool HasBeenTouched(PageId page) const { return touched_.contains(page); }
  void Touch(PageId page) { touched_.insert(page); }
  void UnTouch(PageId page) { touched_.erase(page); }

  // Tool tips: of a page's control, and of the long values in a column of a grid.
  static void EnableMultiToolTips(CV27SetupFormView& page, std::string_view label, std::string_view text);
  static void EnableGXMultiToolTips(CV27SetupGridWnd& grid, int column);
  // The tip of a long value, on lines that fit a screen.
  static std::string GetToolTipsString(std::string_view value);

  // Views are told of each change, but for the one that made it.
  using View = std::function<void()>;
  void AddView(const void* owner, View update);
  void RemoveView(const void* owner);
  void UpdateAllViews(const void* sender);

 private:
  bool mayLeaveOut(const std::string& path);
  void start(SetupFile setup, const std::string& path, bool modified);

  SetupHost& host_;
  SetupFile setup_;
  UnitChoices units_;
  std::string path_;
  std::string engine_;
  std::set<PageId> touched_;
  EditHistory history_;
  bool modified_ = false;
  bool leavesOut_ = false;  // the user has agreed
  std::vector<std::pair<const void*, View>> views_;
  std::function<void()> saved_;
};

}  // namespace gridbay
