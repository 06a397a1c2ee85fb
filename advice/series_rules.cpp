// Doubts about the data files whose values the run goes through, in all modules that are in use.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "advice/rules.h"
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

// A file whose values the run goes through.
struct UsedSeries {
  PagePlace place;
  const CheckedFile& file;
  bool isSmooth = false;  // its values go on without jumps in nature
};

constexpr double kHalfSecond = 0.5 / 86400;  // days

std::string momentOf(const DateTime& origin, const CVdUnitConverter& toDays, const TsbTimeAxis& time,
                     std::size_t step) {
  return dateTimeText(origin.plusDays(toDays.Convert(time.at(step))));
}

// A run of fewer time steps, with what is written until then.
AdviceFix shorterRun(AdviceContext& context, const std::string& steps) {
  constexpr std::string_view kLast[] = {"Last_Time_Step", "End_Time_Step", "Warm_Up_Period"};
  AdviceFix fix{"End with the series",
                {{"NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Number_Of_Timesteps", steps}}};
  const KvsFile* file = context.written();
  if (file == nullptr) return fix;
  eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
    const auto isNamed = [&](std::string_view name) { return sameName(name, keyword.name()); };
    if (keyword.values().size() != 1 || keyword.values()[0].kind() != ValueKind::integer ||
        std::ranges::none_of(kLast, isNamed))
      return;
    const bool isBeyond =
        std::atoll(std::string(keyword.values()[0].text()).c_str()) > std::atoll(steps.c_str());
    if (isBeyond && findKeyword(context.model, place.keyword, context.documentPath))
      fix.settings.push_back({place.keyword, steps});
  });
  return fix;
}

// Whether the file covers the run.
void advisePeriod(AdviceContext& context, const UsedSeries& used, const TsbTimeAxis& time,
                  const DateTime& origin, const CVdUnitConverter& toDays) {
  const CSimulationPeriodKvs& period = *context.model.simulationPeriod;
  const DateTime first = origin.plusDays(toDays.Convert(time.at(0)));
  const DateTime last = origin.plusDays(toDays.Convert(time.at(time.count - 1)));
  const DateTime end = period.End();
  if (!first.valid() || !last.valid() || !end.valid() || !period.start.valid()) return;
  constexpr const char* kReason = "Beyond it the engine has no values, and stops.";
  if (first.linear() > period.start.linear() + kHalfSecond) {
    context.add({{},
                 fmt::format("{} begins at {}, after the run does at {}.", used.file.name,
                             dateTimeText(first), dateTimeText(period.start)),
                 kReason,
                 used.place});
  }
  if (last.linear() >= end.linear() - kHalfSecond) return;
  Advice advice{{},
                fmt::format("{} ends at {}, in the run, which ends at {}.", used.file.name,
                            dateTimeText(last), dateTimeText(end)),
                kReason,
                used.place};
  const double steps =
      std::floor((last.linear() - period.start.linear() + kHalfSecond) * 86400 / period.timeStepInterval);
  if (steps >= 1 && steps < period.LastTimeStep())
    advice.fix = shorterRun(context, fmt::format("{:.0f}", steps));
  context.add(std::move(advice));
}

void adviseValues(AdviceContext& context, const UsedSeries& used, const SeriesFacts& facts,
                  std::uint32_t number, const std::function<std::string(std::size_t)>& moment) {
  const SeriesFacts::Item& item = facts.items[number - 1];
  const TsbItem& named = facts.file.items[number - 1];
  if (item.missing > 0) {
    context.add(
        {{},
         fmt::format("\"{}\" of {} has {} missing value{}, the first at {}.", named.name, used.file.name,
                     item.missing, item.missing == 1 ? "" : "s", moment(item.firstMissing)),
         "What the engine takes in their place is not known.",
         used.place});
  }
  // A smooth curve that is sampled well goes no such way in one step.
  constexpr std::size_t kLeastSteps = 10;
  constexpr float kMostPart = 0.6F;
  const float range = item.highest - item.lowest;
  if (!used.isSmooth || facts.file.time.count < kLeastSteps || !(item.greatestJump > kMostPart * range) ||
      range <= 0)
    return;
  context.add({{},
               fmt::format("\"{}\" of {} jumps from {:.4g} to {:.4g} {} between {} and {}.", named.name,
                           used.file.name, item.before, item.after, named.unit, moment(item.jumpStep - 1),
                           moment(item.jumpStep)),
               "A wave that is none in nature runs through the model; often a value is mistyped.",
               used.place});
}

