#pragma once

#include <cstddef>
#include <cstdint>
#include <list>
#include <mutex>
#include <span>
#include <unordered_map>
#include <vector>

#include "platform/files/file_descriptor.h"

namespace gridbay {

// Fills `bytes` from a place in a file; false where there are not as many.
bool readFully(int file, std::uint64_t place, std::span<std::byte> bytes);

// How the values of a grid are packed in its file: in pieces of equal size, each of which stands by itself.
struct PackedLayout {
  enum class Step { inflate, unshuffle, dropChecksum };
  struct Piece {
    std::uint64_t place = 0;  // in the file
    std::uint32_t bytes = 0;  // there; 0 for a piece that was never written
    std::uint32_t left = 0;   // bit n: step n of the packing was left out
  };

  std::size_t columns = 0;
  std::size_t rows = 0;
  std::size_t pieceColumns = 1;
  std::size_t pieceRows = 1;
  std::size_t pieceValues = 1;  // with those of further time steps, which come after the first
  bool isDouble = false;
  float missing = 0;               // of what was never written
  std::vector<Step> steps = {};    // of the packing, in their order
  std::vector<Piece> pieces = {};  // row by row
};

// The values of such a grid, unpacked piece by piece as they are asked for. The pieces that were asked for
// last are kept, in a bounded amount of memory. Several threads may read.
class PackedGrid {
 public:
  static constexpr std::size_t kMostKept = std::size_t{1} << 24;  // values
  // A piece must not have more values than are kept. A row of pieces may: while rows of them are read it
  // stays.
  PackedGrid(FileDescriptor file, PackedLayout layout) : file_(std::move(file)), layout_(std::move(layout)) {}

  // Points of a row from a column on, which must be there. False where the file is damaged or gone.
  bool read(std::size_t row, std::size_t firstColumn, std::span<float> values) const;
  // A value that is at hand: false where it would have to be unpacked, or another thread is at work.
  bool readAtOnce(std::size_t row, std::size_t column, float& value) const;
  // Keeps no more than a grid that is looked at here and there.
  void trim() const;

 private:
  struct Kept {
    std::vector<float> values;
    std::list<std::size_t>::iterator use;
  };
  // Null where it can't be unpacked.
  const std::vector<float>* piece(std::size_t number, std::size_t mostKept) const;
  void keepAtMost(std::size_t values) const;
  std::size_t across() const { return (layout_.columns + layout_.pieceColumns - 1) / layout_.pieceColumns; }
  bool unpack(const PackedLayout::Piece& piece, std::vector<float>& values) const;

  FileDescriptor file_;
  PackedLayout layout_;
  mutable std::mutex mutex_;
  mutable std::unordered_map<std::size_t, Kept> kept_;
  mutable std::list<std::size_t> uses_;  // the last one first
};

}  // namespace gridbay
