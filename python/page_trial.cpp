#include "python/page_trial.h"

#include <fmt/format.h>

#include <cmath>
#include <map>
#include <set>
#include <unordered_map>

#include "core/number_text.h"
#include "pages/form_view.h"
#include "pages/grid_wnd.h"
#include "python/page_fields.h"
#include "setup/page_factory.h"

namespace gridbay::python {
namespace {

// A form that can be had to be used: that of a page, or of a dialog, which opens for as long as that takes.
struct Surface {
  std::string name;
  std::string title;  // of a dialog
  std::function<void(const std::function<void(Form&)>& use)> with;
};

}  // namespace

class PageTrial::Work {
 public:
  Work(KeywordNotes& notes, DialogHost& host) : notes_(notes), host_(host) {}

  void use(CGridbayDoc& document, int depth) {
    document_ = &document;
    stateBefore_.reset();
    tried_.clear();
    for (const PageEntry& entry : document_->enumerator().pages()) {
      if (entry.pageClass.empty()) continue;
      const std::unique_ptr<CV27SetupFormView> page = makePage(entry.pageClass, *document_);
      if (page == nullptr) continue;
      page_ = entry.caption;
      for (Control& control : page->form().controls()) {
        if (control.grid != nullptr && control.grid->GetRowCount() > 0) control.grid->OnCurrentRow(1);
      }
      page->SetData();
      shown_ = page.get();
      // What a page works out when it is opened is no edit.
      document_->RecordEdit(PageId::none, "shown");
      explore({.name = fmt::format("{}", entry.id),
               .title = {},
               .with = [&page](const std::function<void(Form&)>& use) { use(page->form()); }},
              depth);
      shown_ = nullptr;
    }
  }

 private:
  // Uses each field, and what can be used while another choice is made in one of them.
  void explore(const Surface& surface, int depth) {
    std::vector<Field> fields;
    surface.with([&fields](Form& form) { fields = fieldsOf(form); });
    const std::size_t changes = changes_;
    const std::size_t edits = edits_;
    const bool isLinked = std::ranges::any_of(
        fields, [&](const Field& field) { return linked_.contains(surface.name + "/" + field.key()); });
    // A page that edits nothing that is on file does not apply.
    const auto applies = [&] {
      return isLinked || !surface.title.empty() || changes_ != changes || edits_ - edits < kEnoughEdits;
    };
    for (const Field& field : fields) {
      if (applies()) tryField(surface, field);
    }
    if (depth == 0 || !applies()) return;
    for (const Field& field : fields) {
      for (const std::string& choice : waysOf(field)) {
        if (choice == field.value) continue;
        const std::uint64_t state = document_->ModelState();
        surface.with([&](Form& form) { useField(form, field, choice); });
        if (document_->ModelState() != state) {
          if (made_.insert(surface.name + "/" + field.key() + "/" + choice).second) look();
          explore(surface, depth - 1);
        }
        undoTo(state);
      }
    }
  }
  // What can be made of a field for others to depend on it.
  static std::vector<std::string> waysOf(const Field& field) {
    if (field.kind == Field::Kind::choice) return field.choices;
    if (field.kind == Field::Kind::check) return {"0", "1"};
    return field.isCount ? std::vector{otherTexts(field.value).texts.front()} : std::vector<std::string>();
  }
  void undoTo(std::uint64_t state) {
    while (document_->ModelState() != state && document_->UndoStep() != nullptr) document_->Undo();
    // What was not taken goes, too.
    if (shown_ != nullptr) shown_->SetData();
  }

  void tryField(const Surface& surface, const Field& field) {
    const std::string place = surface.name + "/" + field.key();
    if (linked_.contains(place) || tried_[place] >= kMostTries) return;
    const std::size_t edits = edits_;
    const auto edit = [&](const std::string& text) {
      return changedBy([&] { surface.with([&](Form& form) { useField(form, field, text); }); });
    };
    bool found = false;
    switch (field.kind) {
      case Field::Kind::typed:
        found = type(surface, field, edit);
        break;
      case Field::Kind::check:
        found = check(surface, field, edit(field.value == "1" ? "0" : "1"));
        break;
      case Field::Kind::choice:
        found = choose(surface, field, edit);
        break;
      case Field::Kind::button:
        found = press(surface, field, edit);
    }
    if (found) linked_.insert(place);
    // A field that takes nothing at present costs little.
    if (edits_ != edits) ++tried_[place];
  }

