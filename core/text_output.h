#pragma once

#include <cstddef>
#include <cstring>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

#include "platform/result.h"

namespace gridbay {

// Takes the text of a file piece by piece.
class TextSink {
 public:
  virtual ~TextSink() = default;
  virtual Outcome write(std::string_view text) = 0;
};

// Keeps it as one text.
class StringSink : public TextSink {
 public:
  Outcome write(std::string_view text) override {
    text_.append(text);
    return {};
  }
  std::string take() { return std::move(text_); }

 private:
  std::string text_;
};

// Text on its way to a sink, in pieces of a size that suits a file.
class TextOutput {
 public:
  explicit TextOutput(TextSink& sink) : sink_(sink), piece_(std::make_unique_for_overwrite<char[]>(kPiece)) {}

  void put(char c) {
    if (size_ == kPiece) flush();
    piece_[size_++] = c;
  }
  void put(std::string_view text) {
    if (text.size() > kPiece - size_) flush();
    if (text.size() > kPiece) {
      take(text);
      return;
    }
    copy(piece_.get() + size_, text);
    size_ += text.size();
  }
  void blanks(std::size_t count) {
    if (count > kPiece - size_) flush();
    for (; count > kPiece; count -= kPiece) {
      std::memset(piece_.get(), ' ', kPiece);
      take({piece_.get(), kPiece});
    }
    std::memset(piece_.get() + size_, ' ', count);
    size_ += count;
  }
  // Gives the sink all that has been put so far.
  void flush() {
    take({piece_.get(), size_});
    size_ = 0;
  }
  // What went wrong first, if anything did; from then on the sink is left alone.
  const Outcome& outcome() const { return outcome_; }

 private:
  static constexpr std::size_t kPiece = 1 << 15;

  // Nearly all texts are a few bytes long: two moves that overlap take less time than a call.
  static void copy(char* to, std::string_view text) {
    const std::size_t n = text.size();
    if (n > 16) {
      std::memcpy(to, text.data(), n);
    } else if (n >= 8) {
      copyEnds<8>(to, text);
    } else if (n >= 4) {
      copyEnds<4>(to, text);
    } else if (n > 0) {
      to[0] = text[0];
      to[n / 2] = text[n / 2];
      to[n - 1] = text[n - 1];
    }
  }
  template <std::size_t size>
  static void copyEnds(char* to, std::string_view text) {
    char head[size];
    char tail[size];
    std::memcpy(head, text.data(), size);
    std::memcpy(tail, text.data() + text.size() - size, size);
    std::memcpy(to, head, size);
    std::memcpy(to + text.size() - size, tail, size);
  }

  void take(std::string_view text) {
    if (outcome_ && !text.empty()) outcome_ = sink_.write(text);
  }

  TextSink& sink_;
  std::unique_ptr<char[]> piece_;
  std::size_t size_ = 0;
  Outcome outcome_;
};

}  // namespace gridbay
