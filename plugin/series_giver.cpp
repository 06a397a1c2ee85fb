#include "plugin/series_giver.h"

#include <algorithm>

namespace gridbay {
namespace {

constexpr std::string_view kSeries = "tsb0";

}  // namespace

SeriesGiver::SeriesGiver(std::string file) : file_(std::move(file)) {
  isReadable_ = tsbFileRead(file_, &header_) == 0;
}

void SeriesGiver::forget() {
  ways_.clear();
  refused_.clear();
}

bool SeriesGiver::choose(CVdFileSelectorDlg& selector) {
  // Some name no extension of their own.
  const bool isOfSeries = selector.kind() == kSeries || selector.filter().find(kSeries) != std::string::npos;
  if (!isReadable_ || !isOfSeries) return false;
  findWays(selector);
  if (ways_.empty()) return false;
  selector.SetFileName(file_);
  if (!selector.GetSelectedItems().empty())
    selector.SetSelectedItems(wished_.empty() ? ways_.front().items : wished_);
  return true;
}

std::vector<std::uint32_t> SeriesGiver::itemsFor(const CVdRqTsbItem& request) const {
  std::vector<std::uint32_t> fitting;
  for (int number = 1; number <= tsbGetNoOfItems(header_); ++number) {
    if (request.fault(header_, number).empty()) fitting.push_back(static_cast<std::uint32_t>(number));
  }
  return fitting;
}

void SeriesGiver::findWays(const CVdFileSelectorDlg& selector) {
  std::vector<std::vector<std::uint32_t>> fitting;
  for (const auto& request : selector.requests()) {
    fitting.push_back(itemsFor(*request));
    if (!fitting.back().empty()) continue;
    refused_ = request->description();
    return;
  }
  const std::size_t chosen = selector.GetSelectedItems().size();
  std::string why;
  if (chosen == 0 || fitting.empty()) {
    selector.IsTsbFileValid(file_, &why);
    ways_.push_back({std::vector<std::uint32_t>(chosen, 1), {}, why});
    return;
  }
  // Where one item is asked for each that fits will do.
  const std::size_t count = fitting.size() == 1 ? fitting.front().size() : 1;
  for (std::size_t n = 0; n < count; ++n) {
    Way way{.items = selector.GetSelectedItems()};
    for (std::size_t i = 0; i < std::min(chosen, fitting.size()); ++i)
      way.items[i] = fitting[i][i == 0 ? n : std::min(i, fitting[i].size() - 1)];
    if (fitting.size() == 1) way.item = nameOf(way.items.front());
    why.clear();
    if (!selector.IsTsbFileValid(file_, way.items, &why)) way.doubt = why;
    ways_.push_back(std::move(way));
  }
}

}  // namespace gridbay
