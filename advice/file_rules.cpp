// Doubts about what is read and written: names of files, the size of what is written.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <map>

#include "advice/fix_files.h"
#include "advice/rules.h"
#include "basic/bathymetry.h"
#include "basic/module_selection.h"
#include "hydrodynamic/result.h"
#include "platform/files/file_stamp.h"
#include "platform/files/paths.h"
#include "setup/page_places.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

bool isFileName(const Node& keyword) {
  if (keyword.values().size() != 1) return false;
  const ValueKind kind = keyword.values()[0].kind();
  return (kind == ValueKind::fileName || kind == ValueKind::resultFileName) &&
         !keyword.values()[0].text().empty();
}

// Where a name stands first, and how often besides.
struct NamedFile {
  PagePlace place;
  std::vector<std::string> further;  // their keywords
  bool isResult = false;
  bool isRead = false;
};

// A name that is to take the place of another one, with the file that is made for it.
struct BetterName {
  std::string fix;
  std::string name;
  std::vector<AdviceFile> files = {};
};

void adviseName(AdviceContext& context, const std::string& name, const NamedFile& named, std::string doubt,
                std::string reason, std::optional<BetterName> better) {
  Advice advice{{}, fmt::format("{} {}", name, doubt), std::move(reason), named.place};
  advice.place.value = name;
  if (!named.further.empty())
    advice.doubt += fmt::format(" It is named {} more time{}.", named.further.size(),
                                named.further.size() == 1 ? "" : "s");
  if (better) {
    advice.fix = AdviceFix{std::move(better->fix), {{named.place.keyword, better->name}}};
    for (const std::string& path : named.further) advice.fix->settings.push_back({path, better->name});
    advice.fix->files = std::move(better->files);
  }
  advice.todo = "Bring the file into the setup's folder, and choose it there.";
  context.add(std::move(advice));
}

// What a file outside of the setup's folder can be called in it. A result is written there from now on; a
// file that is read is copied, unless it is there already or can't be read where it is.
std::optional<BetterName> inFolder(AdviceContext& context, const std::string& folder, const std::string& name,
                                   bool isResult) {
  const std::string plain = std::filesystem::path(name).filename().string();
  if (plain.empty()) return std::nullopt;
  const std::string from = absolutePath(name, folder);
  if (isResult) {
    const std::string free = context.freeName(plain);
    return BetterName{fmt::format("Write {} in the setup's folder", free), free};
  }
  const std::string beside = absolutePath(plain, folder);
  const bool isThere = isReadableFile(from);
  if (isReadableFile(beside) && (!isThere || isSmallAndSame(from, beside)))
    return BetterName{"Take " + plain, plain};
  std::error_code error;
  const auto size = std::filesystem::file_size(from, error);
  if (!isThere || error) return std::nullopt;
  constexpr double kMegabyte = 1024.0 * 1024.0;
  const std::optional<double> room =
      context.freeMegabytes ? context.freeMegabytes(folder) : std::optional<double>();
  if (room && static_cast<double>(size) > *room * kMegabyte) return std::nullopt;
  const std::string free = context.freeName(plain);
  return BetterName{
      fmt::format("Copy {} into the setup's folder{}", plain, free == plain ? std::string() : " as " + free),
      free,
      {{from, absolutePath(free, folder)}}};
}

// What is written to one disk, by the folder that was asked for first.
struct Disk {
  std::string folder;
  double megabytes = 0;
  double ofFlow = 0;         // outputs of the flow
  std::vector<int> outputs;  // their numbers
};

// The folder, or what there is of it.
std::string existing(const std::string& folder) {
  std::filesystem::path at(folder);
  std::error_code error;
  while (at.has_relative_path() && !std::filesystem::exists(at, error)) at = at.parent_path();
  return at.string();
}

class Disks {
 public:
  Disk& of(const std::string& folder) {
    std::string at = existing(folder);
    const std::optional<FileStamp> stamp = fileStamp(at);
    Disk& disk = disks_[stamp ? stamp->device : -1];
    if (disk.folder.empty()) disk.folder = std::move(at);
    return disk;
  }
  const std::map<std::int64_t, Disk>& all() const { return disks_; }

 private:
  std::map<std::int64_t, Disk> disks_;
};

