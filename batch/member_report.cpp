#include "batch/member_report.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "batch/csv_table.h"

namespace gridbay {
namespace {

using Json = nlohmann::ordered_json;

Json messagesOf(const MemberReport& report) {
  Json messages = Json::array();
  for (const CMessage& message : report.messages) {
    messages.push_back({{"page", static_cast<int>(message.page)},
                        {"severity", static_cast<int>(message.severity)},
                        {"text", message.text}});
  }
  return messages;
}

}  // namespace

// Each part stands behind its size; its bytes need not be letters of any kind, which JSON asks for.
std::string packed(const MemberReport& report) {
  std::string text;
  const auto add = [&text](std::string_view part) { text += fmt::format("{}:{}", part.size(), part); };
  add(report.error);
  add(std::to_string(report.notes.size()));
  for (const std::string& note : report.notes) add(note);
  add(std::to_string(report.results.size()));
  for (const std::string& result : report.results) add(result);
  add(std::to_string(report.faults));
  for (const CMessage& message : report.messages) {
    add(std::to_string(static_cast<int>(message.page)));
    add(std::to_string(static_cast<int>(message.severity)));
    add(message.text);
  }
  return text;
}

void unpack(const std::string& text, MemberReport& report) {
  std::size_t at = 0;
  const auto next = [&] {
    const std::size_t colon = text.find(':', at);
    const std::size_t size = std::stoul(text.substr(at, colon - at));
    at = colon + 1 + size;
    return text.substr(colon + 1, size);
  };
  report.error = next();
  report.notes.resize(std::stoul(next()));
  for (std::string& note : report.notes) note = next();
  report.results.resize(std::stoul(next()));
  for (std::string& result : report.results) result = next();
  report.faults = static_cast<unsigned>(std::stoul(next()));
  report.messages.clear();
  while (at < text.size()) {
    const int page = std::stoi(next());
    const int severity = std::stoi(next());
    report.messages.push_back({static_cast<PageId>(page), next(), static_cast<Severity>(severity)});
  }
}

std::string reportAsCsv(const std::vector<MemberReport>& reports) {
  std::string text = csvLine({"member", "file", "faults", "messages"});
  for (const MemberReport& report : reports) {
    std::string messages = report.error;
    const auto add = [&messages](std::string_view message) {
      messages.append(messages.empty() ? "" : "; ").append(message);
    };
    for (const std::string& note : report.notes) add(note);
    for (const CMessage& message : report.messages) {
      add(fmt::format("page {}, severity {}: {}", static_cast<int>(message.page),
                      static_cast<int>(message.severity), message.text));
    }
    text += csvLine(
        {report.name, report.file, report.error.empty() ? std::to_string(report.faults) : "", messages});
  }
  return text;
}

std::string reportAsJson(const std::vector<MemberReport>& reports) {
  std::string text = "[";
  for (const MemberReport& report : reports) {
    Json entry{{"member", report.name}, {"file", report.file}};
    if (report.error.empty()) {
      entry["faults"] = report.faults;
      if (!report.notes.empty()) entry["notes"] = report.notes;
      entry["messages"] = messagesOf(report);
    } else {
      entry["error"] = report.error;
    }
    text += (text.size() == 1 ? "\n" : ",\n") + entry.dump(-1, ' ', false, Json::error_handler_t::replace);
  }
  return text + "\n]\n";
}

}  // namespace gridbay
