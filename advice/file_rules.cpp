// Doubts about what is read and written: series, names of files, the size of what is written.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <map>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/source_sink.h"
#include "advice/rules.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/letters.h"
#include "ecology/boundary.h"
#include "ecology/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/wind_conditions.h"
#include "mud_transport/boundary.h"
#include "mud_transport/source_sink.h"
#include "platform/files/paths.h"
#include "platform/units/units.h"
#include "setup/member_keyword.h"
#include "setup/setup_path.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

// A file whose values the run goes through.
struct UsedSeries {
  AdvicePlace place;
  const FileNameValue& file;
  std::vector<std::uint32_t> items = {};  // from 1; empty for all
  bool isSmooth = false;                  // its values go on without jumps in nature
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
  eachKeyword(*file, [&](const std::string& path, const Node& keyword) {
    const auto isNamed = [&](std::string_view name) { return sameName(name, keyword.name()); };
    if (keyword.values().size() != 1 || keyword.values()[0].kind() != ValueKind::integer ||
        std::ranges::none_of(kLast, isNamed))
      return;
    const bool isBeyond =
        std::atoll(std::string(keyword.values()[0].text()).c_str()) > std::atoll(steps.c_str());
    if (isBeyond && findKeyword(context.model, path, context.documentPath))
      fix.settings.push_back({path, steps});
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
                 fmt::format("{} begins at {}, after the run does at {}.", used.file.text(),
                             dateTimeText(first), dateTimeText(period.start)),
                 kReason,
                 used.place});
  }
  if (last.linear() >= end.linear() - kHalfSecond) return;
  Advice advice{{},
                fmt::format("{} ends at {}, in the run, which ends at {}.", used.file.text(),
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
         fmt::format("\"{}\" of {} has {} missing value{}, the first at {}.", named.name, used.file.text(),
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
                           used.file.text(), item.before, item.after, named.unit, moment(item.jumpStep - 1),
                           moment(item.jumpStep)),
               "A wave that is none in nature runs through the model; often a value is mistyped.",
               used.place});
}

void adviseOne(AdviceContext& context, const UsedSeries& used) {
  if (used.file.empty()) return;
  const SeriesFacts* facts = context.files.series(used.file.absolute());
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
  std::vector<std::uint32_t> items = used.items;
  if (items.empty()) {
    for (std::uint32_t number = 1; number <= facts->items.size(); ++number) items.push_back(number);
  }
  for (const std::uint32_t number : items) {
    if (number >= 1 && number <= facts->items.size()) adviseValues(context, used, *facts, number, moment);
  }
}

AdvicePlace entryAt(PageId page, std::string_view what, int number, int count, std::string keyword) {
  return {page, thingOf(what, number), std::move(keyword), {}, number, count};
}

void adviseFlow(AdviceContext& context) {
  CGlobalKvs& model = context.model;
  constexpr std::string_view kFlow = "HYDRODYNAMIC_MODULE";
  for (int number = 1; number <= model.nhdBoundary->GetCount(); ++number) {
    using Flow = CNhdBoundaryObjectKvs;
    const Flow& flow = *model.nhdBoundary->GetItem(number);
    if (flow.dataFormat != Flow::kType0File && flow.dataFormat != Flow::kType1File) continue;
    adviseOne(context, {entryAt(PageId::hdBoundary, "boundary", number, model.nhdBoundary->GetCount(),
                                fmt::format("{}/OPEN_BOUNDARY/BOUNDARY_{}/File_Name", kFlow, number)),
                        flow.dataFile.fileName, flow.dataFile.items, true});
  }
  for (int number = 1; number <= model.nhdSourceSink->GetCount(); ++number) {
    const CNhdSourceSinkObjectKvs& source = *model.nhdSourceSink->GetItem(number);
    if (source.dataFormat != CNhdSourceSinkObjectKvs::kFromFile) continue;
    adviseOne(context, {entryAt(PageId::hdSourceAndSink, "source", number, model.nhdSourceSink->GetCount(),
                                fmt::format("{}/SOURCE_AND_SINK/SOURCE_SINK_{}/File_Name", kFlow, number)),
                        source.dataFile.fileName, source.dataFile.items});
  }
  const auto surface = [&](std::string_view what, std::int32_t kind, const UTsbSelection& selection,
                           int fieldNumber) {
    if (kind == CNhdSourceSinkKvs::kConstant) return;
    AdvicePlace place{PageId::hdSourceAndSink,
                      {},
                      fmt::format("{}/SOURCE_AND_SINK/{}/File_Name", kFlow, what),
                      "File name"};
    place.fieldNumber = fieldNumber;
    adviseOne(context, {std::move(place), selection.fileName, selection.items});
  };
  surface("Evaporation", model.nhdSourceSink->evaporationKind, model.nhdSourceSink->evaporationFile, 1);
  surface("Precipitation", model.nhdSourceSink->precipitationKind, model.nhdSourceSink->precipitationFile, 2);
  if (model.windConditions->hasFile()) {
    adviseOne(context, {{PageId::windConditions, {}, fmt::format("{}/WIND_CONDITIONS/File_Name", kFlow), {}},
                        model.windConditions->windFile.fileName,
                        model.windConditions->windFile.items});
  }
}

