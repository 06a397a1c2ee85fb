// Doubts about the data files whose values the run goes through, in all modules that are in use.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <limits>
#include <map>
#include <memory>
#include <set>
#include <utility>

#include "advice/rules.h"
#include "advice/run_steps.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "core/letters.h"
#include "platform/files/paths.h"
#include "platform/units/units.h"
#include "setup/member_keyword.h"
#include "setup/page_places.h"
#include "setup/skeleton.h"

namespace gridbay {
namespace {

constexpr double kHalfSecond = 0.5 / 86400;  // days

// A file whose values the run goes through, with what is known of it.
struct UsedSeries {
  PagePlace place;
  const CheckedFile& file;
  const SeriesFacts& facts;
  std::vector<std::uint32_t> items;          // from 1
  bool isSmooth = false;                     // its values go on without jumps in nature
  const std::vector<std::string>& keywords;  // all that name it
};

// When its values are; nothing where its axis is none of time, or it is a single one that holds throughout.
struct Span {
  DateTime first;
  DateTime last;
  bool isCalendar = false;  // else it begins with the run

  bool covers(const DateTime& begin, const DateTime& end) const {
    return first.linear() <= begin.linear() + kHalfSecond && last.linear() >= end.linear() - kHalfSecond;
  }
};

// The moment of a time step. A relative axis counts from the start of the run, and may be none of time: then
// it is no valid one.
DateTime momentAt(AdviceContext& context, const TsbTimeAxis& time, std::size_t step) {
  const CVdUnitConverter toDays(time.unit, "d");
  const DateTime origin =
      time.isCalendar() ? DateTime::of(time.start) : context.model.simulationPeriod->start;
  return toDays.IsValid() && origin.valid() ? origin.plusDays(toDays.Convert(time.at(step)))
                                            : DateTime::invalid();
}

std::string momentOf(AdviceContext& context, const TsbTimeAxis& time, std::size_t step) {
  const DateTime moment = momentAt(context, time, step);
  return moment.valid() ? dateTimeText(moment) : fmt::format("{:.6g} {}", time.at(step), time.unit);
}

std::optional<Span> spanOf(AdviceContext& context, const TsbTimeAxis& time) {
  if (time.count < 2) return std::nullopt;
  const Span span{momentAt(context, time, 0), momentAt(context, time, time.count - 1), time.isCalendar()};
  return span.first.valid() && span.last.valid() ? std::optional(span) : std::nullopt;
}

constexpr double kDay = 86400;  // seconds

// Gives what counts the run's time steps other numbers: those of keywords that the model holds.
void addSteps(AdviceContext& context, AdviceFix& fix, const std::function<long long(long long)>& moved) {
  const KvsFile* file = context.written();
  if (file == nullptr) return;
  eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
    const int steps = runStepsIn(keyword);
    if (steps == 0) return;
    const bool isOfWarmUp = sameName("Warm_Up_Period", keyword.name());
    std::vector<long long> values;
    bool isOther = false;
    for (const Value& value : keyword.values()) {
      const long long step = wholeOf(value);
      long long now = step;
      if (static_cast<int>(values.size()) < steps)
        now = isOfWarmUp ? std::min(step, moved(std::numeric_limits<int>::max())) : moved(step);
      isOther |= now != step;
      values.push_back(now);
    }
    if (isOther && findKeyword(context.model, place.keyword, context.documentPath))
      fix.settings.push_back({place.keyword, fmt::format("{}", fmt::join(values, ","))});
  });
}

// A run of other time steps, with what is written meanwhile: `moved` tells the new number of each step.
AdviceFix otherRun(AdviceContext& context, std::string name, long long steps,
                   const std::function<long long(long long)>& moved) {
  AdviceFix fix{std::move(name),
                {{fmt::format("{}/Number_Of_Timesteps", kPeriodPath), std::to_string(steps)}}};
  addSteps(context, fix, moved);
  return fix;
}

AdviceFix shorterRun(AdviceContext& context, long long steps) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const DateTime end =
      period.start.plusDays(static_cast<double>(steps) * double{period.timeStepInterval} / kDay);
  return otherRun(context, fmt::format("End with the series, at {}", dateTimeText(end)), steps,
                  [steps](long long step) { return std::min(step, steps); });
}

