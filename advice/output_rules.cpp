// Doubts about the size of what is written.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <map>

#include "advice/rules.h"
#include "advice/run_steps.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "core/letters.h"
#include "ecology/results.h"
#include "hydrodynamic/result.h"
#include "mud_transport_expanded/result.h"
#include "platform/files/file_stamp.h"
#include "platform/files/paths.h"
#include "setup/member_keyword.h"
#include "setup/page_places.h"
#include "setup/setting.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

constexpr std::string_view kFlow = "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/";

// What is written to one disk (MB), by the folder that was asked for first.
struct Disk {
  std::string folder;
  double flow = 0;
  double module = 0;
  double hotStarts = 0;
  std::vector<int> outputs;  // of the flow, their numbers

  double total() const { return flow + module + hotStarts; }
};

// The folder, or what there is of it.
std::string existing(const std::string& folder) {
  std::filesystem::path at(folder);
  std::error_code error;
  while (at.has_relative_path() && !std::filesystem::exists(at, error)) at = at.parent_path();
  return at.string();
}

using Device = std::int64_t;

class Disks {
 public:
  Disk& of(const std::string& folder) {
    std::string at = existing(folder);
    const std::optional<FileStamp> stamp = fileStamp(at);
    Disk& disk = disks_[stamp ? stamp->device : -1];
    if (disk.folder.empty()) disk.folder = std::move(at);
    return disk;
  }
  const std::map<Device, Disk>& all() const { return disks_; }

 private:
  std::map<Device, Disk> disks_;
};

// The folder of the first result that a part of the setup names; that of the setup where there is none.
std::string folderOfResults(AdviceContext& context, std::string_view part) {
  const std::string own = folderOfFile(context.documentPath);
  std::string folder;
  if (const KvsFile* written = context.written()) {
    eachKeyword(*written, [&](const PagePlace& place, const Node& keyword) {
      if (!folder.empty() || !place.keyword.starts_with(part) || keyword.values().size() != 1) return;
      const Value& value = keyword.values()[0];
      if (value.kind() == ValueKind::resultFileName && !value.text().empty())
        folder = folderOfFile(absolutePath(value.text(), own));
    });
  }
  return folder.empty() ? own : folder;
}

// The part of the setup of the module that runs beside the flow.
std::string_view modulePart(const CGlobalKvs& model) {
  switch (model.moduleSelection->simulationType) {
    case module::kAdvectionDispersion:
      return "ADVECTION_DISPERSION_MODULE/";
    case module::kMudTransport:
      return "MUD_TRANSPORT_MODULE/";
    case module::kMudTransportExpanded:
      return "MUD_TRANSPORT_EXPANDED_MODULE/";
    default:
      return "BIO_RIG_MODULE/";
  }
}

// The hot start files of a module that the total on the page of results leaves out (MB).
double furtherHotStarts(CGlobalKvs& model) {
  if (!model.nhdResult->generateHotStart) return 0;
  switch (model.moduleSelection->simulationType) {
    case module::kMudTransportExpanded:
      return model.nmtExpResult->HotStartSizeMB();
    case module::kEcological:
      return model.wqsResults->HotStartSizeMB();
    default:
      return 0;
  }
}

// A count of what is written may count entries anew, and each output is counted by itself: the model is not
// as it was then.
Disks disksOf(AdviceContext& context, CGlobalKvs& model) {
  Disks disks;
  const std::string own = folderOfFile(context.documentPath);
  const double module = model.OutputOfModule().megabytes;
  const double rest =
      model.nhdResult->TotalSizeMB() - model.nhdResult->OutputSizeMB() - module + furtherHotStarts(model);
  auto& outputs = model.nhdResult->outputs;
  CGlobalKvs one;
  one.AssignState(model);
  one.nhdResult->outputs.SetCount(1);
  for (int number = 1; number <= outputs.GetCount(); ++number) {
    const CNhdResultObjectKvs& output = *outputs.GetItem(number);
    one.nhdResult->outputs.GetItem(1)->AssignState(output);
    Disk& disk = disks.of(output.file.empty() ? own : folderOfFile(output.file.absolute()));
    disk.flow += one.nhdResult->OutputSizeMB();
    disk.outputs.push_back(number);
  }
  if (module > 0) disks.of(folderOfResults(context, modulePart(model))).module += module;
  constexpr double kRounding = 1e-6;
  if (rest > kRounding)
    disks.of(folderOfResults(context, fmt::format("{}HOTSTART_FILES", kFlow))).hotStarts += rest;
  return disks;
}

// A range with an interval, as an output has them in time and along x and y.
struct Range {
  std::string keyword;  // of the interval, or of all three
  long long first = 0, last = 0, interval = 1;
};

// An output of the flow or of the module beside it.
struct Output {
  bool isOfFlow = false;
  std::string path;
  std::string firstStep = {};  // its keyword
  Range steps = {};
  std::vector<Range> sides = {};  // none of points
};

