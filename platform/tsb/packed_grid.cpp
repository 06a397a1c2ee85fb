#include "platform/tsb/packed_grid.h"

#include <zlib.h>

#include <algorithm>
#include <cstring>

namespace gridbay {
namespace {

// The n-th bytes of all values stand together in what was shuffled.
std::vector<std::byte> unshuffled(std::span<const std::byte> bytes, std::size_t valueBytes) {
  const std::size_t count = bytes.size() / valueBytes;
  std::vector<std::byte> values(bytes.begin(), bytes.end());
  for (std::size_t n = 0; n < valueBytes; ++n) {
    for (std::size_t i = 0; i < count; ++i) values[i * valueBytes + n] = bytes[n * count + i];
  }
  return values;
}

}  // namespace

bool readFully(int file, std::uint64_t place, std::span<std::byte> bytes) {
  while (!bytes.empty()) {
    const ssize_t got = ::pread(file, bytes.data(), bytes.size(), static_cast<off_t>(place));
    if (got <= 0) return false;
    place += static_cast<std::uint64_t>(got);
    bytes = bytes.subspan(static_cast<std::size_t>(got));
  }
  return true;
}

bool PackedGrid::unpack(const PackedLayout::Piece& piece, std::vector<float>& values) const {
  const std::size_t count = layout_.pieceColumns * layout_.pieceRows;
  values.assign(count, layout_.missing);
  if (piece.bytes == 0) return true;
  const std::size_t valueBytes = layout_.isDouble ? sizeof(double) : sizeof(float);
  const std::size_t wholeBytes = layout_.pieceValues * valueBytes;
  std::vector<std::byte> bytes(piece.bytes);
  if (!readFully(file_.get(), piece.place, bytes)) return false;
  // The last step of the packing is taken back first.
  for (std::size_t n = layout_.steps.size(); n-- > 0;) {
    if ((piece.left >> n & 1U) != 0) continue;
    switch (layout_.steps[n]) {
      case PackedLayout::Step::inflate: {
        constexpr std::size_t kChecksum = 4;  // that may come with it
        std::vector<std::byte> inflated(wholeBytes + kChecksum);
        uLongf length = inflated.size();
        if (uncompress(reinterpret_cast<Bytef*>(inflated.data()), &length,
                       reinterpret_cast<const Bytef*>(bytes.data()), bytes.size()) != Z_OK)
          return false;
        inflated.resize(length);
        bytes = std::move(inflated);
        break;
      }
      case PackedLayout::Step::unshuffle:
        bytes = unshuffled(bytes, valueBytes);
        break;
      case PackedLayout::Step::dropChecksum:
        if (bytes.size() < 4) return false;
        bytes.resize(bytes.size() - 4);
        break;
    }
  }
  if (bytes.size() != wholeBytes) return false;
  if (!layout_.isDouble) {
    std::memcpy(values.data(), bytes.data(), count * sizeof(float));
    return true;
  }
  std::vector<double> wide(count);
  std::memcpy(wide.data(), bytes.data(), count * sizeof(double));
  std::ranges::transform(wide, values.begin(), [](double value) { return static_cast<float>(value); });
  return true;
}

void PackedGrid::keepAtMost(std::size_t values) const {
  const std::size_t each = layout_.pieceColumns * layout_.pieceRows;
  while (!uses_.empty() && kept_.size() * each > values) {
    kept_.erase(uses_.back());
    uses_.pop_back();
  }
}

void PackedGrid::trim() const {
  const std::lock_guard lock(mutex_);
  keepAtMost(kMostKept);
}

const std::vector<float>* PackedGrid::piece(std::size_t number, std::size_t mostKept) const {
  if (const auto found = kept_.find(number); found != kept_.end()) {
    uses_.splice(uses_.begin(), uses_, found->second.use);
    return &found->second.values;
  }
  std::vector<float> values;
  if (!unpack(layout_.pieces[number], values)) return nullptr;
  keepAtMost(mostKept - values.size());
  uses_.push_front(number);
  return &kept_.emplace(number, Kept{std::move(values), uses_.begin()}).first->second.values;
}

bool PackedGrid::read(std::size_t row, std::size_t firstColumn, std::span<float> values) const {
  if (values.empty()) return true;
  // All that the row touches stays for the next one.
  const std::size_t touched =
      (firstColumn + values.size() - 1) / layout_.pieceColumns - firstColumn / layout_.pieceColumns + 1;
  const std::size_t mostKept = std::max(kMostKept, touched * layout_.pieceColumns * layout_.pieceRows);
  const std::size_t rowInPiece = row % layout_.pieceRows;
  const std::lock_guard lock(mutex_);
  while (!values.empty()) {
    const std::vector<float>* held =
        piece(row / layout_.pieceRows * across() + firstColumn / layout_.pieceColumns, mostKept);
    if (held == nullptr) return false;
    const std::size_t columnInPiece = firstColumn % layout_.pieceColumns;
    const std::size_t count = std::min(values.size(), layout_.pieceColumns - columnInPiece);
    std::copy_n(
        held->begin() + static_cast<std::ptrdiff_t>(rowInPiece * layout_.pieceColumns + columnInPiece), count,
        values.begin());
    values = values.subspan(count);
    firstColumn += count;
  }
  return true;
}

bool PackedGrid::readAtOnce(std::size_t row, std::size_t column, float& value) const {
  const std::unique_lock lock(mutex_, std::try_to_lock);
  if (!lock) return false;
  const auto found = kept_.find(row / layout_.pieceRows * across() + column / layout_.pieceColumns);
  if (found == kept_.end()) return false;
  value =
      found->second.values[row % layout_.pieceRows * layout_.pieceColumns + column % layout_.pieceColumns];
  return true;
}

}  // namespace gridbay