// The folder of the first result that a part of the setup names; that of the setup where there is none.
std::string folderOfResults(AdviceContext& context, std::string_view part) {
  const std::string own = folderOfFile(context.documentPath);
  std::string folder;
  if (const KvsFile* written = context.written()) {
    eachKeyword(*written, [&](const PagePlace& place, const Node& keyword) {
      if (!folder.empty() || !isFileName(keyword) || !place.keyword.starts_with(part) ||
          keyword.values()[0].kind() != ValueKind::resultFileName)
        return;
      folder = folderOfFile(absolutePath(keyword.values()[0].text(), own));
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

Disks disksOf(AdviceContext& context) {
  // A count of what is written may count entries anew: the model is to stay as it is.
  CGlobalKvs copy;
  copy.AssignState(context.model);
  Disks disks;
  const std::string own = folderOfFile(context.documentPath);
  const ModuleOutput module = copy.OutputOfModule();
  const double whole = copy.nhdResult->TotalSizeMB();
  double flow = 0;
  auto& outputs = context.model.nhdResult->outputs;
  for (int number = 1; number <= outputs.GetCount(); ++number) {
    const CNhdResultObjectKvs& output = *outputs.GetItem(number);
    copy.nhdResult->outputs.SetCount(1);
    copy.nhdResult->outputs.GetItem(1)->AssignState(output);
    const double size = copy.nhdResult->OutputSizeMB();
    Disk& disk = disks.of(output.file.empty() ? own : folderOfFile(output.file.absolute()));
    disk.megabytes += size;
    disk.ofFlow += size;
    disk.outputs.push_back(number);
    flow += size;
  }
  if (module.megabytes > 0)
    disks.of(folderOfResults(context, modulePart(copy))).megabytes += module.megabytes;
  // The hot start files of all modules.
  const double rest = whole - flow - module.megabytes;
  if (rest > 0)
    disks.of(folderOfResults(context, "HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/HOTSTART_FILES")).megabytes +=
        rest;
  return disks;
}

// The outputs of the flow on a disk, less often.
std::optional<AdviceFix> lessOften(AdviceContext& context, const Disk& disk, double room) {
  constexpr double kPart = 0.8;  // of the room
  constexpr double kMostTimes = 1000;
  constexpr double kMostSteps = 1e9;
  const double others = disk.megabytes - disk.ofFlow;
  const double times = std::ceil(disk.ofFlow / (room * kPart - others));
  if (!(room * kPart > others) || !(times >= 2) || times > kMostTimes) return std::nullopt;
  AdviceFix fix{"Write less often", {}};
  for (const int number : disk.outputs) {
    const double interval =
        std::max(context.model.nhdResult->outputs.GetItem(number)->steps.interval, 1) * times;
    if (interval < kMostSteps)
      fix.settings.push_back(
          {fmt::format("HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_{}/Time_Step_interval", number),
           fmt::format("{:.0f}", interval)});
  }
  return fix.settings.empty() ? std::nullopt : std::optional(std::move(fix));
}

}  // namespace

// A save names files from the setup's folder where it can, whatever the file on disk says.
void adviseFileNames(AdviceContext& context) {
  if (context.documentPath.empty()) return;
  const std::string folder = folderOfFile(context.documentPath);
  std::map<std::string, NamedFile> outside;
  std::map<std::string, NamedFile> absolute;
  const auto note = [](std::map<std::string, NamedFile>& files, const std::string& name,
                       const PagePlace& place, const Node& keyword) {
    NamedFile& file = files[name];
    const bool isResult = keyword.values()[0].kind() == ValueKind::resultFileName;
    (isResult ? file.isResult : file.isRead) = true;
    if (file.place.keyword.empty()) {
      file.place = place;
    } else {
      file.further.push_back(place.keyword);
    }
  };
  if (const KvsFile* written = context.written()) {
    eachKeyword(*written, [&](const PagePlace& place, const Node& keyword) {
      if (!isFileName(keyword)) return;
      const std::string name(keyword.values()[0].text());
      if (name.starts_with('/') || name.starts_with("../")) note(outside, name, place, keyword);
    });
  }
  if (context.source != nullptr) {
    eachKeyword(*context.source, [&](const PagePlace& place, const Node& keyword) {
      if (!isFileName(keyword) || isOption(place.keyword)) return;
      const std::string name(keyword.values()[0].text());
      if (name.starts_with('/') && !outside.contains(name) && !pathOnFile(name, folder).starts_with("../"))
        note(absolute, name, place, keyword);
    });
  }
  for (const auto& [name, named] : outside) {
    adviseName(
        context, name, named,
        name.starts_with('/') ? "is named absolutely, and lies outside of the setup's folder."
                              : "lies outside of the setup's folder.",
        "When the folder is moved or sent, the file stays behind.",
        // What is written by one part and read by another has to stay one file.
        named.isResult && named.isRead ? std::nullopt : inFolder(context, folder, name, named.isResult));
  }
  for (const auto& [name, named] : absolute) {
    adviseName(context, name, named, "is named absolutely.",
               "When the folder is moved or sent, the name leads nowhere.",
               BetterName{"Take " + pathOnFile(name, folder), pathOnFile(name, folder)});
  }
}

void adviseOutputSize(AdviceContext& context) {
  if (context.documentPath.empty() || !context.freeMegabytes) return;
  const Disks disks = disksOf(context);
  for (const auto& [device, disk] : disks.all()) {
    const std::optional<double> room = context.freeMegabytes(disk.folder);
    if (!room || !(disk.megabytes > *room)) continue;
    PagePlace place{.page = PageId::hdResult};
    if (!disk.outputs.empty())
      place = placeOfEntry(
          PageId::hdResult, "output", {disk.outputs.front(), context.model.nhdResult->outputs.GetCount()},
          fmt::format("HYDRODYNAMIC_MODULE/OUTPUT_SPECIFICATION/OUTPUT_AREA_{}/Time_Step_interval",
                      disk.outputs.front()));
    if (disk.outputs.size() != 1) place.thing.clear();
    context.add({{},
                 fmt::format("The run writes {:.4g} MB to {}; the disk has room for {:.4g} MB.",
                             disk.megabytes, disk.folder, *room),
                 "The run ends when the disk is full, and may spoil what it has written.",
                 std::move(place),
                 {},
                 lessOften(context, disk, *room),
                 "Write fewer outputs or hot start files, or let them go to a disk with more room."});
  }
}

}  // namespace gridbay
