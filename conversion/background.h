#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>
#include <vector>

#include "conversion/raster.h"
#include "conversion/vector_file.h"
#include "platform/result.h"

namespace gridbay {

// A picture of a part of a map: north is up.
struct BackgroundFrame {
  double west = 0;  // of the upper left corner
  double north = 0;
  double metresPerPixel = 1;
  int width = 1;  // pixels
  int height = 1;
};

// The rasters in a file of several, by names of which one can be asked for, and the one that is shown.
struct RasterNames {
  std::vector<std::string> all;
  std::string shown;
};

// A raster or vector file below or above what a map places, in the projection of the map. It is used by one
// thread at a time.
class Background {
 public:
  virtual ~Background() = default;

  // A raster is painted pixel by pixel; another file has points and lines.
  virtual bool isRaster() const = 0;
  // What is to be told of it, as that it names no projection; empty where nothing is.
  virtual const std::string& notice() const = 0;
  // Of a file of several rasters; of none for another file.
  virtual const RasterNames& rasters() const = 0;
  // Colours (0xAARRGGBB) of the pixels of a frame, row by row from the upper left, clear where the raster has
  // none. Nothing but what the frame shows is read, no denser than it shows it. False with the reason; with
  // none where it was cancelled.
  virtual bool paint(const BackgroundFrame& frame, std::span<std::uint32_t> pixels,
                     const std::function<bool()>& isCancelled, std::string* error) = 0;
  // Points, lines and rings on the map, without attributes; empty for a raster.
  virtual const std::vector<VectorLayer>& shapes() const = 0;
};

// Whether a file is shown by a copy of it alone, as what reads its kind serves one thread: netCDF, HDF5, and
// our own maps. Any thread may ask.
bool needsBackgroundCopy(const std::string& path);

// Opens any other file that the raster library reads, for a map of a projection by its full text (empty for
// local coordinates). Of several rasters it takes the one of a name, or else the first that has a place. What
// names no projection, or stands on a map without one, is placed by its own coordinates. An error where it
// can't be read or placed, or was cancelled.
Result<std::unique_ptr<Background>> openBackground(const std::string& path, const std::string& raster,
                                                   const std::string& projection,
                                                   const std::function<bool()>& isCancelled);

// A copy of a file that can be opened as a background, in as many points as are worth it.
struct BackgroundCopy {
  std::string file;
  bool isWhole = true;  // else it is of the frame and its neighbourhood
  bool isFull = true;   // else it has not all the points there
  RasterNames rasters;
};
// Makes one at the path `made`, to which an ending comes. It takes as long as the reading of the file, in the
// one thread that uses data files, or in a process of its own. What is large is copied for one picture of the
// map, as far as three times its size. `progress` is told how much is done, 0 to 1, and stops it by false.
Result<BackgroundCopy> copyBackground(const std::string& path, const std::string& raster,
                                      const std::string& projection, const BackgroundFrame& frame,
                                      const std::string& made, const std::function<bool(double)>& progress);

// The entry points of the module. One that the caller owns, or null with the reason; and false with one.
inline constexpr const char* kOpenBackground = "gridbayOpenBackground";
using OpenBackground = Background* (*)(const char* path, const char* raster, const char* projection,
                                       const std::function<bool()>* isCancelled, std::string* error);
inline constexpr const char* kNeedsCopy = "gridbayNeedsCopy";
using NeedsCopy = bool (*)(const char* path);
struct CopyWanted {
  std::string path;
  std::string raster;
  Raster* own = nullptr;      // what is copied, where it is a map of our own
  std::string ownProjection;  // of that, by its full text
  std::string projection;
  BackgroundFrame frame;
  std::string made;
  std::function<bool(double)> progress;
};
inline constexpr const char* kCopyBackground = "gridbayCopyBackground";
using CopyBackground = bool (*)(const CopyWanted* wanted, BackgroundCopy* copy, std::string* error);

}  // namespace gridbay
