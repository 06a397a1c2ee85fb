#include "python/keyword_list.h"

#include <algorithm>
#include <array>
#include <memory>
#include <set>

#include "basic/module_selection.h"
#include "core/edition.h"
#include "core/file_name.h"
#include "core/number_text.h"
#include "ecology/model_definition.h"
#include "python/page_trial.h"
#include "setup/member_keyword.h"

namespace gridbay::python {
namespace {

class Collector {
 public:
  Collector() : trial_(notes_, host_) {}

  // The lists of the ecological model follow a definition.
  KeywordList collect(const std::string& definition) {
    constexpr std::array kModules{module::kHydrodynamic, module::kAdvectionDispersion, module::kMudTransport,
                                  module::kMudTransportExpanded, module::kEcological};
    for (const std::int32_t code : kModules) {
      if (theEdition.wetlandSweepKit && code != module::kHydrodynamic) continue;
      document_ = std::make_unique<CGridbayDoc>(host_);
      root().moduleSelection->simulationType = code;
      take(snapshot());
      if (code == module::kEcological) {
        UFileName file;
        file = definition;
        root().wqsModelDefinition->Choose(file);
      }
      fill(1, 1);
      // What is chosen on one page decides what another one shows: each choice is made, all at once.
      for (std::size_t turn = 0; turn < kTurns; ++turn) {
        // Twice, as one may bring up another.
        chooseAll(turn);
        chooseAll(turn);
        const bool isLast = turn + 1 == kTurns;
        fill(isLast ? 2 : 1, isLast || turn == 0 ? 1 : 0);
      }
    }
    return std::move(notes_).finished();
  }

 private:
  CGlobalKvs& root() { return document_->root(); }
  Snapshot snapshot() { return snapshotOf(root()); }
  void take(const Snapshot& shot) { notes_.take(root(), shot); }

  bool set(const std::string& path, std::int32_t value) {
    return set(path, ValueKind::integer, numberText(std::int64_t{value}));
  }
  bool set(const std::string& path, bool value) {
    return set(path, ValueKind::boolean, value ? "true" : "false");
  }
  bool set(const std::string& path, ValueKind kind, const std::string& text) {
    Result<MemberKeyword> keyword = findKeyword(root(), path, {});
    ParameterTree keeper;
    return keyword && keyword->set({keeper.makeValue(kind, keeper.keep(text))});
  }

  // All flags on, off, and every other one of them; and of each choice another one.
  void chooseAll(std::size_t turn) {
    std::size_t flags = 0;
    for (const Keyword& keyword : snapshot().keywords) {
      const KeywordNote* known = notes_.find(keyword.path);
      if (known == nullptr || !known->canBeSet || keyword.values.size() != 1 ||
          keyword.path.starts_with(kModuleSelection))
        continue;
      const auto& choices = known->parts.front().choices;
      if (!choices.empty()) {
        set(keyword.path, keyword.values.front().first, choices[(turn + 1) % choices.size()].first);
      } else if (keyword.values.front().first == ValueKind::boolean) {
        set(keyword.path, turn < 2 ? turn == 0 : flags++ % 2 == turn % 2);
      }
    }
  }

  void fill(int items, int depth) {
    grow(items);
    grow(items);
    // So that what is taken back later does not go behind this.
    document_->RecordEdit(PageId::none, "filled");
    take(snapshot());
    notes_.takeWhatCanBeSet(root());
    trial_.use(*document_, depth);
  }

  // Each list gets so many items at least, and it is seen which keyword makes another.
  void grow(int items) {
    std::set<std::string> tried;
    for (bool grown = true; grown;) {
      grown = false;
      for (const Keyword& keyword : snapshot().keywords) {
        if (!looksLikeACount(keyword) || !isOfFirstItems(keyword.path) ||
            !tried.insert(keyword.path).second) {
          continue;
        }
        grown = true;
        const Snapshot before = snapshot();
        const std::int32_t now = int32OfText(keyword.values.front().second).value_or(0);
        if (now < 0 || now > 100 || !set(keyword.path, now + 2)) continue;
        const Snapshot after = snapshot();
        bool any = false;
        const std::set<std::string> known(before.sections.begin(), before.sections.end());
        for (const std::string& section : after.sections) {
          const auto item = itemOf(nameOf(section));
          if (known.contains(section) || !item || item->number < 2) continue;
          const std::string parent = parentOf(section);
          if (!isOfFirstItems(parent + "/x")) continue;
          any = true;
          const std::string name = parent.empty() ? item->list : parent + "/" + item->list;
          ListNote& note = notes_.list(name);
          (parent == parentOf(keyword.path) ? note.count : note.followed) = keyword.path;
        }
        take(after);
        set(keyword.path, any ? std::max(now, items) : now);
      }
    }
  }

  static constexpr std::string_view kModuleSelection = "NESTED_MODEL_GLOBALS/MODULE_SELECTION/";
  static constexpr std::size_t kTurns = 4;

  DialogHost host_;
  std::unique_ptr<CGridbayDoc> document_;
  KeywordNotes notes_;
  PageTrial trial_;
};

}  // namespace

KeywordList collectKeywords(const std::string& definition) {
  return Collector().collect(definition);
}

}  // namespace gridbay::python