  using Edit = std::function<std::vector<Change>(const std::string& text)>;

  bool type(const Surface& surface, const Field& field, const Edit& edit) {
    const OtherTexts other = otherTexts(field.value);
    bool found = false;
    for (const std::string& text : other.texts) {
      const std::vector<Change> changes = edit(text);
      const Sureness sureness = other.forEachNumber ? Sureness::amongNumbers : surely(surface);
      if (const Change* meant = meantBy(changes, text)) {
        note(*meant, surface, field, sureness);
        found = true;
      }
      if (found && !other.forEachNumber) break;
      if (!other.forEachNumber && !changes.empty()) {
        for (const Change& change : changes) note(change, surface, field, Sureness::together);
        return true;
      }
    }
    return found;
  }
  // Of the changes the one by which the keyword has got the value that was typed; null where it isn't plain.
  static const Change* meantBy(const std::vector<Change>& changes, const std::string& text) {
    if (changes.size() == 1) return changes.data();
    for (const Change& change : changes) {
      const auto typed = doubleOfText(text);
      const auto now = doubleOfText(change.after);
      constexpr double kSinglePrecision = 1e-6;
      const bool isSame = typed && now ? std::abs(*typed - *now) <= kSinglePrecision * std::abs(*typed)
                                       : change.after == text;
      if (isSame) return &change;
    }
    return nullptr;
  }

  bool check(const Surface& surface, const Field& field, const std::vector<Change>& changes) {
    const auto named = [&field](bool isChanged) { return (field.value == "1") == isChanged ? "off" : "on"; };
    for (const Change& change : changes) {
      ValueNote* held =
          note(change, surface, field, changes.size() == 1 ? surely(surface) : Sureness::together);
      if (held == nullptr || change.kind != ValueKind::integer) continue;
      addChoice(*held, change.before, named(false));
      addChoice(*held, change.after, named(true));
    }
    return !changes.empty();
  }

  // A choice sets a value of its own in each keyword that holds it.
  bool choose(const Surface& surface, const Field& field, const Edit& edit) {
    std::map<std::pair<std::size_t, std::size_t>, std::map<std::string, Change>> byValue;  // and by choice
    std::size_t effective = 0;
    for (const std::string& choice : field.choices) {
      if (choice == field.value) continue;
      const std::vector<Change> changes = edit(choice);
      effective += changes.empty() ? 0 : 1;
      for (const Change& change : changes) byValue[{change.note, change.value}].emplace(choice, change);
    }
    std::erase_if(byValue, [effective](const auto& held) {
      std::set<std::string> distinct;
      for (const auto& [choice, change] : held.second) distinct.insert(change.after);
      return distinct.size() != effective;
    });
    for (const auto& [value, changes] : byValue) {
      ValueNote* held = note(changes.begin()->second, surface, field,
                             byValue.size() == 1 ? surely(surface) : Sureness::together);
      if (held == nullptr) continue;
      for (const std::string& choice : field.choices) {
        const auto found = changes.find(choice);
        if (found != changes.end()) addChoice(*held, found->second.after, choice);
        if (choice == field.value) addChoice(*held, changes.begin()->second.before, choice);
      }
    }
    return !byValue.empty();
  }

  // A button opens a dialog, or lets a file be chosen with its items.
  bool press(const Surface& surface, const Field& field, const Edit& edit) {
    if (!surface.title.empty()) return false;
    Surface dialog{.name = surface.name + "/" + field.key(), .title = {}, .with = {}};
    host_.UseDialog([&dialog](std::string_view title, Form&) {
      dialog.title = title;
      return false;
    });
    host_.ChooseFiles(true);
    const std::vector<Change> changes = edit({});
    host_.ChooseFiles(false);
    host_.UseDialog({});
    if (dialog.title.empty()) return noteFile(surface, field, changes);
    dialog.with = [&](const std::function<void(Form&)>& use) {
      host_.UseDialog([&use](std::string_view, Form& form) {
        use(form);
        return true;
      });
      surface.with([&](Form& form) { useField(form, field, {}); });
      host_.UseDialog({});
    };
    explore(dialog, 1);
    return false;
  }
  // The items of a file are labelled as the file is.
  bool noteFile(const Surface& surface, Field field, const std::vector<Change>& changes) {
    const auto isFile = [](const Change& change) {
      return change.kind == ValueKind::fileName && change.after.ends_with(DialogHost::kFile);
    };
    const auto file = std::ranges::find_if(changes, isFile);
    if (file == changes.end()) return false;
    const ValueNote& named = notes_.at(file->note).parts[file->value];
    if (!named.label.empty()) field.label = named.label;
    for (const Change& change : changes) {
      if (change.kind == ValueKind::integer || isFile(change))
        note(change, surface, field, Sureness::amongNumbers);
    }
    return true;
  }

