#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "core/date_time.h"
#include "core/message.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {

// What one item of a data file must be. A class may derive from it and add a check of its own.
class CVdRqTsbItem {
 public:
  virtual ~CVdRqTsbItem() = default;

  // The label of the request, as "Wind speed".
  void SetSelectionDescr(std::string_view text) { description_ = text; }
  // The quantity, or several of which any fits, by their item codes. The flag has no meaning here.
  void SetQunType(int code, int flag = 0);
  void SetMultiQunType(std::vector<int> codes) { types_ = std::move(codes); }
  // 0 for a time series, 1 for a profile, 2 for a map.
  void SetDimensions(int n) { dimensions_ = n; }
  // Spacing (metres) and number of points along axis 1 or 2.
  void SetInterval(int axis, double value) { intervals_[axis] = value; }
  void SetNoPoints(int axis, int n) { points_[axis] = n; }

  const std::string& description() const { return description_; }
  const std::vector<int>& types() const { return types_; }

  // The name of the index-th item of the file (from 1) that meets the request; false when there are fewer.
  bool GetNameOfValidItem(const TsbHeader& header, int index, std::string* out) const;

  // Whether the item chosen for this request meets it. `items` is the whole selection. What it lacks is told
  // in the buffer.
  virtual bool IsTsbFileValid(const TsbHeader& header, CValidationMessageBuffer& buffer,
                              std::span<const std::uint32_t> items) const;

  // What the item has that the request does not allow; empty when it meets the request.
  virtual std::string fault(const TsbHeader& header, int item) const;

 private:
  friend class CVdFileSelectorDlg;

  std::string description_;
  std::vector<int> types_;
  std::optional<int> dimensions_;
  std::map<int, double> intervals_;
  std::map<int, int> points_;
  std::size_t place_ = 0;  // in the selector's list, from 0
};

class CVdFileSelectorDlg;

// Where the user picks a file and its items; the desktop provides one.
class FileChooser {
 public:
  virtual ~FileChooser() = default;
  virtual bool choose(CVdFileSelectorDlg& selector) = 0;
};

// A request for a data file, stated once by the object concerned and used for two jobs: to let the user pick
// a file and its items, and to ask whether a given file meets it.
class CVdFileSelectorDlg {
 public:
  explicit CVdFileSelectorDlg(std::string_view kind = {}, std::string_view fileName = {},
                              std::string_view filter = {})
      : kind_(kind), fileName_(fileName), filter_(filter) {}
  CVdFileSelectorDlg(std::string_view kind, std::string_view fileName, std::string_view filter,
                     std::vector<std::uint32_t> selectedItems, int)
      : kind_(kind), fileName_(fileName), filter_(filter), selectedItems_(std::move(selectedItems)) {}

  CVdFileSelectorDlg(CVdFileSelectorDlg&&) = default;
  CVdFileSelectorDlg& operator=(CVdFileSelectorDlg&&) = default;
  virtual ~CVdFileSelectorDlg() = default;

  CVdRqTsbItem& AddRequest();
  CVdRqTsbItem& AddRequest(std::unique_ptr<CVdRqTsbItem> request);
  void AddRequestItemType(int code);
  // The file, or the selection where one is given, must have that many items, or at least so many.
  void SetNoItems(int n) { noItems_ = n; }
  void SetMinNoItems(int n) { minNoItems_ = n; }
  // The dimension of item `index` (from 1); spacing (metres) and points along axis 1 or 2, of all items.
  void SetItemDim(int index, int dimension) { itemDims_[index] = dimension; }
  void SetItemInterval(int axis, double value) { common_.SetInterval(axis, value); }
  void SetItemNoPoints(int axis, int n) { common_.SetNoPoints(axis, n); }
  void SetDimensions(int n) { common_.SetDimensions(n); }
  void SetInterval(int axis, double value) { SetItemInterval(axis, value); }
  void SetNoPoints(int axis, int n) { SetItemNoPoints(axis, n); }
  void SetDataType(int type) { dataType_ = type; }
  void SetNoTimeStep(int n) { noTimeSteps_ = n; }
  void SetTimeAxisType(int type) { timeAxisType_ = type; }
  void SetTimeAxisQunUnitEquivalentWith(int unitCode) { timeAxisUnit_ = unitCode; }
  void SetRequestPeriod(const DateTime& start, const DateTime& end);
  bool requestsPeriod() const { return periodStart_.has_value(); }
  // A file with one time step, which holds throughout, need not cover that period.
  void AllowOneTimeStep() { oneStepAllowed_ = true; }
  // The file must be one that the engine takes as it is: lengths in metres, values in base units.
  void SetVane27Compliant() { compliant_ = true; }
  void EnablePlugin(int flag) { pluginEnabled_ = flag != 0; }
  void SetSelectedItems(std::vector<std::uint32_t> items) { selectedItems_ = std::move(items); }
  void SetFileName(std::string_view fileName) { fileName_ = fileName; }

  // Lets the user choose; 1 when he accepted. Without a chooser nobody accepts.
  void SetChooser(FileChooser* chooser) { chooser_ = chooser; }
  int DoModal();

  const std::string& kind() const { return kind_; }
  const std::string& filter() const { return filter_; }
  const std::string& fileName() const { return fileName_; }
  bool pluginEnabled() const { return pluginEnabled_; }
  const std::vector<std::unique_ptr<CVdRqTsbItem>>& requests() const { return requests_; }
  const std::vector<std::uint32_t>& GetSelectedItems() const { return selectedItems_; }
  // The name of item n (from 1) in the current file; empty when there is none.
  virtual std::string GetNameOfItem(int n) const;

  // Whether a file, or the items chosen in it, meets all requests; if not the text says which one, what was
  // expected and what the file has.
  virtual bool IsTsbFileValid(const std::string& file, std::string* errorText) const;
  virtual bool IsTsbFileValid(const std::string& file, std::span<const std::uint32_t> items,
                              std::string* errorText) const;
  // The same for a file that is open, with all of its items.
  bool IsTsbFileValid(const TsbHeader& header, std::string* errorText) const;

 private:
  std::string faultOf(const TsbHeader& header, std::span<const std::uint32_t> items, bool chosen) const;
  std::string itemsFault(const TsbHeader& header, std::span<const std::uint32_t> items, bool chosen) const;
  std::string timeFault(const TsbTimeAxis& time) const;
  std::string periodFault(const TsbTimeAxis& time) const;
  std::string complianceFault(const TsbHeader& header, std::span<const std::uint32_t> items) const;

  std::string kind_;
  std::string fileName_;
  std::string filter_;
  std::vector<std::uint32_t> selectedItems_;
  std::vector<std::unique_ptr<CVdRqTsbItem>> requests_;
  CVdRqTsbItem common_;
  std::map<int, int> itemDims_;
  std::optional<int> noItems_;
  std::optional<int> minNoItems_;
  std::optional<int> dataType_;
  std::optional<int> noTimeSteps_;
  std::optional<int> timeAxisType_;
  std::optional<int> timeAxisUnit_;
  std::optional<DateTime> periodStart_;
  std::optional<DateTime> periodEnd_;
  bool oneStepAllowed_ = false;
  bool compliant_ = false;
  bool pluginEnabled_ = true;
  FileChooser* chooser_ = nullptr;
};

}  // namespace gridbay