// Those that go to a disk. What the module writes goes to one.
std::vector<Output> outputsTo(AdviceContext& context, const Disk& disk) {
  const std::string_view module = modulePart(context.model);
  std::vector<Output> outputs;
  const KvsFile* written = context.written();
  if (written == nullptr) return outputs;
  eachKeyword(*written, [&](const PagePlace& place, const Node& keyword) {
    const bool isOfFlow = place.keyword.starts_with(kFlow);
    if (place.keyword.find("/OUTPUT_AREA_") == std::string::npos ||
        !(isOfFlow || (disk.module > 0 && place.keyword.starts_with(module))))
      return;
    std::string path = place.keyword.substr(0, place.keyword.rfind('/'));
    const auto isThis = [&](int number) { return path == fmt::format("{}OUTPUT_AREA_{}", kFlow, number); };
    if (isOfFlow && std::ranges::none_of(disk.outputs, isThis)) return;
    if (outputs.empty() || outputs.back().path != path) outputs.push_back({isOfFlow, std::move(path)});
    Output& output = outputs.back();
    std::vector<long long> numbers;
    for (const Value& value : keyword.values()) {
      if (value.kind() == ValueKind::integer) numbers.push_back(wholeOf(value));
    }
    const auto isNamed = [&](std::string_view name, std::size_t count) {
      return sameName(name, keyword.name()) && numbers.size() == count;
    };
    if (isNamed("First_Time_Step", 1)) {
      output.firstStep = place.keyword;
      output.steps.first = numbers[0];
    } else if (isNamed("Last_Time_Step", 1)) {
      output.steps.last = numbers[0];
    } else if (isNamed("Time_Step_Interval", 1)) {
      output.steps.keyword = place.keyword;
      output.steps.interval = std::max(numbers[0], 1LL);
    } else if (isNamed("X_Range_And_Interval", 3) || isNamed("Y_Range_And_Interval", 3)) {
      output.sides.push_back({place.keyword, numbers[0], numbers[1], std::max(numbers[2], 1LL)});
    }
  });
  return outputs;
}

// An interval that is so many times longer, and lies in the range.
long long longer(const Range& range, double times) {
  const double most = std::max(static_cast<double>(range.last - range.first), 1.0);
  return std::max(range.interval,
                  static_cast<long long>(std::min(static_cast<double>(range.interval) * times, most)));
}

class LessWriting {
 public:
  LessWriting(AdviceContext& context, Device device, const Disk& disk, double room)
      : context_(context), device_(device), disk_(disk), room_(room), outputs_(outputsTo(context, disk)) {}

  // The first of ever more that leaves what has room; nothing where the setup takes none of them.
  std::optional<AdviceFix> fix() const {
    for (const auto way : {&LessWriting::flowLessOften, &LessWriting::allLessOften, &LessWriting::noHotStarts,
                           &LessWriting::lastSteps}) {
      if (const std::optional<AdviceFix> found = (this->*way)(); found && fits(*found)) return found;
    }
    constexpr double kMostTimes = 1 << 16;
    for (double times = 2; times <= kMostTimes; times *= 2) {
      if (AdviceFix found = fewerPoints(times); fits(found)) return found;
    }
    const int outputs = context_.model.nhdResult->outputs.GetCount();
    // Those that go elsewhere stay.
    if (!disk_.outputs.empty() && std::ssize(disk_.outputs) < outputs) return lastOut();
    AdviceFix none = nothing();
    return fits(none) ? std::optional(std::move(none)) : std::nullopt;
  }