  static Sureness surely(const Surface& surface) {
    return surface.title.empty() ? Sureness::onPage : Sureness::inDialog;
  }

  // Notes what a value is called; null where it is known more surely already.
  ValueNote* note(const Change& change, const Surface& surface, const Field& field, Sureness sureness) {
    ValueNote found;
    found.label = surface.title.empty() ? field.label : surface.title + ": " + field.label;
    if (field.quantity != nullptr) {
      found.quantity = field.quantity->name;
      found.unit = qunBaseUnit(field.quantity->code)->symbol;
    }
    return notes_.add(change, found, page_, sureness);
  }

  // What is on file at present.
  void look() {
    if (document_->ModelState() == stateBefore_) return;
    before_ = snapshotOf(document_->root());
    stateBefore_ = document_->ModelState();
    notes_.take(document_->root(), before_);
    placesBefore_.clear();
    for (const Keyword& keyword : before_.keywords) placesBefore_.emplace(keyword.path, &keyword);
  }

  // Makes an edit, sees what it has changed, and takes it back.
  std::vector<Change> changedBy(const std::function<void()>& edit) {
    const std::uint64_t state = document_->ModelState();
    look();
    edit();
    if (document_->ModelState() == state) {
      undoTo(state);
      return {};
    }
    ++edits_;
    const Snapshot after = snapshotOf(document_->root());
    notes_.take(document_->root(), after);
    undoTo(state);
    std::vector<Change> changes;
    std::vector<Change> further;
    for (const Keyword& now : after.keywords) {
      const auto held = placesBefore_.find(now.path);
      if (held == placesBefore_.end() || held->second->values == now.values) continue;
      const bool isFirst = isOfFirstItems(now.path);
      if (const auto known = notes_.placeOf(isFirst ? now.path : inFirstItems(now.path)))
        addChanges(*known, held->second->values, now.values, isFirst ? changes : further);
    }
    if (changes.empty()) {
      changes = std::move(further);
      for (Change& change : changes) change.ofFurtherItem = true;
    }
    changes_ += changes.size();
    return changes;
  }
  void addChanges(std::size_t note, const Values& before, const Values& after, std::vector<Change>& changes) {
    const bool isWhole = before.size() != after.size();
    const std::size_t parts = notes_.at(note).parts.size();
    for (std::size_t i = 0; i < (isWhole ? 1 : after.size()); ++i) {
      if (!isWhole && before[i] == after[i]) continue;
      const std::pair<ValueKind, std::string> none;
      const auto& [kind, now] = i < after.size() ? after[i] : none;
      changes.push_back({note, std::min(i, parts - 1), kind, i < before.size() ? before[i].second : "", now});
    }
  }

  static constexpr int kMostTries = 3;
  static constexpr std::size_t kEnoughEdits = 5;

  KeywordNotes& notes_;
  DialogHost& host_;
  CGridbayDoc* document_ = nullptr;
  CV27SetupFormView* shown_ = nullptr;
  std::string page_;                  // that is used
  std::set<std::string> linked_;      // places whose keywords have been found
  std::set<std::string> made_;        // choices that were made for what is behind them
  std::map<std::string, int> tried_;  // how often one was used to no avail
  std::size_t edits_ = 0;             // that have changed something
  std::size_t changes_ = 0;           // of keywords that were seen
  Snapshot before_;
  std::optional<std::uint64_t> stateBefore_;  // of the model that it was taken of
  std::unordered_map<std::string_view, const Keyword*> placesBefore_;
};

PageTrial::PageTrial(KeywordNotes& notes, DialogHost& host) : work_(std::make_unique<Work>(notes, host)) {}
PageTrial::~PageTrial() = default;

void PageTrial::use(CGridbayDoc& document, int depth) {
  work_->use(document, depth);
}

}  // namespace gridbay::python
