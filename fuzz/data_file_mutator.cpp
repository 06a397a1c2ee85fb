#include "fuzz/data_file_mutator.h"

#include <netcdf.h>

#include <array>
#include <cmath>
#include <limits>
#include <random>
#include <string>
#include <vector>

#include "platform/apart.h"
#include "platform/tsb/tsb_file.h"

namespace gridbay {
namespace {

class Mutation {
 public:
  Mutation(int file, unsigned seed) : file_(file), random_(seed) {}

  void apply() {
    switch (below(6)) {
      case 0:
      case 1:
      case 2:
        putAttribute();
        break;
      case 3:
        dropAttribute();
        break;
      case 4:
        addVariable();
        break;
      default:
        putNumber();
    }
  }

 private:
  unsigned below(unsigned most) { return static_cast<unsigned>(random_()) % most; }
  template <class List>
  const auto& oneOf(const List& list) {
    return list[below(static_cast<unsigned>(std::size(list)))];
  }

  // The file itself or its group of blocks.
  int place() {
    int group = 0;
    return below(4) == 0 && nc_inq_ncid(file_, "custom_blocks", &group) == NC_NOERR ? group : file_;
  }
  // A variable by its number, or the file as a whole.
  int variableOf(int place) {
    int count = 0;
    nc_inq_nvars(place, &count);
    return static_cast<int>(below(static_cast<unsigned>(count) + 1)) - 1;
  }
  std::string attributeOf(int place, int variable) {
    int count = 0;
    if (nc_inq_varnatts(place, variable, &count) != NC_NOERR || count == 0) return {};
    std::array<char, NC_MAX_NAME + 1> name{};
    nc_inq_attname(place, variable, static_cast<int>(below(static_cast<unsigned>(count))), name.data());
    return name.data();
  }

  const char* name() {
    static constexpr const char* kNames[] = {"time",
                                             "x",
                                             "y",
                                             "projection",
                                             "custom_blocks",
                                             "data_type",
                                             "title",
                                             "axis_type",
                                             "units",
                                             "first_value",
                                             "step",
                                             "item_type",
                                             "item_number",
                                             "block_name",
                                             "long_name",
                                             "projection_name",
                                             "rotation",
                                             "longitude_of_first_point",
                                             "bathymetry",
                                             "water_level",
                                             "v27_misc",
                                             "standard_name",
                                             "other"};
    return oneOf(kNames);
  }
  double number() {
    using Limits = std::numeric_limits<double>;
    static constexpr double kNumbers[] = {0,
                                          1,
                                          2,
                                          3,
                                          4,
                                          5,
                                          -1,
                                          0.5,
                                          1e10,
                                          1e9,
                                          1e-9,
                                          1e18,
                                          1e9,
                                          10000,
                                          100000,
                                          2147483648.0,
                                          -1e-35,
                                          1e308,
                                          Limits::infinity(),
                                          Limits::quiet_NaN(),
                                          Limits::denorm_min()};
    return oneOf(kNumbers);
  }
  std::string text() {
    static const std::string kTexts[] = {"",
                                         "s",
                                         "m",
                                         "hour",
                                         "s since 2000-01-01 00:00:00",
                                         "s since",
                                         "s since 99999999999-99-99",
                                         " since ",
                                         "UTM-32",
                                         "NON-UTM",
                                         "no such unit",
                                         "m^3/s/m",
                                         "((((((((((",
                                         std::string("a\0b", 3),
                                         "\xFF\xFE",
                                         std::string(3000, '1')};
    return oneOf(kTexts);
  }

  void putAttribute() {
    const int at = place();
    const int variable = variableOf(at);
    std::string attribute = attributeOf(at, variable);
    if (attribute.empty() || below(3) == 0) attribute = name();
    static constexpr nc_type kTypes[] = {NC_INT, NC_DOUBLE, NC_FLOAT, NC_INT64, NC_BYTE};
    switch (below(4)) {
      case 0: {
        const std::string value = text();
        nc_put_att_text(at, variable, attribute.c_str(), value.size(), value.data());
        break;
      }
      case 1: {
        const std::string value = text();
        const char* values[] = {value.c_str(), "second"};
        nc_put_att_string(at, variable, attribute.c_str(), below(3), values);
        break;
      }
      default: {
        const double values[] = {number(), number(), number()};
        nc_put_att_double(at, variable, attribute.c_str(), oneOf(kTypes), below(6) == 0 ? below(4) : 1,
                          values);
      }
    }
  }

  void dropAttribute() {
    const int at = place();
    const int variable = variableOf(at);
    nc_del_att(at, variable, attributeOf(at, variable).c_str());
  }

  // Of any type and shape, with nothing stored in it: such a file says more than it holds.
  void addVariable() {
    static constexpr nc_type kTypes[] = {NC_FLOAT, NC_DOUBLE, NC_INT, NC_CHAR, NC_STRING, NC_UINT64};
    static constexpr std::size_t kLengths[] = {1, 2, 3, 4, 1000, 100000, 2000000000, std::size_t{1} << 40};
    const int at = place();
    std::vector<int> dimensions;
    for (unsigned rank = below(5); rank > 0; --rank) {
      int count = 0;
      std::array<int, NC_MAX_DIMS> known{};
      nc_inq_dimids(at, &count, known.data(), 1);
      int dimension = count == 0 ? -1 : known[below(static_cast<unsigned>(count))];
      if (count == 0 || below(3) == 0) {
        const std::size_t length = below(5) == 0 ? NC_UNLIMITED : oneOf(kLengths);
        if (nc_def_dim(at, below(2) == 0 ? name() : std::to_string(random_()).c_str(), length, &dimension) !=
            NC_NOERR)
          continue;
      }
      dimensions.push_back(dimension);
    }
    int variable = 0;
    if (nc_def_var(at, name(), oneOf(kTypes), static_cast<int>(dimensions.size()), dimensions.data(),
                   &variable) != NC_NOERR)
      return;
    if (below(3) == 0) nc_def_var_deflate(at, variable, 1, 1, 5);
    const double item = number();
    if (below(2) == 0) nc_put_att_double(at, variable, "item_number", NC_INT, 1, &item);
    if (below(2) == 0) nc_put_att_text(at, variable, "units", 1, "m");
  }

  void putNumber() {
    const int at = place();
    const int variable = variableOf(at);
    nc_type type = NC_NAT;
    if (variable < 0 || nc_inq_vartype(at, variable, &type) != NC_NOERR || type == NC_CHAR ||
        type == NC_STRING)
      return;
    int rank = 0;
    nc_inq_varndims(at, variable, &rank);
    std::vector<std::size_t> index(static_cast<std::size_t>(rank));
    for (std::size_t& i : index) i = below(4);
    const double value = number();
    nc_put_var1_double(at, variable, index.data(), &value);
  }

  int file_;
  std::mt19937 random_;
};

}  // namespace

bool mutateDataFile(const std::string& path, unsigned seed) {
  if (!TsbFile::open(path)) return false;
  // The library is no more robust in writing.
  return holdsApart(
      [&path, seed] {
        int file = 0;
        if (nc_open(path.c_str(), NC_WRITE, &file) != NC_NOERR) return false;
        Mutation mutation(file, seed);
        for (unsigned change = 0; change < 1 + seed % 3; ++change) mutation.apply();
        return nc_close(file) == NC_NOERR;
      },
      2);
}

}  // namespace gridbay