// The moment to whole seconds, as a run can begin at; nothing where that is no date.
std::optional<Setting> beginningAt(const DateTime& moment) {
  const auto parts = moment.parts();
  if (!parts) return std::nullopt;
  return Setting{fmt::format("{}/Start_Time", kPeriodPath), fmt::format("{}", fmt::join(*parts, ","))};
}

// What goes with another begin of the run: series with no dates begin with it.
std::string withUndated(AdviceContext& context, std::span<const UsedSeries> all) {
  const auto isUndated = [&](const UsedSeries& each) {
    const std::optional<Span> span = spanOf(context, each.facts.file.time);
    return span && !span->isCalendar;
  };
  return std::ranges::any_of(all, isUndated) ? ", and the series without dates with it" : "";
}

// A run that begins so many time steps later, and ends when it did.
std::optional<AdviceFix> laterRun(AdviceContext& context, long long later, std::span<const UsedSeries> all) {
  if (context.isHotStart()) return std::nullopt;
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const long long steps = period.LastTimeStep() - later;
  std::optional<Setting> start =
      beginningAt(period.start.plusDays(static_cast<double>(later) * double{period.timeStepInterval} / kDay));
  if (!start) return std::nullopt;
  AdviceFix fix = otherRun(context, "Begin with the series" + withUndated(context, all), steps,
                           [=](long long step) { return std::clamp(step - later, 0LL, steps); });
  fix.settings.insert(fix.settings.begin(), std::move(*start));
  return fix;
}

double stepsInDay(const CSimulationPeriodKvs& period) {
  return kDay / double{period.timeStepInterval};
}

// The run at the time of a series, with as many of its steps as fit; nothing where none does, or where
// another series that covers the run would not cover it any more.
std::optional<AdviceFix> movedRun(AdviceContext& context, const Span& span, std::span<const UsedSeries> all) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  std::optional<Setting> start = beginningAt(span.first);
  if (!span.isCalendar || !start || context.isHotStart()) return std::nullopt;
  const DateTime begin = DateTime::of(*span.first.parts());
  const double fitting = std::floor((span.last.linear() - begin.linear() + kHalfSecond) * stepsInDay(period));
  const double steps = std::min(fitting, double{static_cast<double>(period.LastTimeStep())});
  if (!(steps >= 1)) return std::nullopt;
  const DateTime end = begin.plusDays(steps / stepsInDay(period));
  const auto isLeft = [&](const UsedSeries& each) {
    const std::optional<Span> other = spanOf(context, each.facts.file.time);
    return other && other->isCalendar && other->covers(period.start, period.End()) &&
           !other->covers(begin, end);
  };
  if (std::ranges::any_of(all, isLeft)) return std::nullopt;
  const auto last = static_cast<long long>(steps);
  AdviceFix fix = otherRun(context, "Move the run to the series" + withUndated(context, all), last,
                           [last](long long step) { return std::min(step, last); });
  fix.settings.insert(fix.settings.begin(), std::move(*start));
  return fix;
}

// A file that is made of the series, for all that take that, under a free name that ends so; the name of the
// fix ends in it.
AdviceFix otherFile(AdviceContext& context, const UsedSeries& used, std::string_view ending,
                    std::string_view what, FileMaking making) {
  const std::filesystem::path path(used.file.path);
  const std::string name =
      context.freeName(fmt::format("{}_{}{}", path.stem().string(), ending, path.extension().string()));
  AdviceFix fix{fmt::format("{}, in {}", what, name)};
  for (const std::string& keyword : used.keywords) fix.settings.push_back({keyword, name});
  fix.files.push_back(
      {used.file.path, absolutePath(name, folderOfFile(context.documentPath)), std::move(making)});
  return fix;
}

