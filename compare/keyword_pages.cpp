#include "compare/keyword_pages.h"

#include <algorithm>
#include <bit>
#include <map>
#include <tuple>
#include <unordered_map>
#include <unordered_set>

#include "compare/page_difference.h"
#include "setup/member_keyword.h"
#include "setup/page_places.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

constexpr std::size_t kMostKeywords = 500;    // that are tried one by one
constexpr std::size_t kMostRead = 1'000'000;  // fields and cells
constexpr std::size_t kFewEntries = 60;       // keywords of entries, below which each is tried by itself
constexpr std::size_t kMuch = 4000;           // pages to read

using Keywords = std::vector<const KeywordDifference*>;

bool isShownAlike(const Difference& a, const Difference& b) {
  Difference same = b;
  same.keywords = a.keywords;
  return a == same;
}

// Whether a keyword stands in an entry of a list: "BOUNDARY_2/Value", "weir_data[2]/Name".
bool isOfEntry(std::string_view path) {
  const std::string_view section = path.substr(0, path.rfind('/'));
  for (std::size_t end = section.size(); end != 0;) {
    const std::size_t slash = section.rfind('/', end - 1);
    const std::size_t begin = slash == section.npos ? 0 : slash + 1;
    const std::string_view step = section.substr(begin, end - begin);
    const std::size_t last = step.find_last_not_of("0123456789");
    if (step.ends_with(']') || (last != step.npos && last + 1 < step.size() && step[last] == '_'))
      return true;
    end = begin == 0 ? 0 : slash;
  }
  return false;
}

std::string sectionOf(const std::string& path) {
  return path.substr(0, path.rfind('/') + 1);
}

class KeywordJoiner {
 public:
  KeywordJoiner(const KvsFile& own, const KvsFile& other, const std::string& path, const UnitChoices& units,
                SetupDifference& found)
      : keywords_(found.keywords),
        differences_(found.differences),
        own_(own),
        other_(other),
        path_(path),
        units_(units) {
    for (Difference& difference : found.differences) byPage_[difference.page].push_back(&difference);
  }

  std::vector<std::string> join(const SetupDifference* before) {
    if (before != nullptr) keepFormer(*before);
    if (!byPage_.empty()) joinNew();
    std::vector<std::string> left;
    for (const KeywordDifference& keyword : keywords_) {
      if (!joined_.contains(keyword.path)) left.push_back(keyword.path);
    }
    return left;
  }

 private:
  using Row = std::tuple<std::int32_t, int, int, int>;
  static Row rowOf(const Difference& difference) {
    return {difference.page, difference.currentRow, difference.table, difference.row};
  }

  // What the pages that are as they were have been found to be made of; they are passed over then. Only
  // keywords that were made otherwise since, or were found on no such page, are tried for the others.
  void keepFormer(const SetupDifference& before) {
    std::unordered_map<std::string_view, const KeywordDifference*> then;
    for (const KeywordDifference& keyword : before.keywords) then[keyword.path] = &keyword;
    std::unordered_set<std::string> changed;
    for (const KeywordDifference& keyword : keywords_) {
      const auto former = then.find(keyword.path);
      if (former == then.end() || *former->second != keyword) changed.insert(keyword.path);
      if (former != then.end()) then.erase(former);
    }
    for (const auto& [path, unused] : then) changed.emplace(path);
    std::map<std::int32_t, std::vector<const Difference*>> pages;
    for (const Difference& difference : before.differences) pages[difference.page].push_back(&difference);
    std::unordered_set<std::string> ofOthers = std::move(changed);
    const auto isAsItWas = [&](const std::vector<Difference*>& now,
                               const std::vector<const Difference*>& former) {
      return std::ranges::equal(now, former, [&](const Difference* a, const Difference* b) {
        return isShownAlike(*a, *b) && !b->keywords.empty() &&
               std::ranges::none_of(b->keywords, [&](const std::string& k) { return ofOthers.contains(k); });
      });
    };
    std::vector<std::int32_t> kept;
    for (const auto& [page, differences] : byPage_) {
      if (isAsItWas(differences, pages[page])) kept.push_back(page);
    }
    for (const std::int32_t page : kept) {
      for (std::size_t i = 0; i < byPage_[page].size(); ++i) {
        byPage_[page][i]->keywords = pages[page][i]->keywords;
        joined_.insert(byPage_[page][i]->keywords.begin(), byPage_[page][i]->keywords.end());
      }
      byPage_.erase(page);
    }
    for (const auto& [page, unused] : byPage_) {
      for (const Difference* difference : pages[page])
        ofOthers.insert(difference->keywords.begin(), difference->keywords.end());
    }
    for (const KeywordDifference& keyword : keywords_) {
      if (joined_.contains(keyword.path) && !ofOthers.contains(keyword.path))
        passedOver_.insert(keyword.path);
    }
  }

