#pragma once

#include <array>
#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

// Two plain records of the host's libraries, for the engine runs that it handles. The layout of their fields
// is the interface: text fields are 512 characters with the terminating zero.

namespace gridbay {

class CVdSimpleLaunch {
 public:
  std::int32_t GetExitCode() const { return exitCode_; }
  void SetProcessID(std::uint32_t id) { processId_ = id; }
  void SetEngine(const char* text) { std::strcpy(engine_.data(), text); }
  const char* GetEngine() const { return engine_.data(); }
  void SetInput(const char* text) { std::strcpy(input_.data(), text); }
  const char* GetInput() const { return input_.data(); }
  void SetOptions(const char* text) { std::strcpy(options_.data(), text); }
  void SetEMailAddress(const char* text) { std::strcpy(eMailAddress_.data(), text); }
  const char* GetEMailAddress() const { return eMailAddress_.data(); }
  void SetSMSAddress(const std::string& text) { smsAddress_ = text; }
  const std::string& GetSMSAddress() const { return smsAddress_; }
  void SetRefreshInterval(std::uint32_t interval) { refreshInterval_ = interval; }
  std::uint32_t GetRefreshInterval() const { return refreshInterval_; }
  void SetCheckUseGPU(std::int32_t flag) { checkUseGpu_ = flag; }
  void SetNoOfSubdomains(std::int32_t n) { noOfSubdomains_ = n; }
  void SetUseGPUList(std::vector<std::int32_t> list) { gpuList_ = std::move(list); }

 private:
  using Field = std::array<char, 512>;

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
  explicit CVdFileMonitor(std::string path = {}) : path_(std::move(path)) {}

  const std::string& GetPath() const { return path_; }
  bool IsActive() const { return active_; }

 private:
  std::string path_;
  bool active_ = false;
};

}  // namespace gridbay