// The series over the run where it has none of its own there.
AdviceFix coveringSeries(AdviceContext& context, const UsedSeries& used, const Span& span) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const DateTime end = period.End();
  const bool isMoved = span.first.linear() > period.start.linear() + kHalfSecond ||
                       span.last.linear() < period.start.linear() - kHalfSecond;
  const double shift = isMoved ? period.start.linear() - span.first.linear() : 0;
  const bool isHeld = span.last.linear() + shift < end.linear() - kHalfSecond;
  const char* what = !isMoved ? "Hold the last value until the run's end"
                     : isHeld ? "Begin with the run and hold the last value until its end"
                              : "Move the series to the run's begin";
  return otherFile(context, used, isMoved ? "moved" : "held", what,
                   CoveringSeries{period.start, end, isMoved, !used.isSmooth});
}

// Whether the file covers the run.
void advisePeriod(AdviceContext& context, const UsedSeries& used, const Span& span,
                  std::span<const UsedSeries> all) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const DateTime end = period.End();
  if (!end.valid() || !period.start.valid()) return;
  constexpr const char* kReason = "Beyond it the engine has no values, and stops.";
  const double lastStep = period.LastTimeStep();
  // In time steps of the run.
  const auto stepsTo = [&](const DateTime& moment) {
    return (moment.linear() - period.start.linear()) * stepsInDay(period);
  };
  const double half = kHalfSecond * stepsInDay(period);
  const auto orElse = [&](std::optional<AdviceFix> fix) {
    if (!fix) fix = movedRun(context, span, all);
    return fix ? std::move(*fix) : coveringSeries(context, used, span);
  };
  if (span.first.linear() > period.start.linear() + kHalfSecond) {
    // A series with no dates begins with the run, and would move with it.
    const double later = std::ceil(stepsTo(span.first) - half);
    const bool isPartLeft = std::min(stepsTo(span.last) + half, lastStep) - later >= 1;
    std::optional<AdviceFix> fix;
    if (span.isCalendar && later >= 1 && isPartLeft)
      fix = laterRun(context, static_cast<long long>(later), all);
    context.add({{},
                 fmt::format("{} begins at {}, after the run does at {}.", used.file.name,
                             dateTimeText(span.first), dateTimeText(period.start)),
                 kReason,
                 used.place,
                 {},
                 orElse(std::move(fix))});
  }
  if (span.last.linear() >= end.linear() - kHalfSecond) return;
  const double steps = std::floor(stepsTo(span.last) + half);
  std::optional<AdviceFix> fix;
  if (steps >= 1 && steps < lastStep) fix = shorterRun(context, static_cast<long long>(steps));
  context.add({{},
               fmt::format("{} ends at {}, in the run, which ends at {}.", used.file.name,
                           dateTimeText(span.last), dateTimeText(end)),
               kReason,
               used.place,
               {},
               orElse(std::move(fix))});
}

// What the name of a fix says of the gaps of a file; empty where it has none.
std::string fillingOf(const SeriesFacts& facts) {
  std::vector<std::string> empty;
  std::size_t missing = 0;
  for (std::size_t i = 0; i < facts.items.size(); ++i) {
    missing += facts.items[i].missing;
    if (facts.items[i].missing == facts.file.time.count * facts.file.pointCount())
      empty.push_back(fmt::format("\"{}\"", facts.file.items[i].name));
  }
  if (missing == 0) return {};
  return empty.empty() ? "fill the gaps"
                       : fmt::format("fill the gaps, with 0 for {}", fmt::join(empty, ", "));
}

AdviceFix withoutGaps(AdviceContext& context, const UsedSeries& used) {
  std::string what = fillingOf(used.facts);
  what[0] = 'F';
  return otherFile(context, used, "filled", what, FilledSeries{});
}

// Without the values that stand apart in all items that are not smooth, whoever takes them.
AdviceFix withoutApart(AdviceContext& context, const UsedSeries& used, std::span<const UsedSeries> all) {
  std::set<std::uint32_t> items;
  for (const UsedSeries& each : all) {
    if (each.isSmooth || each.file.path != used.file.path) continue;
    for (const std::uint32_t number : each.items) {
      if (used.facts.items[number - 1].apart) items.insert(number);
    }
  }
  const std::string filling = fillingOf(used.facts);
  const std::string what =
      fmt::format("Put {} on the line between {} neighbours{}{}",
                  items.size() == 1 ? "the value that stands apart" : "the values that stand apart",
                  items.size() == 1 ? "its" : "their", filling.empty() ? "" : " and ", filling);
  return otherFile(context, used, "filled", what, FilledSeries{{items.begin(), items.end()}});
}