 private:
  // How many times less is to be written of a size; nothing where that is too much.
  std::optional<double> timesLess(double size, double others) const {
    constexpr double kPart = 0.8;  // of the room
    const double left = room_ * kPart - others;
    if (!(left > 0) || !(size > 0)) return std::nullopt;
    return std::max(std::ceil(size / left), 1.0);
  }
  void writeLessOften(AdviceFix& fix, double times, bool isFlowAlone) const {
    for (const Output& output : outputs_) {
      if (isFlowAlone && !output.isOfFlow) continue;
      const long long interval = longer(output.steps, times);
      if (interval != output.steps.interval && !output.steps.keyword.empty())
        fix.settings.push_back({output.steps.keyword, std::to_string(interval)});
    }
  }
  std::optional<AdviceFix> flowLessOften() const {
    const std::optional<double> times = timesLess(disk_.flow, disk_.total() - disk_.flow);
    if (!times) return std::nullopt;
    AdviceFix fix{"Write less often"};
    writeLessOften(fix, *times, true);
    return fix;
  }
  std::optional<AdviceFix> allLessOften() const {
    const std::optional<double> times = timesLess(disk_.flow + disk_.module, disk_.hotStarts);
    if (!times) return std::nullopt;
    AdviceFix fix{disk_.flow > 0 ? "Write less often, the flow and the module"
                                 : "Write the module less often"};
    writeLessOften(fix, *times, false);
    return fix;
  }
  std::optional<AdviceFix> noHotStarts() const {
    if (disk_.hotStarts == 0) return std::nullopt;
    AdviceFix fix{"Write no hot start files"};
    addNoHotStarts(fix);
    if (const std::optional<double> times = timesLess(disk_.flow + disk_.module, 0); times && *times > 1) {
      fix.name += ", and outputs less often";
      writeLessOften(fix, *times, false);
    }
    return fix;
  }
  std::optional<AdviceFix> lastSteps() const {
    AdviceFix fix{"Write the last time step alone" + withoutHotStarts()};
    addLastSteps(fix);
    return fix;
  }
  AdviceFix fewerPoints(double times) const {
    AdviceFix fix{"Write the last time step alone, at fewer points" + withoutHotStarts()};
    addLastSteps(fix);
    for (const Output& output : outputs_) {
      for (const Range& side : output.sides)
        fix.settings.push_back(
            {side.keyword, fmt::format("{},{},{}", side.first, side.last, longer(side, times))});
    }
    return fix;
  }
  // One by one.
  AdviceFix lastOut() const {
    const int number = disk_.outputs.back();
    AdviceFix fix{fmt::format("Output {} out", number)};
    fix.removal = AdviceRemoval{AdviceRemoval::List::output, number};
    return fix;
  }
  // Of a disk that is full.
  AdviceFix nothing() const {
    AdviceFix fix{"Write no outputs" + withoutHotStarts()};
    if (!disk_.outputs.empty()) fix.settings.push_back({fmt::format("{}Number_Of_Output_areas", kFlow), "0"});
    if (const auto ofModule = std::ranges::find(outputs_, false, &Output::isOfFlow);
        ofModule != outputs_.end())
      fix.settings.push_back(
          {ofModule->path.substr(0, ofModule->path.rfind('/')) + "/Number_Of_Output_areas", "0"});
    addNoHotStarts(fix);
    return fix;
  }

  std::string withoutHotStarts() const { return disk_.hotStarts > 0 ? ", and no hot start files" : ""; }
  void addLastSteps(AdviceFix& fix) const {
    for (const Output& output : outputs_) {
      fix.settings.push_back({output.firstStep, std::to_string(output.steps.last)});
      fix.settings.push_back({output.steps.keyword, "1"});
    }
    addNoHotStarts(fix);
  }
  void addNoHotStarts(AdviceFix& fix) const {
    if (disk_.hotStarts == 0) return;
    const std::string_view module = modulePart(context_.model);
    eachKeyword(*context_.written(), [&](const PagePlace& place, const Node& keyword) {
      if (!sameName("Generate_Hotstart", keyword.name()) ||
          !(place.keyword.starts_with(kFlow) || place.keyword.starts_with(module)))
        return;
      // As the model holds it: a module writes that it makes none where the flow makes none.
      const Result<MemberKeyword> held = findKeyword(context_.model, place.keyword, context_.documentPath);
      if (held && shownValues(held->node()) != "false") fix.settings.push_back({place.keyword, "false"});
    });
  }

  bool fits(const AdviceFix& fix) const {
    CGlobalKvs model;
    model.AssignState(context_.model);
    for (const Setting& setting : fix.settings) {
      if (!applySetting(model, setting, context_.documentPath)) return false;
    }
    const Disks disks = disksOf(context_, model);
    const auto disk = disks.all().find(device_);
    return disk == disks.all().end() || disk->second.total() <= room_;
  }

  AdviceContext& context_;
  Device device_;
  const Disk& disk_;
  double room_;
  std::vector<Output> outputs_;
};

}  // namespace

void adviseOutputSize(AdviceContext& context) {
  if (context.documentPath.empty() || !context.freeMegabytes) return;
  CGlobalKvs copy;
  copy.AssignState(context.model);
  const Disks disks = disksOf(context, copy);
  for (const auto& [device, disk] : disks.all()) {
    const std::optional<double> room = context.freeMegabytes(disk.folder);
    if (!room || !(disk.total() > *room)) continue;
    PagePlace place{.page = PageId::hdResult};
    if (!disk.outputs.empty())
      place = placeOfEntry(PageId::hdResult, "output",
                           {disk.outputs.front(), context.model.nhdResult->outputs.GetCount()},
                           fmt::format("{}OUTPUT_AREA_{}/Time_Step_interval", kFlow, disk.outputs.front()));
    if (disk.outputs.size() != 1) place.thing.clear();
    std::optional<AdviceFix> fix = LessWriting(context, device, disk, *room).fix();
    if (!fix) continue;  // of a setup that can't be written, which a save tells
    context.add({{},
                 fmt::format("The run writes {:.4g} MB to {}; the disk has room for {:.4g} MB.", disk.total(),
                             disk.folder, *room),
                 "The run ends when the disk is full, and may spoil what it has written.",
                 std::move(place),
                 {},
                 std::move(*fix)});
  }
}

}  // namespace gridbay
