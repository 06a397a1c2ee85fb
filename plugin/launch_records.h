#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "core/letters.h"

// Two plain records of the host's libraries, for the engine runs that it handles. The layout of their fields
// is the interface: text fields are 512 characters with the terminating zero. A longer text is cut behind the
// last whole letter that fits, and no text at all is an empty one.
//
// The plug-in libraries export the accessors, which is why each is kept as a function of its own.

namespace gridbay {

class CVdSimpleLaunch {
 public:
  [[gnu::used]] CVdSimpleLaunch() {}
  [[gnu::used]] std::int32_t GetExitCode() const { return exitCode_; }
  [[gnu::used]] void SetProcessID(std::uint32_t id) { processId_ = id; }
  [[gnu::used]] void SetEngine(const char* text) { copy(text, engine_); }
  [[gnu::used]] const char* GetEngine() const { return engine_.data(); }
  [[gnu::used]] void SetInput(const char* text) { copy(text, input_); }
  [[gnu::used]] const char* GetInput() const { return input_.data(); }
  [[gnu::used]] void SetOptions(const char* text) { copy(text, options_); }
  [[gnu::used]] void SetEMailAddress(const char* text) { copy(text, eMailAddress_); }
  [[gnu::used]] const char* GetEMailAddress() const { return eMailAddress_.data(); }
  [[gnu::used]] void SetSMSAddress(const std::string& text) { smsAddress_ = text; }
  [[gnu::used]] const std::string& GetSMSAddress() const { return smsAddress_; }
  [[gnu::used]] void SetRefreshInterval(std::uint32_t interval) { refreshInterval_ = interval; }
  [[gnu::used]] std::uint32_t GetRefreshInterval() const { return refreshInterval_; }
  [[gnu::used]] void SetCheckUseGPU(std::int32_t flag) { checkUseGpu_ = flag; }
  [[gnu::used]] void SetNoOfSubdomains(std::int32_t n) { noOfSubdomains_ = n; }
  [[gnu::used]] void SetUseGPUList(std::vector<std::int32_t> list) { gpuList_ = std::move(list); }

 private:
  using Field = std::array<char, 512>;

  static void copy(const char* text, Field& field) {
    const std::string_view given = text == nullptr ? std::string_view() : text;
    field[given.copy(field.data(), wholeLetters(given, field.size() - 1))] = '\0';
  }

  std::int32_t exitCode_ = 0;
  std::uint32_t processId_ = 0;
  Field engine_{};
  Field input_{};
  Field options_{};
  Field eMailAddress_{};
  std::string smsAddress_;
  std::uint32_t refreshInterval_ = 0;
  std::int32_t checkUseGpu_ = 0;
  std::int32_t noOfSubdomains_ = 0;
  std::vector<std::int32_t> gpuList_;
};

class CVdFileMonitor {
 public:
  [[gnu::used]] explicit CVdFileMonitor(std::string path = {}) : path_(std::move(path)) {}

  [[gnu::used]] const std::string& GetPath() const { return path_; }
  [[gnu::used]] bool IsActive() const { return active_; }

 private:
  std::string path_;
  bool active_ = false;
};

}  // namespace gridbay