// Without the jumps of all items that are to be smooth, whoever takes them.
AdviceFix withoutJumps(AdviceContext& context, const UsedSeries& used, std::span<const UsedSeries> all) {
  std::set<std::uint32_t> smooth;
  for (const UsedSeries& each : all) {
    if (each.isSmooth && each.file.path == used.file.path)
      smooth.insert(each.items.begin(), each.items.end());
  }
  SmoothedSeries making;
  std::size_t jumping = 0;
  for (const std::uint32_t number : smooth) {
    if (!used.facts.items[number - 1].jump) continue;
    making.items.push_back(number);
    jumping += used.facts.items[number - 1].jumping;
  }
  const std::string filling = fillingOf(used.facts);
  const std::string what = fmt::format(
      "Smooth {} {}{} that jump{}{}{}", jumping, used.facts.file.axes.empty() ? "value" : "time step",
      jumping == 1 ? "" : "s", jumping == 1 ? "s" : "", filling.empty() ? "" : " and ", filling);
  return otherFile(context, used, "smooth", what, std::move(making));
}

void adviseValues(AdviceContext& context, const UsedSeries& used, std::span<const UsedSeries> all,
                  std::uint32_t number) {
  const SeriesFacts::Item& item = used.facts.items[number - 1];
  const TsbItem& named = used.facts.file.items[number - 1];
  const auto moment = [&](std::size_t step) { return momentOf(context, used.facts.file.time, step); };
  if (item.missing > 0) {
    context.add(
        {{},
         fmt::format("\"{}\" of {} has {} missing value{}, the first at {}.", named.name, used.file.name,
                     item.missing, item.missing == 1 ? "" : "s", moment(item.firstMissing)),
         "What the engine takes in their place is not known.",
         used.place,
         {},
         withoutGaps(context, used)});
  }
  if (!used.isSmooth && item.apart) {
    context.add({{},
                 fmt::format("\"{}\" of {} is {:.6g} {} at {}, far from all its other values.", named.name,
                             used.file.name, item.apart->second, named.unit, moment(item.apart->first)),
                 "Often such a value is mistyped, or stands for one that is missing.",
                 used.place,
                 {},
                 withoutApart(context, used, all)});
  }
  if (!used.isSmooth || !item.jump) return;
  context.add({{},
               fmt::format("\"{}\" of {} jumps from {:.4g} to {:.4g} {} between {} and {}.", named.name,
                           used.file.name, item.jump->before, item.jump->after, named.unit,
                           moment(item.jump->step - 1), moment(item.jump->step)),
               "A wave that is none in nature runs through the model; often a value is mistyped.",
               used.place,
               {},
               withoutJumps(context, used, all)});
}

void adviseOne(AdviceContext& context, const UsedSeries& used, std::span<const UsedSeries> all) {
  if (const std::optional<Span> span = spanOf(context, used.facts.file.time))
    advisePeriod(context, used, *span, all);
  if (!used.facts.hasValues) return;
  for (const std::uint32_t number : used.items) adviseValues(context, used, all, number);
}

// The items of a file that are used, of those that it has.
std::vector<std::uint32_t> itemsOf(const CheckedFile& file, const SeriesFacts& facts) {
  const auto count = static_cast<std::uint32_t>(facts.file.items.size());
  std::vector<std::uint32_t> items = file.items;
  if (items.empty()) {
    for (std::uint32_t number = 1; number <= count; ++number) items.push_back(number);
  }
  std::erase_if(items, [&](std::uint32_t number) { return number < 1 || number > count; });
  return items;
}

// The keywords that name a data file. Those of results may be what is read on their own page.
struct NamesOfFile {
  using Place = std::pair<PageId, std::vector<int>>;

  std::vector<std::string> keywords;
  std::vector<std::pair<PageId, std::string>> ofResults;
  std::map<Place, std::string> first;  // on each page, for the entries of its lists
  std::map<PageId, std::vector<std::string>> byPage = {};

