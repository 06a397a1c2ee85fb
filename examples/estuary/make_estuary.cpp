// Makes what the shipped example starts from: an estuary behind a barrier with a tidal inlet, fed by a river,
// with an island in its basin. The same surface is sampled twice: every 90 m for the whole, and every 30 m
// around the inlet, so that the points of the two grids coincide. Beside the terrain there are the roughness
// of both grids, the tide, the river in flood, the rain that causes it,
// and what the sea carries.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <iostream>
#include <numbers>
#include <string>

namespace {

constexpr double kEasting = 480000;
constexpr double kNorthing = 6100000;
constexpr double kHighest = 15;

// A hill of height 1 with its top at distance 0.
double bell(double distance, double width) {
  return std::exp(-distance * distance / (width * width));
}

// How much of a feature there is on one side of a line: 0 far on the low side, 1 far on the high side.
double rise(double distance, double width) {
  return 0.5 + 0.5 * std::tanh(distance / width);
}

// Elevation (m, upwards) at x eastwards and y northwards (m) from the south-west corner.
double elevation(double x, double y) {
  constexpr double kInletY = 4050;
  constexpr double kCoastX = 4300;
  constexpr double kBasinX = 6300;
  constexpr double kBasinY = 4200;
  const double coast = kCoastX + 250 * std::sin(y / 1700);

  // The sea floor falls off seawards; the land lies behind the coast and rises slowly.
  double z = -1.0 - 11.0 * (1 - std::exp(-(coast - x) / 1800.0));
  z = x < coast ? z : -1.0;
  z += (7.5 + (x - coast) / 1500) * rise(x - coast, 180);

  const double basin = std::hypot((x - kBasinX) / 1500, (y - kBasinY) / 1900);
  z -= 12.5 * rise(1 - basin, 0.12);
  const double inlet = bell(y - kInletY, 330) * rise(x - (kCoastX - 900), 250) * rise(kBasinX - 900 - x, 250);
  z = std::min(z, z * (1 - inlet) - 7 * inlet);
  const double riverY = kBasinY + 500 * std::sin((x - kBasinX) / 1100);
  const double river = bell(y - riverY, 190) * rise(x - kBasinX, 300);
  z = z * (1 - river) - 3.5 * river;
  z += 13 * bell(std::hypot(x - 6700, y - 4900), 380);
  return std::min(z, kHighest);
}

// Manning number (m^(1/3)/s) by what is at an elevation: channels are smoother than flats, and these than
// land.
double manning(double z) {
  if (z < -2) return 40;
  return z < 0.5 ? 32 : 18;
}

bool closed(std::ofstream& file, const std::string& path) {
  file.close();
  if (!file) std::cerr << "cannot write " << path << '\n';
  return static_cast<bool>(file);
}

using Surface = double (*)(double z);

// A raster of what `surface` makes of the elevation at each point.
bool writeGrid(const std::string& path, double x0, double y0, int noJ, int noK, double spacing,
               Surface surface) {
  std::ofstream file(path);
  file << fmt::format("ncols {}\nnrows {}\nxllcenter {}\nyllcenter {}\ncellsize {}\n", noJ, noK,
                      kEasting + x0, kNorthing + y0, spacing);
  for (int k = noK - 1; k >= 0; --k) {
    for (int j = 0; j < noJ; ++j)
      file << fmt::format("{:.3f}{}", surface(elevation(x0 + j * spacing, y0 + k * spacing)),
                          j + 1 < noJ ? ' ' : '\n');
  }
  return closed(file, path);
}

bool writeGrids(const std::string& folder, const std::string& suffix, Surface surface) {
  return writeGrid(folder + "/estuary" + suffix, 0, 0, 121, 91, 90, surface) &&
         writeGrid(folder + "/inlet" + suffix, 36 * 90, 33 * 90, 94, 76, 30, surface);
}

// A table of values every ten minutes of the day that the example runs in, its times in minutes.
template <class Values>
bool writeTable(const std::string& path, const char* heading, const Values& values) {
  constexpr int kStepsPerHour = 6;
  constexpr int kHours = 24;
  std::ofstream file(path);
  file << heading << '\n';
  for (int i = 0; i <= kHours * kStepsPerHour; ++i) {
    const double hours = static_cast<double>(i) / kStepsPerHour;
    file << fmt::format("{},{}\n", i * 60 / kStepsPerHour, values(hours));
  }
  return closed(file, path);
}

constexpr double kTurn = 2 * std::numbers::pi;

// Water level at sea (m): the two main tides, and a surge that comes with the storm.
std::string tide(double hours) {
  return fmt::format("{:.3f}", 1.1 * std::sin(kTurn * hours / 12.42) + 0.35 * std::sin(kTurn * hours / 12.0) +
                                   0.6 * bell(hours - 9, 4));
}

// The river in flood (m3/s).
std::string river(double hours) {
  return fmt::format("{:.2f}", 90 + 260 * bell(hours - 10, 3.5));
}

// Rain (mm/h).
std::string rain(double hours) {
  return fmt::format("{:.2f}", 24 * bell(hours - 5, 1.6));
}

// Salt in the sea (mg/l), which the river in flood dilutes, and the effluent that comes back with the tide.
std::string sea(double hours) {
  return fmt::format("{:.0f},{:.3f}", 32000 - 2500 * bell(hours - 14, 4), 0.2 * bell(hours - 16, 3));
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::cerr << "usage: make_estuary FOLDER\n";
    return 2;
  }
  const std::string folder = argv[1];
  const bool made = writeGrids(folder, ".asc", [](double z) { return z; }) &&
                    writeGrids(folder, "_roughness.asc", manning) &&
                    writeTable(folder + "/tide.csv", "minutes,Tide", tide) &&
                    writeTable(folder + "/river.csv", "minutes,River discharge", river) &&
                    writeTable(folder + "/rain.csv", "minutes,Rain", rain) &&
                    writeTable(folder + "/sea.csv", "minutes,Salt,Effluent", sea);
  return made ? 0 : 2;
}
