#pragma once

#include <optional>
#include <string>
#include <utility>
#include <variant>

namespace gridbay {

// Why an operation could not be done, as a sentence for the user: what, where and what to do.
struct Failure {
  std::string text;
};

// A value, or the reason why there is none.
template <class T>
class Result {
 public:
  Result(T value) : state_(std::move(value)) {}
  Result(Failure failure) : state_(std::move(failure)) {}

  explicit operator bool() const { return std::holds_alternative<T>(state_); }
  T& operator*() { return std::get<T>(state_); }
  const T& operator*() const { return std::get<T>(state_); }
  T* operator->() { return &std::get<T>(state_); }
  const T* operator->() const { return &std::get<T>(state_); }
  const std::string& error() const { return std::get<Failure>(state_).text; }

 private:
  std::variant<T, Failure> state_;
};

// The outcome of an operation that yields nothing but success or a reason.
class [[nodiscard]] Outcome {
 public:
  Outcome() = default;
  Outcome(Failure failure) : failure_(std::move(failure)) {}

  explicit operator bool() const { return !failure_; }
  const std::string& error() const { return failure_->text; }

 private:
  std::optional<Failure> failure_;
};

}  // namespace gridbay
