#include "setup/edit_history.h"

#include <algorithm>
#include <iterator>

namespace gridbay {
namespace {

constexpr std::size_t kMostSteps = 1000;
constexpr std::size_t kMostBytes = std::size_t{256} << 20;

std::size_t bytesOf(const EditHistory::Step& step) {
  std::size_t bytes = 0;
  for (const EditHistory::PartChange& part : step.changes) bytes += part.change->bytes();
  return bytes;
}

}  // namespace

void EditHistory::start(CGlobalKvs& model, const Touched& touched) {
  steps_.clear();
  done_ = 0;
  saved_ = 0;
  firstState_ = ++lastState_;
  touched_ = touched;
  twin_ = std::make_unique<CGlobalKvs>();
  twin_->AssignState(model);
}

std::vector<EditHistory::PartChange> EditHistory::takeChanges(CGlobalKvs& model) {
  std::vector<PartChange> changes;
  const std::vector<CKvsBase*> parts = model.children();
  const std::vector<CKvsBase*> twins = twin_->children();
  for (std::size_t part = 0; part < parts.size(); ++part) {
    if (auto change = parts[part]->TakeChange(*twins[part])) changes.push_back({part, std::move(change)});
  }
  return changes;
}

bool EditHistory::record(CGlobalKvs& model, PageId page, std::string name, bool continues,
                         const Touched& touched, bool hasMore) {
  std::vector<PartChange> changes = takeChanges(model);
  Step step{page, std::move(name), continues, std::move(changes), touched_, touched, lastState_ + 1};
  touched_ = touched;
  if (step.changes.empty() && !hasMore) return false;
  ++lastState_;
  if (saved_ != kNeverSaved && saved_ > done_) saved_ = kNeverSaved;
  steps_.erase(steps_.begin() + static_cast<std::ptrdiff_t>(done_), steps_.end());
  steps_.push_back(std::move(step));
  ++done_;
  dropOldest();
  return true;
}

void EditHistory::apply(CGlobalKvs& model, const std::vector<PartChange>& changes, bool forward) {
  const std::vector<CKvsBase*> parts = model.children();
  const std::vector<CKvsBase*> twins = twin_->children();
  const auto both = [&](const PartChange& part) {
    part.change->apply(*parts[part.part], forward);
    part.change->apply(*twins[part.part], forward);
  };
  if (forward) {
    for (const PartChange& part : changes) both(part);
  } else {
    for (auto part = changes.rbegin(); part != changes.rend(); ++part) both(*part);
  }
}

bool EditHistory::hasState(std::uint64_t state) const {
  return std::ranges::find(steps_, state, &Step::state) != steps_.end();
}

// Steps that could be done again start from a state that is gone then.
void EditHistory::settle(CGlobalKvs& model) {
  std::vector<PartChange> hidden = takeChanges(model);
  if (hidden.empty()) return;
  steps_.erase(steps_.begin() + static_cast<std::ptrdiff_t>(done_), steps_.end());
  if (done_ == 0) return;
  std::vector<PartChange>& last = steps_[done_ - 1].changes;
  last.insert(last.end(), std::make_move_iterator(hidden.begin()), std::make_move_iterator(hidden.end()));
}

void EditHistory::undo(CGlobalKvs& model, Touched& touched) {
  if (done_ == 0) return;
  std::vector<PartChange> hidden = takeChanges(model);
  std::vector<PartChange>& last = steps_[done_ - 1].changes;
  last.insert(last.end(), std::make_move_iterator(hidden.begin()), std::make_move_iterator(hidden.end()));
  for (const Step* step = undoStep(); step != nullptr;) {
    --done_;
    apply(model, step->changes, false);
    touched_ = touched = step->touchedBefore;
    step = nextOfRun(*step, undoStep());
  }
}

void EditHistory::redo(CGlobalKvs& model, Touched& touched) {
  if (redoStep() == nullptr) return;
  takeBackUnrecorded(model);
  for (const Step* step = redoStep(); step != nullptr;) {
    ++done_;
    apply(model, step->changes, true);
    touched_ = touched = step->touchedAfter;
    step = nextOfRun(*step, redoStep());
  }
}

// A run ends where the state on file lies within it.
const EditHistory::Step* EditHistory::nextOfRun(const Step& step, const Step* next) const {
  const bool goesOn = next != nullptr && step.continues && next->continues && next->name == step.name &&
                      next->page == step.page && !isSaved();
  return goesOn ? next : nullptr;
}

void EditHistory::dropOldest() {
  std::size_t bytes = 0;
  std::size_t keep = 0;
  for (auto step = steps_.rbegin(); step != steps_.rend() && keep < kMostSteps; ++step, ++keep) {
    bytes += bytesOf(*step);
    if (bytes > kMostBytes && keep > 0) break;
  }
  const std::size_t drop = steps_.size() - keep;
  if (drop > 0) firstState_ = steps_[drop - 1].state;
  steps_.erase(steps_.begin(), steps_.begin() + static_cast<std::ptrdiff_t>(drop));
  done_ -= drop;
  if (saved_ != kNeverSaved) saved_ = saved_ < drop ? kNeverSaved : saved_ - drop;
}

}  // namespace gridbay
