#pragma once

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <string_view>
#include <vector>

#include "core/text_output.h"
#include "platform/large_memory.h"

namespace gridbay {

// Text in memory, in pieces that stay where they are while it grows.
class TextPieces : public TextSink {
 public:
  Outcome write(std::string_view text) override {
    while (!text.empty()) {
      if (left_ == 0) grow(text.size());
      const std::size_t size = std::min(text.size(), left_);
      std::memcpy(end_, text.data(), size);
      end_ += size;
      left_ -= size;
      text.remove_prefix(size);
    }
    return {};
  }
  // Gives another sink all there is.
  Outcome copyTo(TextSink& sink) const {
    for (std::size_t i = 0; i < pieces_.size(); ++i) {
      const std::size_t size = pieces_[i].size - (i + 1 == pieces_.size() ? left_ : 0);
      if (Outcome written = sink.write({pieces_[i].bytes.get(), size}); !written) return written;
    }
    return {};
  }

 private:
  struct Piece {
    LargeBytes bytes;
    std::size_t size;
  };

  void grow(std::size_t wanted) {
    const std::size_t size = std::clamp(size_, wanted, std::max(wanted, kLargeMemory));
    pieces_.push_back({allocateBytes(size), size});
    end_ = pieces_.back().bytes.get();
    left_ = size;
    size_ += size;
  }

  std::vector<Piece> pieces_;
  std::size_t size_ = 0;  // of all pieces
  char* end_ = nullptr;
  std::size_t left_ = 0;
};

}  // namespace gridbay
