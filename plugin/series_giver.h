#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "pages/no_host.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {

// Answers who asks for a file: with a time series, where it is one that is asked for.
class SeriesGiver final : public NoHost {
 public:
  explicit SeriesGiver(std::string file);

  // The items that are to be taken; none for whichever fit.
  void wish(std::vector<std::uint32_t> items) { wished_ = std::move(items); }
  bool isReadable() const { return isReadable_; }

  // One way of taking the series.
  struct Way {
    std::vector<std::uint32_t> items = {};
    std::string item = {};
    std::string doubt = {};
  };
  // What the last button has led to: the ways, or what was asked for in place of them.
  void forget();
  const std::vector<Way>& ways() const { return ways_; }
  const std::string& refused() const { return refused_; }
  // Whether any time series was asked for.
  bool isAsked() const { return !ways_.empty() || !refused_.empty(); }

  bool choose(CVdFileSelectorDlg& selector) override;

 private:
  std::vector<std::uint32_t> itemsFor(const CVdRqTsbItem& request) const;
  std::string nameOf(std::uint32_t item) { return tsbItemD(header_, static_cast<int>(item))->name; }
  void findWays(const CVdFileSelectorDlg& selector);

  std::string file_;
  TsbHeader header_;
  bool isReadable_ = false;
  std::vector<std::uint32_t> wished_;
  std::vector<Way> ways_;
  std::string refused_;
};

}  // namespace gridbay
