#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>
#include <vector>

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

// A raster or vector file below or above what a map places, in the projection of the map. It is used by one
// thread at a time.
class Background {
 public:
  virtual ~Background() = default;

  // A raster is painted pixel by pixel; another file has points and lines.
  virtual bool isRaster() const = 0;
  // What is to be told of it, as that it names no projection; empty where nothing is.
  virtual const std::string& notice() const = 0;
  // Colours (0xAARRGGBB) of the pixels of a frame, row by row from the upper left, clear where the raster has
  // none. Nothing but what the frame shows is read, no denser than it shows it. False with the reason; with
  // none where it was cancelled.
  virtual bool paint(const BackgroundFrame& frame, std::span<std::uint32_t> pixels,
                     const std::function<bool()>& isCancelled, std::string* error) = 0;
  // Points, lines and rings on the map, without attributes; empty for a raster.
  virtual const std::vector<VectorLayer>& shapes() const = 0;
};

// Opens any file that the raster library reads, for a map of a projection by its full text (empty for local
// coordinates). What names no projection, or stands on a map without one, is placed by its own coordinates.
// An error where it can't be read or placed, or was cancelled.
Result<std::unique_ptr<Background>> openBackground(const std::string& path, const std::string& projection,
                                                   const std::function<bool()>& isCancelled);

// The entry point of the module: one that the caller owns, or null with the reason.
inline constexpr const char* kOpenBackground = "gridbayOpenBackground";
using OpenBackground = Background* (*)(const char* path, const char* projection,
                                       const std::function<bool()>* isCancelled, std::string* error);

}  // namespace gridbay
