#include "platform/cartography/transformation.h"

#include <proj.h>

#include "platform/cartography/cartography.h"

namespace gridbay {
namespace {

struct FreeContext {
  void operator()(PJ_CONTEXT* context) const { proj_context_destroy(context); }
};
struct FreeProjection {
  void operator()(PJ* projection) const { proj_destroy(projection); }
};
using Projection = std::unique_ptr<PJ, FreeProjection>;

void ignoreLog(void*, int, const char*) {}

}  // namespace

struct Transformation::State {
  std::unique_ptr<PJ_CONTEXT, FreeContext> context;
  Projection way;
};

Transformation::Transformation(std::string_view from, std::string_view to)
    : state_(std::make_unique<State>()) {
  const std::string source = CVdMapProjection(from).Wkt2();
  const std::string target = CVdMapProjection(to).Wkt2();
  if (source.empty() || target.empty()) return;
  state_->context.reset(proj_context_create());
  PJ_CONTEXT* context = state_->context.get();
  proj_log_func(context, nullptr, ignoreLog);
  const Projection way(proj_create_crs_to_crs(context, source.c_str(), target.c_str(), nullptr));
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
