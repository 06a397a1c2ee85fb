#include "shell/import/table_preview.h"

#include <QApplication>
#include <QPalette>

#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr std::size_t kFirstLines = 200;
constexpr std::size_t kMostColumns = 500;

}  // namespace

void TablePreview::show(std::string_view text, const TableForm& form) {
  beginResetModel();
  form_ = form;
  first_.clear();
  faults_.clear();
  for (std::size_t number = 1; !text.empty() && number <= kFirstLines; ++number) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    first_.push_back({number, std::string(text.substr(0, end))});
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  lines_ = first_;
  measure();
  endResetModel();
}

void TablePreview::showFaults(const std::vector<TableFault>& faults) {
  beginResetModel();
  faults_.clear();
  lines_ = first_;
  for (const TableFault& fault : faults) {
    faults_[fault.line] = fault.why;
    if (fault.line > first_.size()) lines_.push_back({fault.line, fault.text});
  }
  measure();
  endResetModel();
}

void TablePreview::measure() {
  std::size_t most = form_.columns.size();
  for (const Line& line : lines_) most = std::max(most, tableFields(line.text, form_.separator).size());
  columns_ = static_cast<int>(std::min(most, kMostColumns));
}

QString TablePreview::faultOf(int row) const {
  const auto fault = faults_.find(lines_[static_cast<std::size_t>(row)].number);
  return fault == faults_.end() ? QString() : QString::fromStdString(fault->second);
}

int TablePreview::rowCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : static_cast<int>(lines_.size());
}

int TablePreview::columnCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : columns_;
}

QVariant TablePreview::data(const QModelIndex& index, int role) const {
  const Line& line = lines_[static_cast<std::size_t>(index.row())];
  const auto column = static_cast<std::size_t>(index.column());
  const QPalette palette = QApplication::palette();
  if (role == Qt::DisplayRole) {
    const std::vector<std::string_view> fields = tableFields(line.text, form_.separator);
    return column < fields.size()
               ? QString::fromUtf8(fields[column].data(), static_cast<int>(fields[column].size()))
               : QString();
  }
  if (role == Qt::ToolTipRole || role == Qt::AccessibleDescriptionRole) return faultOf(index.row());
  if (role != Qt::ForegroundRole) return {};
  if (!faultOf(index.row()).isEmpty()) return faultColour(palette);
  const bool isLeftOut =
      column < form_.columns.size() && form_.columns[column].role == TableColumn::Role::leftOut;
  const bool isHeading = line.number <= static_cast<std::size_t>(form_.headerLines);
  return isLeftOut || isHeading ? quietText(palette) : palette.color(QPalette::Text);
}

QVariant TablePreview::headerData(int section, Qt::Orientation orientation, int role) const {
  const auto place = static_cast<std::size_t>(section);
  if (orientation == Qt::Vertical) {
    if (role == Qt::ToolTipRole) return faultOf(section);
    return role == Qt::DisplayRole ? QVariant(static_cast<qulonglong>(lines_[place].number)) : QVariant();
  }
  if (role != Qt::DisplayRole) return {};
  return place < form_.columns.size() ? QString::fromStdString(form_.columns[place].name) : QString();
}

}  // namespace gridbay::shell
