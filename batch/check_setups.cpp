#include "batch/check_setups.h"

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
  // The look at the first one's data files serves the others that have the same.
  if (files.size() > 1) static_cast<void>(checkFile(files.front()));
  std::size_t done = 0;
  const Outcome ran = SideBySide{.count = files.size(),
                                 .work = [&](std::size_t i) { return packed(checkFile(files[i])); },
                                 .took =
                                     [&](std::size_t i, const std::optional<std::string>& text) {
                                       if (text) unpack(*text, reports[i]);
                                       watch.reached(++done);
                                     },
                                 .isStopped = watch.isStopped}
                          .run();
  if (!ran) return Failure{ran.error()};
  if (done < files.size() && watch.isStopped()) return Failure{"Stopped"};
  return reports;
}

}  // namespace gridbay