void adviseOne(AdviceContext& context, const UsedSeries& used) {
  if (used.file.path.empty()) return;
  const SeriesFacts* facts = context.files.series(used.file.path);
  if (facts == nullptr || facts->file.time.count == 0) return;
  const TsbTimeAxis& time = facts->file.time;
  const CVdUnitConverter toDays(time.unit, "d");
  // A single map holds throughout, and so may a relative axis that is none of time.
  const DateTime origin =
      time.isCalendar() ? DateTime::of(time.start) : context.model.simulationPeriod->start;
  const bool isOfTime = toDays.IsValid() && origin.valid();
  if (isOfTime && time.count > 1) advisePeriod(context, used, time, origin, toDays);
  if (!facts->hasValues) return;
  const auto moment = [&](std::size_t step) {
    return isOfTime ? momentOf(origin, toDays, time, step)
                    : fmt::format("{:.6g} {}", time.at(step), time.unit);
  };
  std::vector<std::uint32_t> items = used.file.items;
  if (items.empty()) {
    for (std::uint32_t number = 1; number <= facts->items.size(); ++number) items.push_back(number);
  }
  for (const std::uint32_t number : items) {
    if (number >= 1 && number <= facts->items.size()) adviseValues(context, used, *facts, number, moment);
  }
}

// A keyword that names a data file.
struct NameOnFile {
  PagePlace place;
  std::string path;
};

std::vector<NameOnFile> namesOnFile(AdviceContext& context) {
  std::vector<NameOnFile> names;
  const KvsFile* file = context.written();
  if (file == nullptr) return names;
  const std::string folder = folderOfFile(context.documentPath);
  eachKeyword(*file, [&](const PagePlace& place, const Node& keyword) {
    if (keyword.values().size() != 1 || keyword.values()[0].kind() != ValueKind::fileName) return;
    const std::string name(keyword.values()[0].text());
    if (!name.empty()) names.push_back({place, absolutePath(name, folder)});
  });
  return names;
}

// Where a file is chosen that a check has looked at.
PagePlace placeOf(const CheckedFile& file, const std::vector<NameOnFile>& names) {
  PagePlace place{.page = file.page,
                  .thing = thingOf(file.page, file.entries),
                  .value = file.name,
                  .entries = file.entries};
  const auto isOf = [&](const NameOnFile& each) {
    const auto isSame = [](const ListEntry& a, const ListEntry& b) { return a.number == b.number; };
    return each.place.page == file.page && each.path == file.path &&
           std::ranges::equal(each.place.entries, file.entries, isSame);
  };
  if (const auto found = std::ranges::find_if(names, isOf); found != names.end())
    place.keyword = found->place.keyword;
  return place;
}

// Levels and fluxes at boundaries go on smoothly; their directions need not.
bool isSmooth(const PagePlace& place) {
  return place.page == PageId::hdBoundary && !place.entries.empty() &&
         place.keyword.ends_with(fmt::format("/BOUNDARY_{}/File_Name", place.entries.front().number));
}

}  // namespace

// Which files are in use, and for what, the checks know. They may change the model, which is to stay as it
// is; that of the grids reads them whole, and has no series.
void adviseSeries(AdviceContext& context) {
  CGlobalKvs copy;
  copy.AssignState(context.model);
  ValidationList checked;
  for (const CheckRow& row : checkingOrder()) {
    if (!holds(row.condition, copy)) continue;
    CKvsBase& object = row.object(copy);
    if (&object != copy.bathymetry.get()) object.Validate(checked, 1);
  }
  const std::vector<NameOnFile> names = namesOnFile(context);
  for (const CheckedFile& file : checked.files) {
    if (!file.coversRun) continue;
    PagePlace place = placeOf(file, names);
    const bool smooth = isSmooth(place);
    adviseOne(context, {std::move(place), file, smooth});
  }
}

}  // namespace gridbay
