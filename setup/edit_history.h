#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "core/page_id.h"
#include "setup/global_kvs.h"

namespace gridbay {

// The edits of a model, to be taken back and done again. A twin of the model holds its state as it was after
// the last step; what differs from it is the next one. So pages need not know of this, a step is exact also
// for what stands on no file, and costs what it has changed.
class EditHistory {
 public:
  using Touched = std::set<PageId>;

  struct PartChange {
    std::size_t part;  // its place among CGlobalKvs::children()
    std::unique_ptr<StateChange> change;
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

  // Forgets all steps; the model as it is now is what the first one starts from.
  void start(CGlobalKvs& model, const Touched& touched);
  // Notes what has changed since the last step; false when nothing has, which is a step all the same where
  // something beside the model has changed. A new step ends what could be redone.
  bool record(CGlobalKvs& model, PageId page, std::string name, bool continues, const Touched& touched,
              bool hasMore = false);

  // What has changed without a step, as what a page works out when it is shown, goes with the last one.
  void settle(CGlobalKvs& model);
  // The same brought back to what it was after the last step.
  void takeBackUnrecorded(CGlobalKvs& model) { apply(model, takeChanges(model), false); }

  // The step that an undo or a redo would do; null when there is none.
  const Step* undoStep() const { return done_ == 0 ? nullptr : &steps_[done_ - 1]; }
  const Step* redoStep() const { return done_ == steps_.size() ? nullptr : &steps_[done_]; }
  void undo(CGlobalKvs& model, Touched& touched);
  void redo(CGlobalKvs& model, Touched& touched);

  // A number for the present state of the model, by which it is known again after an undo or a redo.
  std::uint64_t state() const { return done_ == 0 ? firstState_ : steps_[done_ - 1].state; }

  // Whether a step leads to the state of that number, which an undo can leave then, or a redo reach.
  bool hasState(std::uint64_t state) const;

  // The present state is the one on file; whether it is so again.
  void markSaved() { saved_ = done_; }
  void markUnsaved() { saved_ = kNeverSaved; }
  bool isSaved() const { return saved_ == done_; }

 private:
  static constexpr std::size_t kNeverSaved = static_cast<std::size_t>(-1);

  std::vector<PartChange> takeChanges(CGlobalKvs& model);
  void apply(CGlobalKvs& model, const std::vector<PartChange>& changes, bool forward);
  const Step* nextOfRun(const Step& step, const Step* next) const;
  void dropOldest();

  std::unique_ptr<CGlobalKvs> twin_;
  std::vector<Step> steps_;
  std::size_t done_ = 0;
  std::size_t saved_ = 0;
  std::uint64_t firstState_ = 0;
  std::uint64_t lastState_ = 0;  // that was given a number
  Touched touched_;
};

}  // namespace gridbay
