#include "platform/cartography/transformation.h"

#include "platform/cartography/cartography.h"
#include "platform/cartography/proj_objects.h"

namespace gridbay {

struct Transformation::State {
  proj::Context context;
  proj::Object way;
};

Transformation::Transformation(std::string_view from, std::string_view to)
    : state_(std::make_unique<State>()) {
  const std::string source = CVdMapProjection(from).Wkt2();
  const std::string target = CVdMapProjection(to).Wkt2();
  if (source.empty() || target.empty()) return;
  state_->context = proj::quietContext();
  PJ_CONTEXT* context = state_->context.get();
  const proj::Object way(proj_create_crs_to_crs(context, source.c_str(), target.c_str(), nullptr));
  if (way) state_->way.reset(proj_normalize_for_visualization(context, way.get()));
}

Transformation::Transformation(Transformation&&) noexcept = default;
Transformation& Transformation::operator=(Transformation&&) noexcept = default;
Transformation::~Transformation() = default;

bool Transformation::isValid() const {
  return state_->way != nullptr;
}

bool Transformation::apply(std::span<double> pairs) const {
  if (!isValid() || pairs.size() < 2) return isValid();
  const std::size_t count = pairs.size() / 2;
  const std::size_t stride = 2 * sizeof(double);
  proj_trans_generic(state_->way.get(), PJ_FWD, pairs.data(), stride, count, pairs.data() + 1, stride, count,
                     nullptr, 0, 0, nullptr, 0, 0);
  return true;
}

}  // namespace gridbay