  void joinNew() {
    Keywords single;
    Keywords ofEntries;
    for (const KeywordDifference& keyword : keywords_) {
      const bool isChange = !keyword.isSection && keyword.own && keyword.other;
      if (!isChange || isOption(keyword.path) || passedOver_.contains(keyword.path)) continue;
      (isOfEntry(keyword.path) ? ofEntries : single).push_back(&keyword);
    }
    const auto made = [this](const std::string& path) { joinMade(path); };
    tryEach(single, own_, other_, made);
    const bool areMany = ofEntries.size() > kFewEntries;
    if (areMany) joinByNumbers(ofEntries);
    std::erase_if(ofEntries, [this](const auto* each) { return joined_.contains(each->path); });
    tryEach(ofEntries, own_, other_, made);
    if (areMany) joinRows();
    dropJoined();
    // What one keyword alone does not make follows from several, as a value with the choice that shows it:
    // those that unmake it where it stands.
    if (!byPage_.empty()) {
      Keywords all;
      for (const KeywordDifference& keyword : keywords_) {
        if (!keyword.isSection && keyword.own && keyword.other && !isOption(keyword.path))
          all.push_back(&keyword);
      }
      tried_ = 0;
      read_ = 0;
      tryEach(all, other_, own_, [this](const std::string& path) { joinUnmade(path); });
    }
    joinTheRest();
  }

  // Pages with values that no keyword is known to make.
  void dropJoined() {
    for (auto page = byPage_.begin(); page != byPage_.end();) {
      for (Difference* each : page->second) {
        if (each->keywords.empty()) open_.push_back(each);
      }
      std::erase_if(page->second,
                    [](const Difference* each) { return !each->keywords.empty() || isThing(*each); });
      page = page->second.empty() ? byPage_.erase(page) : std::next(page);
    }
  }

  // Brings the probe from one file's model to the same with one keyword of the other, for each keyword.
  template <class Look>
  void tryEach(const Keywords& keywords, const KvsFile& from, const KvsFile& to, Look look) {
    if (keywords.empty()) return;
    ComparedModel start(from, path_, units_);
    if (probe_ == nullptr) probe_ = std::make_unique<ComparedModel>(own_, path_, units_);
    isMuch_ = byPage_.size() * std::min(keywords.size(), kMostKeywords) > kMuch;
    for (const KeywordDifference* keyword : keywords) {
      if (read_ > kMostRead || ++tried_ > kMostKeywords) {
        isCut_ = true;
        return;
      }
      probe_->assign(start.root());
      const Node* wanted = nodeAt(to, keyword->path);
      Result<MemberKeyword> held = findKeyword(probe_->root(), keyword->path, path_);
      if (wanted == nullptr || !held) continue;
      const std::span<const Value> values = wanted->values();
      if (!held->set({values.begin(), values.end()})) continue;
      probe_->showTree();
      look(keyword->path);
    }
  }

  // All at once: each keyword has a number, and for each binary digit there are two models, one with the
  // keywords whose number has the digit, one with the others. What a single keyword makes is seen in just
  // one of the two, each time, and these spell its number.
  void joinByNumbers(const Keywords& keywords) {
    std::unordered_map<std::string_view, std::size_t> numbers;
    for (const KeywordDifference* keyword : keywords) numbers.emplace(keyword->path, numbers.size());
    struct Spelled {
      std::size_t number = 0;
      bool isOne = true;
    };
    std::unordered_map<const Difference*, Spelled> spelled;
    const auto digits = static_cast<std::size_t>(std::bit_width(keywords.size() - 1));
    for (std::size_t digit = 0; digit < digits; ++digit) {
      std::unordered_map<const Difference*, std::size_t> seen;
      for (const std::size_t half : {1U, 0U}) {
        const KvsHandle file = withTaken(own_, other_, [&](const std::string& path) {
          const auto number = numbers.find(path);
          return number != numbers.end() && (number->second >> digit & 1U) == half;
        });
        ComparedModel model(*file, path_, units_);
        for (const auto& [page, differences] : byPage_) {
          if (!model.isVisible(page)) continue;
          const PageContents contents = model.contents(page);
          for (const Difference* difference : differences) {
            if (isThing(*difference) || valueAt(*difference, contents) != difference->other) continue;
            ++seen[difference];
            spelled[difference].number |= half << digit;
          }
        }
      }
      for (const auto& [page, differences] : byPage_) {
        for (const Difference* difference : differences)
          spelled[difference].isOne = spelled[difference].isOne && seen[difference] == 1;
      }
    }
    for (const auto& [page, differences] : byPage_) {
      for (Difference* difference : differences) {
        const auto [number, isOne] = spelled[difference];
        if (!isOne || isThing(*difference) || number >= keywords.size()) continue;
        const std::string& path = keywords[number]->path;
        if (std::ranges::find(difference->keywords, path) == difference->keywords.end())
          difference->keywords.push_back(path);
        joined_.insert(path);
      }
    }
  }

  PageContents read(std::int32_t page) {
    if (!probe_->isVisible(page)) return {};
    PageContents contents = probe_->contents(page);
    read_ += contents.size();
    return contents;
  }

