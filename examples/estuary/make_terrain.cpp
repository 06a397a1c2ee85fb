// Makes the terrain of the shipped example: an estuary behind a barrier with a tidal inlet, fed by a river,
// with an island in its basin. The same surface is sampled twice: every 90 m for the whole, and every 30 m
// around the inlet, so that the points of the two grids coincide.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <iostream>
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

bool writeGrid(const std::string& path, double x0, double y0, int noJ, int noK, double spacing) {
  std::ofstream file(path);
  file << fmt::format("ncols {}\nnrows {}\nxllcenter {}\nyllcenter {}\ncellsize {}\n", noJ, noK,
                      kEasting + x0, kNorthing + y0, spacing);
  for (int k = noK - 1; k >= 0; --k) {
    for (int j = 0; j < noJ; ++j)
      file << fmt::format("{:.3f}{}", elevation(x0 + j * spacing, y0 + k * spacing),
                          j + 1 < noJ ? ' ' : '\n');
  }
  file.close();
  if (!file) std::cerr << "cannot write " << path << '\n';
  return static_cast<bool>(file);
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::cerr << "usage: make_terrain FOLDER\n";
    return 2;
  }
  const std::string folder = argv[1];
  const bool made = writeGrid(folder + "/estuary.asc", 0, 0, 121, 91, 90) &&
                    writeGrid(folder + "/inlet.asc", 36 * 90, 33 * 90, 94, 76, 30);
  return made ? 0 : 2;
}
