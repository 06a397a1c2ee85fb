#pragma once

#include <cstddef>
#include <cstring>
#include <optional>
#include <string>
#include <type_traits>
#include <utility>

namespace gridbay {

// Puts members into bytes, or fills them from there: both by one list of them. For what goes between copies
// of this process, and on no file. A class takes part by a function `pass(Packing&, Class&)` beside it.
class Packing {
 public:
  Packing() = default;
  explicit Packing(std::string bytes) : bytes_(std::move(bytes)), reads_(true) {}

  template <class... Members>
  void operator()(Members&... members) {
    (member(members), ...);
  }
  std::string& bytes() { return bytes_; }
  // How much has been read.
  std::size_t place() const { return at_; }
  // Whether what was read has been all there is, and has been there.
  bool isWhole() const { return !isShort_ && at_ == bytes_.size(); }

 private:
  void raw(void* at, std::size_t size) {
    if (size == 0) return;
    if (!reads_) {
      bytes_.append(static_cast<const char*>(at), size);
    } else if (bytes_.size() - at_ >= size) {
      std::memcpy(at, bytes_.data() + at_, size);
      at_ += size;
    } else {
      isShort_ = true;
      at_ = bytes_.size();
    }
  }
  template <class Member>
  void member(std::optional<Member>& member) {
    bool isThere = member.has_value();
    raw(&isThere, sizeof isThere);
    if (isThere && !member) member.emplace();
    if (isThere) this->member(*member);
  }
  template <class Member>
  void member(Member& member) {
    if constexpr (requires { pass(*this, member); }) {
      pass(*this, member);
    } else if constexpr (std::is_trivially_copyable_v<Member>) {
      raw(&member, sizeof member);
    } else {
      std::size_t count = member.size();
      raw(&count, sizeof count);
      // No element takes less than a byte.
      if (reads_ && count > bytes_.size() - at_) {
        isShort_ = true;
        count = 0;
      }
      member.resize(count);
      if constexpr (std::is_trivially_copyable_v<typename Member::value_type>) {
        raw(member.data(), count * sizeof(typename Member::value_type));
      } else {
        for (auto& element : member) this->member(element);
      }
    }
  }

  std::string bytes_;
  std::size_t at_ = 0;
  bool reads_ = false;
  bool isShort_ = false;
};

}  // namespace gridbay