  void joinMade(const std::string& path) {
    std::optional<std::vector<std::string>> followers;
    // The page that the last one was found on is the likeliest; where there is much to read it is the only
    // one.
    std::vector<std::int32_t> order{lastPage_};
    for (const auto& [page, unused] : byPage_) {
      if (page != lastPage_) order.push_back(page);
    }
    bool isFound = false;
    for (const std::int32_t page : order) {
      if (!byPage_.contains(page) || (isFound && isMuch_)) continue;
      const PageContents contents = read(page);
      for (Difference* difference : byPage_[page]) {
        const bool isPage = difference->thing.empty();
        const bool isSeen = probe_->isVisible(page);
        const std::optional<std::string> value = valueAt(*difference, contents);
        const bool isMade = isPage ? isSeen == difference->other.has_value()
                            : isThing(*difference)
                                ? isSeen && value.has_value() == difference->other.has_value()
                                : isSeen && value == difference->other;
        if (!isMade) continue;
        difference->keywords.push_back(path);
        if (isThing(*difference)) {
          if (!followers) followers = followersOfProbe();
          difference->keywords.insert(difference->keywords.end(), followers->begin(), followers->end());
        }
        isFound = true;
        lastPage_ = page;
      }
    }
    if (isFound) joined_.insert(path);
    if (followers) joined_.insert(followers->begin(), followers->end());
  }

  void joinUnmade(const std::string& path) {
    for (const auto& [page, differences] : byPage_) {
      const PageContents contents = read(page);
      for (Difference* difference : differences) {
        const std::optional<std::string> value = valueAt(*difference, contents);
        if (!value || value == difference->other) continue;
        difference->keywords.push_back(path);
        joined_.insert(path);
      }
    }
  }

  // The sections that come or go with the keyword that the probe has been given.
  std::vector<std::string> followersOfProbe() {
    std::vector<std::string> followers;
    const KvsHandle file = probe_->file();
    for (const KeywordDifference& each : keywords_) {
      if (each.own && each.other) continue;
      if ((nodeAt(*file, each.path) != nullptr) == each.other.has_value()) followers.push_back(each.path);
    }
    return followers;
  }

  // A cell that no keyword is known to make is made by those of the entry that other cells of its row are of.
  void joinRows() {
    std::map<Row, std::string> sections;
    for (const Difference& each : differences_) {
      if (each.table > 0 && !each.keywords.empty()) sections[rowOf(each)] = sectionOf(each.keywords.front());
    }
    std::unordered_map<std::string, std::vector<std::string>> ofSection;
    for (const KeywordDifference& keyword : keywords_)
      ofSection[sectionOf(keyword.path)].push_back(keyword.path);
    for (const auto& [page, differences] : byPage_) {
      for (Difference* each : differences) {
        const auto section = sections.find(rowOf(*each));
        if (!each->keywords.empty() || isThing(*each) || section == sections.end()) continue;
        each->keywords = ofSection[section->second];
        joined_.insert(each->keywords.begin(), each->keywords.end());
      }
    }
  }

  // What is still made by none is made by those of its page. Where not all was tried these are not told by
  // themselves any more.
  void joinTheRest() {
    std::erase_if(open_, [](const Difference* each) { return !each->keywords.empty(); });
    if (open_.empty()) return;
    const std::map<std::int32_t, std::vector<std::string>> ofPages = keywordsOfPages();
    for (Difference* difference : open_) {
      const auto page = ofPages.find(difference->page);
      if (page == ofPages.end()) continue;
      difference->keywords = page->second;
      if (isCut_) joined_.insert(page->second.begin(), page->second.end());
    }
  }

  std::map<std::int32_t, std::vector<std::string>> keywordsOfPages() const {
    std::unordered_map<std::string, std::int32_t> pages;
    for (const KvsFile* file : {&own_, &other_}) {
      eachKeyword(*file, [&](const PagePlace& place, const Node&) {
        pages.emplace(place.keyword, static_cast<std::int32_t>(place.page));
      });
    }
    std::map<std::int32_t, std::vector<std::string>> keywords;
    for (const KeywordDifference& keyword : keywords_) {
      if (const auto page = pages.find(keyword.path); page != pages.end())
        keywords[page->second].push_back(keyword.path);
    }
    return keywords;
  }

  const std::vector<KeywordDifference>& keywords_;
  const std::vector<Difference>& differences_;
  const KvsFile& own_;
  const KvsFile& other_;
  const std::string& path_;
  const UnitChoices& units_;
  std::unique_ptr<ComparedModel> probe_;
  std::map<std::int32_t, std::vector<Difference*>> byPage_;
  std::vector<Difference*> open_;
  std::unordered_set<std::string> joined_;
  std::unordered_set<std::string> passedOver_;
  std::int32_t lastPage_ = 0;
  std::size_t tried_ = 0;
  std::size_t read_ = 0;
  bool isMuch_ = false;
  bool isCut_ = false;
};

}  // namespace

std::vector<std::string> joinKeywords(const KvsFile& own, const KvsFile& other, const std::string& path,
                                      const UnitChoices& units, const SetupDifference* before,
                                      SetupDifference& found) {
  return KeywordJoiner(own, other, path, units, found).join(before);
}

}  // namespace gridbay