// What comes with the water, in the module that runs beside the flow.
template <class List>
void adviseCarried(AdviceContext& context, List& list, std::string_view module, std::string_view what) {
  constexpr std::int32_t kConstant = 0;
  constexpr std::string_view kEntry = List::kPlaceSection.substr(0, List::kPlaceSection.find('%'));
  for (int number = 1; number <= list.GetCount(); ++number) {
    const auto& carried = *list.GetItem(number);
    if (carried.format == kConstant) continue;
    const auto place = [&](std::string_view keyword) {
      return entryAt(std::remove_cvref_t<decltype(carried)>::kPage, what, number, list.GetCount(),
                     fmt::format("{}/{}/{}{}/{}", module, List::kSection, kEntry, number, keyword));
    };
    if constexpr (requires { carried.file.items; }) {
      adviseOne(context, {place("File_Name"), carried.file.fileName, carried.file.items});
    } else {
      adviseOne(context, {place("FILE_NAME"), carried.file, {}});
    }
  }
}

template <class Boundaries, class Sources>
void adviseModule(AdviceContext& context, Boundaries& boundaries, Sources& sources, std::string_view module) {
  adviseCarried(context, boundaries, module, "boundary");
  adviseCarried(context, sources, module, "source");
}

// The pages on which file names stand, by the beginning of their paths.
struct NamePage {
  std::string_view path;
  PageId page;
  std::string_view entry = {};  // of a list: its sections but for the number
  std::string_view thing = {};
  int (*count)(CGlobalKvs&) = nullptr;
};

template <auto list>
int countOfList(CGlobalKvs& model) {
  return (model.*list)->GetCount();
}
int countOfOutputs(CGlobalKvs& model) {
  return model.nhdResult->outputs.GetCount();
}
constexpr auto kAreas = countOfList<&CGlobalKvs::bathymetry>;
constexpr auto kBoundaries = countOfList<&CGlobalKvs::boundary>;
constexpr auto kSources = countOfList<&CGlobalKvs::sourceSink>;

