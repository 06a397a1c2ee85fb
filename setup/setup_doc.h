#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "pages/vd_doc.h"
#include "setup/edit_history.h"
#include "setup/setup_file.h"

namespace gridbay {

// A document: a model that is never without its parts, the file it is saved in, and the history of its edits.
// It knows of no window.
class CV27SetupDoc : public CVdDoc {
 public:
  explicit CV27SetupDoc(SetupHost& host);

  CGlobalKvs& root() { return setup_.model(); }
  CKvsBase& GetKvs() override { return root(); }

  // A fresh model without a file.
  virtual bool OnNewDocument();
  // Reads a setup. On failure the reason is shown, and the document is as it was.
  bool OnOpenDocument(const std::string& path);
  // Writes the setup and makes the path the document's own. On failure the reason is shown. A setup that was
  // read with sections which this version does not know is not written without them unless the user agrees.
  bool OnSaveDocument(const std::string& path);
  // Called after each save.
  void OnSaved(std::function<void()> saved) { saved_ = std::move(saved); }

  // All faults of the model. What a check changes, as a hot start file may, becomes a step of its own.
  unsigned ValidateData(ValidationList& messages);
  void SetEngine(std::string name) { engine_ = std::move(name); }
  const std::string& engine() const { return engine_; }

  // Writes what a save would to another file, for when this program ends before the save; and takes such a
  // file up again as unsaved edits of the setup at `path`, which may be empty.
  Outcome WriteRecoveryCopy(const std::string& copy);
  bool OnRecoverDocument(const std::string& copy, const std::string& path);

  // The model with its file, to be read.
  SetupFile& file() { return setup_; }
  // An edit makes it pass other options of the engine on; to be called before that is recorded.
  void ReplaceSource(KvsHandle source);
  void RecordEdit(PageId page, std::string name, bool continues = false) override;
  // The step that comes next; null when there is none.
  const EditHistory::Step* UndoStep() const { return history_.undoStep(); }
  const EditHistory::Step* RedoStep() const { return history_.redoStep(); }
  void Undo();
  void Redo();
  // Tells the states of the model apart: another one after each edit, the old one once it is taken back.
  std::uint64_t ModelState() const { return history_.state(); }

 protected:
  void TakeBackUnrecorded() override { history_.takeBackUnrecorded(root()); }

 private:
  // Sources of the file that a step has exchanged, by the state that it leads to.
  struct SourceChange {
    std::uint64_t state;
    KvsHandle other;
  };

  bool mayLeaveOut();
  void exchangeSource(std::uint64_t state);
  void start(SetupFile setup, const std::string& path, bool modified);

  SetupFile setup_;
  std::string engine_;
  EditHistory history_;
  std::vector<SourceChange> sources_;
  KvsHandle replaced_;      // by an edit that is not recorded yet
  bool leavesOut_ = false;  // the user has agreed
  std::function<void()> saved_;
};

}  // namespace gridbay
