#include "platform/tsb/netcdf_attributes.h"

#include <netcdf.h>

#include <algorithm>
#include <cmath>

namespace gridbay {
namespace {

constexpr std::size_t kLongestText = 1 << 20;

}  // namespace

std::optional<std::string> textAttribute(int file, int variable, const char* name) {
  nc_type type = NC_NAT;
  std::size_t length = 0;
  if (nc_inq_att(file, variable, name, &type, &length) != NC_NOERR || length > kLongestText)
    return std::nullopt;
  if (type == NC_STRING && length == 1) {
    char* text = nullptr;
    if (nc_get_att_string(file, variable, name, &text) != NC_NOERR || text == nullptr) return std::nullopt;
    std::string copy(text);
    nc_free_string(1, &text);
    return copy;
  }
  if (type != NC_CHAR) return std::nullopt;
  std::string text(length, '\0');
  if (nc_get_att_text(file, variable, name, text.data()) != NC_NOERR) return std::nullopt;
  text.resize(std::min(text.find('\0'), text.size()));
  return text;
}

std::optional<double> numberAttribute(int file, int variable, const char* name) {
  nc_type type = NC_NAT;
  std::size_t length = 0;
  double number = 0;
  if (nc_inq_att(file, variable, name, &type, &length) != NC_NOERR || length != 1) return std::nullopt;
  if (type == NC_CHAR || type == NC_STRING || nc_get_att_double(file, variable, name, &number) != NC_NOERR) {
    return std::nullopt;
  }
  return number;
}

std::optional<int> integerAttribute(int file, int variable, const char* name) {
  const std::optional<double> number = numberAttribute(file, variable, name);
  if (!number || !(std::abs(*number) < 1e9)) return std::nullopt;
  return static_cast<int>(*number);
}

std::optional<std::vector<std::size_t>> shapeOf(int file, int variable) {
  int rank = 0;
  if (nc_inq_varndims(file, variable, &rank) != NC_NOERR || rank < 0 || rank > 8) return std::nullopt;
  std::vector<int> dimensions(static_cast<std::size_t>(rank));
  if (nc_inq_vardimid(file, variable, dimensions.data()) != NC_NOERR) return std::nullopt;
  std::vector<std::size_t> shape(dimensions.size());
  for (std::size_t i = 0; i < shape.size(); ++i) {
    if (nc_inq_dimlen(file, dimensions[i], &shape[i]) != NC_NOERR) return std::nullopt;
  }
  return shape;
}

bool holdsNumbers(int file, int variable) {
  nc_type type = NC_NAT;
  return nc_inq_vartype(file, variable, &type) == NC_NOERR && type != NC_CHAR && type <= NC_MAX_ATOMIC_TYPE &&
         type != NC_STRING;
}

std::optional<std::vector<double>> numbersOf(int file, int variable, std::size_t count) {
  std::vector<double> numbers(count);
  if (!holdsNumbers(file, variable) || nc_get_var_double(file, variable, numbers.data()) != NC_NOERR)
    return std::nullopt;
  return numbers;
}

}  // namespace gridbay