constexpr NamePage kNamePages[] = {
    {"NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION", PageId::bathymetry, "AREA_", "area", kAreas},
    {"HYDRODYNAMIC_MODULE/OPEN_BOUNDARY", PageId::hdBoundary, "BOUNDARY_", "boundary", kBoundaries},
    {"HYDRODYNAMIC_MODULE/SOURCE_AND_SINK", PageId::hdSourceAndSink, "SOURCE_SINK_", "source", kSources},
    {"HYDRODYNAMIC_MODULE/INFILTRATION", PageId::infiltration},
    {"HYDRODYNAMIC_MODULE/WIND_CONDITIONS", PageId::windConditions},
    {"HYDRODYNAMIC_MODULE/EDDY_VISCOSITY", PageId::eddyViscosity, "AREA_", "area", kAreas},
    {"HYDRODYNAMIC_MODULE/WAVE_RADIATION", PageId::waveRadiation, "AREA_", "area", kAreas},
    {"HYDRODYNAMIC_MODULE/SURFACE_ELEVATION", PageId::surfaceElevation, "AREA_", "area", kAreas},
    {"HYDRODYNAMIC_MODULE/RESISTANCE", PageId::resistance, "AREA_", "area", kAreas},
    {"HYDRODYNAMIC_MODULE/WAVES", PageId::waves},
    {"HYDRODYNAMIC_MODULE/STRUCTURE_MODULE", PageId::weirs},
    {"HYDRODYNAMIC_MODULE/STRUCTURES/DIKES", PageId::dikes, "DIKE_", "dike",
     countOfList<&CGlobalKvs::nhdDike>},
    {"HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION", PageId::hdResult, "OUTPUT_AREA_", "output", countOfOutputs},
    {"ADVECTION_DISPERSION_MODULE/BOUNDARY_CONCENTRATIONS", PageId::adBoundary, "BOUNDARY_", "boundary",
     kBoundaries},
    {"ADVECTION_DISPERSION_MODULE/SOURCE_CONCENTRATIONS", PageId::adSourceSink, "SOURCE_SINK_", "source",
     kSources},
    {"ADVECTION_DISPERSION_MODULE", PageId::adResult},
    {"MUD_TRANSPORT_MODULE/BOUNDARY_CONCENTRATIONS", PageId::mtBoundary, "BOUNDARY_", "boundary",
     kBoundaries},
    {"MUD_TRANSPORT_MODULE/SOURCE_CONCENTRATIONS", PageId::mtSourceSink, "SOURCE_SINK_", "source", kSources},
    {"MUD_TRANSPORT_MODULE", PageId::mtResult},
    {"MUD_TRANSPORT_EXPANDED_MODULE", PageId::mtExpResult},
    {"BIO_RIG_MODULE", PageId::ecoResults},
};

AdvicePlace placeOfName(CGlobalKvs& model, const std::string& path) {
  const auto* row = std::ranges::find_if(kNamePages, [&](const NamePage& each) {
    return path.size() > each.path.size() && path.starts_with(each.path) && path[each.path.size()] == '/';
  });
  if (row == std::end(kNamePages)) return {PageId::none, {}, path, {}};
  AdvicePlace place{row->page, {}, path, {}};
  const std::string rest = path.substr(row->path.size() + 1);
  if (row->entry.empty() || !rest.starts_with(row->entry)) return place;
  place.item = std::atoi(rest.substr(row->entry.size()).c_str());
  place.thing = thingOf(row->thing, place.item);
  place.itemCount = row->count(model);
  return place;
}

bool isFileName(const Node& keyword) {
  if (keyword.values().size() != 1) return false;
  const ValueKind kind = keyword.values()[0].kind();
  return (kind == ValueKind::fileName || kind == ValueKind::resultFileName) &&
         !keyword.values()[0].text().empty();
}

// Where a name stands first, and how often besides.
struct NamedFile {
  std::string path;
  std::vector<std::string> further;
  bool isResult = false;
};

void adviseName(AdviceContext& context, const std::string& name, const NamedFile& named, std::string doubt,
                std::string reason, const std::string& better) {
  Advice advice{
      {}, fmt::format("{} {}", name, doubt), std::move(reason), placeOfName(context.model, named.path)};
  if (!named.further.empty())
    advice.doubt += fmt::format(" It is named {} more time{}.", named.further.size(),
                                named.further.size() == 1 ? "" : "s");
  if (!better.empty()) {
    advice.fix = AdviceFix{"Take " + better, {{named.path, better}}};
    for (const std::string& path : named.further) advice.fix->settings.push_back({path, better});
  }
  context.add(std::move(advice));
}

void eachIn(const Node& section, const std::string& path,
            const std::function<void(const std::string& path, const Node& keyword)>& tell) {
  std::map<std::string, int, std::less<>> seen;
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    const int occurrence = node->isSection() ? ++seen[std::string(node->name())] : 1;
    std::string here = path + (path.empty() ? "" : "/") + std::string(node->name());
    if (occurrence > 1) here += fmt::format("[{}]", occurrence);
    if (node->isSection()) {
      eachIn(*node, here, tell);
    } else {
      tell(here, *node);
    }
  }
}

}  // namespace

void eachKeyword(const KvsFile& file,
                 const std::function<void(const std::string& path, const Node& keyword)>& tell) {
  if (const KvsSection target = kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1); target != nullptr)
    eachIn(*target, {}, tell);
}