  static Place placeOf(PageId page, const std::vector<ListEntry>& entries) {
    Place place{page, {}};
    for (const ListEntry& entry : entries) place.second.push_back(entry.number);
    return place;
  }
  const std::vector<std::string>& keywordsFor(PageId page) {
    const auto [at, isNew] = byPage.try_emplace(page, keywords);
    for (const auto& [of, keyword] : ofResults) {
      if (isNew && of == page) at->second.push_back(keyword);
    }
    return at->second;
  }
};

// By the absolute names of the files.
std::map<std::string, NamesOfFile> namesOnFile(AdviceContext& context) {
  std::map<std::string, NamesOfFile> names;
  const std::string folder = folderOfFile(context.documentPath);
  for (const auto& [place, name, isResult] : context.fileKeywords()) {
    NamesOfFile& file = names[absolutePath(name, folder)];
    if (isResult) {
      file.ofResults.emplace_back(place.page, place.keyword);
    } else {
      file.keywords.push_back(place.keyword);
    }
    file.first.try_emplace(NamesOfFile::placeOf(place.page, place.entries), place.keyword);
  }
  return names;
}

// Where a file is chosen that a check has looked at.
PagePlace placeOf(const CheckedFile& file, const NamesOfFile& names) {
  PagePlace place{.page = file.page,
                  .thing = thingOf(file.page, file.entries),
                  .value = file.name,
                  .entries = file.entries};
  const auto found = names.first.find(NamesOfFile::placeOf(file.page, file.entries));
  if (found != names.first.end()) place.keyword = found->second;
  return place;
}

// Levels and fluxes at boundaries go on smoothly; their directions need not.
bool isSmooth(const PagePlace& place) {
  return place.page == PageId::hdBoundary && !place.entries.empty() &&
         place.keyword.ends_with(fmt::format("/BOUNDARY_{}/File_Name", place.entries.front().number));
}

// The series that are known, and what they are of.
struct UsedFiles {
  ValidationList checked;
  std::map<std::string, NamesOfFile> names;
  std::vector<UsedSeries> all;
};

// Which files are in use, and for what, the checks know. They may change the model, which is to stay as it
// is; that of the grids reads them whole, and has no series.
std::unique_ptr<const UsedFiles> usedFiles(AdviceContext& context) {
  CGlobalKvs copy;
  copy.AssignState(context.model);
  auto used = std::make_unique<UsedFiles>();
  auto& [checked, names, all] = *used;
  for (const CheckRow& row : checkingOrder()) {
    if (!holds(row.condition, copy)) continue;
    CKvsBase& object = row.object(copy);
    if (&object != copy.bathymetry.get()) object.Validate(checked, 1);
  }
  names = namesOnFile(context);
  for (const CheckedFile& file : checked.files) {
    if (!file.coversRun || file.path.empty()) continue;
    const SeriesFacts* facts = context.files.series(file.path);
    if (facts == nullptr || facts->file.time.count == 0) continue;
    NamesOfFile& named = names[file.path];
    const std::vector<std::string>& keywords = named.keywordsFor(file.page);
    if (keywords.empty()) continue;  // of a setup that can't be written, which a save tells
    PagePlace place = placeOf(file, named);
    // Of what goes on by levels, as a rating curve, nothing is known.
    const bool smooth = isSmooth(place) && momentAt(context, facts->file.time, 0).valid();
    all.push_back({std::move(place), file, *facts, itemsOf(file, *facts), smooth, keywords});
  }
  return used;
}

}  // namespace

void adviseSeries(AdviceContext& context) {
  const std::unique_ptr<const UsedFiles> files = usedFiles(context);
  for (const UsedSeries& used : files->all) adviseOne(context, used, files->all);
}

double secondsOfSeries(AdviceContext& context) {
  double shortest = INFINITY;
  const DateTime& start = context.model.simulationPeriod->start;
  const std::unique_ptr<const UsedFiles> files = usedFiles(context);
  for (const UsedSeries& used : files->all) {
    const std::optional<Span> span = spanOf(context, used.facts.file.time);
    const double days = span ? span->last.linear() - start.linear() : 0;
    if (days > 0) shortest = std::min(shortest, days * kDay);
  }
  return shortest;
}

}  // namespace gridbay
