#include "batch/csv_table.h"

#include <csv.h>

#include <algorithm>
#include <memory>
#include <new>

#include "platform/files/read_file.h"

namespace gridbay {
namespace {

struct Reading {
  std::vector<CsvRow> rows;
  CsvRow row;
  std::size_t line = 1;  // that is being read
  bool isInRow = false;  // a row goes on from the line before
};

void takeCell(void* bytes, std::size_t size, void* data) {
  auto& reading = *static_cast<Reading*>(data);
  reading.row.cells.emplace_back(static_cast<const char*>(bytes), size);
}

void endRow(int, void* data) {
  auto& reading = *static_cast<Reading*>(data);
  if (!reading.row.cells.empty()) reading.rows.push_back(std::move(reading.row));
  reading.row = {};
  reading.isInRow = false;
}

char separatorOf(std::string_view firstLine) {
  for (const char separator : {',', ';', '\t'}) {
    if (firstLine.find(separator) != firstLine.npos) return separator;
  }
  return ',';
}

}  // namespace

Result<std::vector<CsvRow>> readCsv(const std::string& path) {
  const Result<FileText> text = readFile(path);
  if (!text) return Failure{text.error()};
  std::string_view rest = text->view();
  if (rest.starts_with("\xFF\xFE") || rest.starts_with("\xFE\xFF"))
    return Failure{"cannot read \"" + path + "\": it is in UTF-16; save it in UTF-8"};
  // Of one kind of line ends alone.
  std::string lines;
  if (rest.find('\n') == rest.npos) {
    lines = rest;
    std::ranges::replace(lines, '\r', '\n');
    rest = lines;
  }
  constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
  if (rest.starts_with(kByteOrderMark)) rest.remove_prefix(kByteOrderMark.size());

  csv_parser parser;
  if (csv_init(&parser, CSV_STRICT | CSV_STRICT_FINI) != 0) throw std::bad_alloc();
  const std::unique_ptr<csv_parser, void (*)(csv_parser*)> atEnd(&parser, csv_free);
  csv_set_delim(&parser, static_cast<unsigned char>(separatorOf(rest.substr(0, rest.find('\n')))));
  Reading reading;
  const auto fail = [&](std::string_view why) {
    return Failure{"cannot read \"" + path + "\": line " + std::to_string(reading.line) + ": " +
                   std::string(why)};
  };
  for (; !rest.empty(); ++reading.line) {
    const std::size_t size = std::min(rest.find('\n'), rest.size() - 1) + 1;
    if (!reading.isInRow) reading.row.line = reading.line;
    reading.isInRow = reading.isInRow || rest.substr(0, size).find_first_not_of(" \t\r\n") != rest.npos;
    if (csv_parse(&parser, rest.data(), size, takeCell, endRow, &reading) != size) {
      if (csv_error(&parser) != CSV_EPARSE) throw std::bad_alloc();
      return fail("a quote stands in a cell that is not quoted, or a text behind one that is");
    }
    rest.remove_prefix(size);
  }
  if (csv_fini(&parser, takeCell, endRow, &reading) != 0) {
    reading.line = reading.row.line;
    return fail("a quote is not closed");
  }
  return std::move(reading.rows);
}

std::string csvLine(const std::vector<std::string>& cells) {
  std::string line;
  for (const std::string& cell : cells) {
    if (!line.empty()) line += ',';
    std::string quoted(csv_write(nullptr, 0, cell.data(), cell.size()), '\0');
    csv_write(quoted.data(), quoted.size(), cell.data(), cell.size());
    line += quoted;
  }
  return line + '\n';
}

}  // namespace gridbay
