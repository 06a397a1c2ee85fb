#include "pages/edit_history.h"

#include "core/kdl_reader.h"
#include "core/kdl_writer.h"

namespace gridbay {
namespace {

constexpr std::size_t kMostSteps = 1000;
constexpr std::size_t kMostBytes = std::size_t{256} << 20;

std::string textOf(CKvsBase& part, const std::string& documentPath) {
  KvsFile file;
  part.Save(file, documentPath);
  // A text that is not UTF-8 is told of by a save; a history simply holds nothing of it.
  const Result<std::string> text = file.text();
  return text ? *text : std::string();
}

std::size_t bytesOf(const EditHistory::Step& step) {
  std::size_t bytes = 0;
  for (const EditHistory::PartChange& change : step.changes)
    bytes += change.before.size() + change.after.size();
  return bytes;
}

}  // namespace

void EditHistory::start(CGlobalKvs& model, std::string documentPath, const Touched& touched) {
  documentPath_ = std::move(documentPath);
  steps_.clear();
  done_ = 0;
  saved_ = 0;
  firstState_ = ++lastState_;
  touched_ = touched;
  texts_.clear();
  for (CKvsBase* part : model.parts()) texts_.push_back(textOf(*part, documentPath_));
}

bool EditHistory::record(CGlobalKvs& model, PageId page, std::string name, bool continues,
                         const Touched& touched) {
  Step step{page, std::move(name), continues, {}, touched_, touched, lastState_ + 1};
  touched_ = touched;
  const std::vector<CKvsBase*> parts = model.parts();
  for (std::size_t part = 0; part < parts.size(); ++part) {
    std::string now = textOf(*parts[part], documentPath_);
    if (now == texts_[part]) continue;
    step.changes.push_back({part, std::move(texts_[part]), now});
    texts_[part] = std::move(now);
  }
  if (step.changes.empty()) return false;
  ++lastState_;
  if (saved_ > done_) saved_ = kNeverSaved;
  steps_.resize(done_);
  steps_.push_back(std::move(step));
  ++done_;
  dropOldest();
  return true;
}

void EditHistory::undo(CGlobalKvs& model, Touched& touched) {
  for (const Step* step = undoStep(); step != nullptr;) {
    --done_;
    restore(model, *step, &PartChange::before);
    touched_ = touched = step->touchedBefore;
    step = nextOfRun(*step, undoStep());
  }
}

void EditHistory::redo(CGlobalKvs& model, Touched& touched) {
  for (const Step* step = redoStep(); step != nullptr;) {
    ++done_;
    restore(model, *step, &PartChange::after);
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

// A count that one part takes up again reaches its followers, which is why the parts are looked at once more.
void EditHistory::restore(CGlobalKvs& model, const Step& step, std::string PartChange::*side) {
  for (const PartChange& change : step.changes) texts_[change.part] = change.*side;
  const std::vector<CKvsBase*> parts = model.parts();
  constexpr int kPasses = 2;
  for (int pass = 0; pass < kPasses; ++pass) {
    for (std::size_t part = 0; part < parts.size(); ++part) {
      if (textOf(*parts[part], documentPath_) == texts_[part]) continue;
      const ReadText read = readKdl(FileText(texts_[part]));
      if (read.tree != nullptr) parts[part]->Load(&read.tree->root(), documentPath_);
    }
  }
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
