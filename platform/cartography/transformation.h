#pragma once

#include <memory>
#include <span>
#include <string_view>

namespace gridbay {

// The way from one map projection to another, with the change of datum where they differ. Either is given by
// its text, as for a CVdMapProjection, or is longitude and latitude (degrees, in this order).
class Transformation {
 public:
  Transformation(std::string_view from, std::string_view to);
  Transformation(Transformation&&) noexcept;
  Transformation& operator=(Transformation&&) noexcept;
  ~Transformation();

  // Whether there is a way: not from or to local coordinates, nor what is no projection.
  bool isValid() const;
  // Changes coordinates in place, pairs of x and y. False where there is no way; those that the other
  // projection cannot hold become infinite.
  bool apply(std::span<double> pairs) const;

 private:
  struct State;
  std::unique_ptr<State> state_;
};

}  // namespace gridbay
