#include "batch/check_setups.h"

#include <algorithm>
#include <filesystem>

#include "platform/side_by_side.h"

namespace gridbay {
namespace {

MemberReport checkFile(const std::string& file) {
  MemberReport report;
  CollectingMessageHost host;
  Result<SetupFile> setup = SetupFile::open(file, &host);
  report.notes = std::move(host.texts);
  if (setup)
    checkInto(report, *setup);
  else
    report.error = setup.error();
  return report;
}

}  // namespace

void checkInto(MemberReport& report, SetupFile& setup) {
  report.faults = setup.model().Validate(report.messages, 1);
}

Result<std::vector<MemberReport>> checkSetups(const std::vector<std::string>& files,
                                              const BatchWatch& watch) {
  std::vector<MemberReport> reports;
  for (const std::string& file : files) {
    MemberReport report;
    report.name = std::filesystem::path(file).stem().string();
    report.file = file;
    report.error = "\"" + file + "\" was not checked";
    reports.push_back(std::move(report));
  }
  std::size_t done = 0;
  bool isChecked = false;
  const auto check = [&](std::size_t first, std::size_t count) {
    return SideBySide{.count = count,
                      .work = [&](std::size_t i) { return packed(checkFile(files[first + i])); },
                      .took =
                          [&](std::size_t i, const std::optional<std::string>& text) {
                            isChecked = text.has_value();
                            if (text) unpack(*text, reports[first + i]);
                            watch.reached(++done);
                          },
                      .isStopped = watch.isStopped}
        .run();
  };
  const std::size_t alone = std::min<std::size_t>(files.size(), 1);
  Outcome ran = check(0, alone);
  // The look at the first one's data files serves the others that have the same, and is made again here: what
  // a copy of this process has come through does not bring down the batch.
  if (ran && isChecked && files.size() > 1 && !watch.isStopped()) static_cast<void>(checkFile(files.front()));
  if (ran) ran = check(alone, files.size() - alone);
  if (!ran) return Failure{ran.error()};
  if (done < files.size() && watch.isStopped()) return Failure{"Stopped"};
  return reports;
}

}  // namespace gridbay