void adviseSeries(AdviceContext& context) {
  adviseFlow(context);
  CGlobalKvs& model = context.model;
  switch (model.moduleSelection->simulationType) {
    case module::kAdvectionDispersion:
      return adviseModule(context, *model.nadBoundary, *model.nadSourceSink, "ADVECTION_DISPERSION_MODULE");
    case module::kMudTransport:
      return adviseModule(context, *model.nmtBoundary, *model.nmtSourceSink, "MUD_TRANSPORT_MODULE");
    case module::kEcological:
      return adviseModule(context, *model.wqsAdBoundary, *model.wqsAdSourceSink,
                          "BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS");
    default:
      return;
  }
}

// A save names files from the setup's folder where it can, whatever the file on disk says.
void adviseFileNames(AdviceContext& context) {
  if (context.documentPath.empty()) return;
  const std::string folder = folderOfFile(context.documentPath);
  std::map<std::string, NamedFile> outside;
  std::map<std::string, NamedFile> absolute;
  const auto note = [](std::map<std::string, NamedFile>& files, const std::string& name,
                       const std::string& path, const Node& keyword) {
    NamedFile& file = files[name];
    file.isResult |= keyword.values()[0].kind() == ValueKind::resultFileName;
    if (file.path.empty()) {
      file.path = path;
    } else {
      file.further.push_back(path);
    }
  };
  if (const KvsFile* written = context.written()) {
    eachKeyword(*written, [&](const std::string& path, const Node& keyword) {
      if (!isFileName(keyword)) return;
      const std::string name(keyword.values()[0].text());
      if (name.starts_with('/') || name.starts_with("../")) note(outside, name, path, keyword);
    });
  }
  if (context.source != nullptr) {
    eachKeyword(*context.source, [&](const std::string& path, const Node& keyword) {
      if (!isFileName(keyword) || isOption(path)) return;
      const std::string name(keyword.values()[0].text());
      if (name.starts_with('/') && !outside.contains(name) && !pathOnFile(name, folder).starts_with("../"))
        note(absolute, name, path, keyword);
    });
  }
  for (const auto& [name, named] : outside) {
    // One of that name beside the setup is likely the one that is meant. A result would be written over it.
    const std::string plain = std::filesystem::path(name).filename().string();
    const bool isBeside = !named.isResult && !plain.empty() && isReadableFile(absolutePath(plain, folder));
    adviseName(context, name, named,
               name.starts_with('/') ? "is named absolutely, and lies outside of the setup's folder."
                                     : "lies outside of the setup's folder.",
               "When the folder is moved or sent, the file stays behind.", isBeside ? plain : std::string());
  }
  for (const auto& [name, named] : absolute) {
    adviseName(context, name, named, "is named absolutely.",
               "When the folder is moved or sent, the name leads nowhere.", pathOnFile(name, folder));
  }
}

void adviseOutputSize(AdviceContext& context) {
  if (context.documentPath.empty() || !context.freeMegabytes) return;
  // A count of what is written may count entries anew: the model is to stay as it is.
  CGlobalKvs copy;
  copy.AssignState(context.model);
  const double size = copy.nhdResult->TotalSizeMB();
  const std::optional<double> free = context.freeMegabytes(folderOfFile(context.documentPath));
  if (!free || !(size > *free)) return;
  AdvicePlace place{
      PageId::hdResult, {}, "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_1/Time_Step_interval", {}};
  Advice advice{{},
                fmt::format("The run writes {:.4g} MB; the disk has room for {:.4g} MB.", size, *free),
                "The run ends when the disk is full, and may spoil what it has written.",
                std::move(place)};
  // The outputs of the flow, less often.
  constexpr double kPart = 0.8;  // of the room
  const double others = size - copy.nhdResult->OutputSizeMB();
  const double times = std::ceil((size - others) / (*free * kPart - others));
  constexpr double kMostTimes = 1000;
  if (*free * kPart > others && times >= 2 && times <= kMostTimes) {
    advice.fix = AdviceFix{"Write less often", {}};
    for (int number = 1; number <= context.model.nhdResult->outputs.GetCount(); ++number) {
      const double interval =
          std::max(context.model.nhdResult->outputs.GetItem(number)->steps.interval, 1) * times;
      if (interval < 1e9)
        advice.fix->settings.push_back(
            {fmt::format("HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_{}/Time_Step_interval",
                         number),
             fmt::format("{:.0f}", interval)});
    }
    if (advice.fix->settings.empty()) advice.fix.reset();
  }
  context.add(std::move(advice));
}

}  // namespace gridbay
