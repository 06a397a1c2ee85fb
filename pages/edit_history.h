#pragma once

#include <cstddef>
#include <cstdint>
#include <set>
#include <string>
#include <vector>

#include "core/global_kvs.h"
#include "core/page_id.h"

namespace gridbay {

// The edits of a model, to be taken back and done again. Each part of the model is kept as the text that a
// save would write for it, and a step holds the texts of the parts that it changed; so pages need not know of
// this, and a model that is large in one part costs that part only.
class EditHistory {
 public:
  using Touched = std::set<PageId>;

  struct PartChange {
    std::size_t part;  // its place among CGlobalKvs::parts()
    std::string before;
    std::string after;
  };
  struct Step {
    PageId page;
    std::string name;  // as in "Undo Drying depth"
    bool continues;    // one of a run of like edits, as the steps of a spin button
    std::vector<PartChange> changes;
    Touched touchedBefore;
    Touched touchedAfter;
    std::uint64_t state = 0;  // that it leads to
  };

  // Forgets all steps; the model as it is now is what the first one starts from. Relative file names are kept
  // relative to the folder of `documentPath`.
  void start(CGlobalKvs& model, std::string documentPath, const Touched& touched);
  // Notes what has changed since the last step; false when nothing has. A new step ends what could be redone.
  bool record(CGlobalKvs& model, PageId page, std::string name, bool continues, const Touched& touched);

  // The step that an undo or a redo would do; null when there is none.
  const Step* undoStep() const { return done_ == 0 ? nullptr : &steps_[done_ - 1]; }
  const Step* redoStep() const { return done_ == steps_.size() ? nullptr : &steps_[done_]; }
  void undo(CGlobalKvs& model, Touched& touched);
  void redo(CGlobalKvs& model, Touched& touched);

  // A number for the present state of the model, by which it is known again after an undo or a redo.
  std::uint64_t state() const { return done_ == 0 ? firstState_ : steps_[done_ - 1].state; }

  // The present state is the one on file; whether it is so again.
  void markSaved() { saved_ = done_; }
  void markUnsaved() { saved_ = kNeverSaved; }
  bool isSaved() const { return saved_ == done_; }

 private:
  static constexpr std::size_t kNeverSaved = static_cast<std::size_t>(-1);

  const Step* nextOfRun(const Step& step, const Step* next) const;
  void restore(CGlobalKvs& model, const Step& step, std::string PartChange::*side);
  void dropOldest();

  std::string documentPath_;
  std::vector<std::string> texts_;  // of all parts, as they are now
  std::vector<Step> steps_;
  std::size_t done_ = 0;
  std::size_t saved_ = 0;
  std::uint64_t firstState_ = 0;
  std::uint64_t lastState_ = 0;  // that was given a number
  Touched touched_;
};

}  // namespace gridbay
