#pragma once

#include <string>
#include <vector>

#include "core/message.h"
#include "platform/result.h"

namespace gridbay {

// What a check of one of many setups has found.
struct MemberReport {
  std::string name;
  std::string file;
  std::string error;               // why the setup could not be made, or checked; empty where it was
  std::vector<std::string> notes;  // what the load had to say
  unsigned faults = 0;
  ValidationList messages;
  std::vector<std::string> results;  // the files that its engine makes, absolute; in no report

  bool isClean() const { return error.empty() && faults == 0; }
};

// The finding alone, with no name and file, as a text that another process takes it from.
std::string packed(const MemberReport& report);
void unpack(const std::string& text, MemberReport& report);

// A table with the columns member, file, faults (empty with an error) and messages, of which each has its
// page and severity; and the same with all its parts as JSON.
std::string reportAsCsv(const std::vector<MemberReport>& reports);
std::string reportAsJson(const std::vector<MemberReport>& reports);

}  // namespace gridbay
