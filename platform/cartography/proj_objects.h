#pragma once

#include <proj.h>

#include <memory>

namespace gridbay::proj {

// What the library hands out, freed by its owner.
struct FreeContext {
  void operator()(PJ_CONTEXT* context) const { proj_context_destroy(context); }
};
struct FreeObject {
  void operator()(PJ* object) const { proj_destroy(object); }
};
using Context = std::unique_ptr<PJ_CONTEXT, FreeContext>;
using Object = std::unique_ptr<PJ, FreeObject>;

// A context that writes nothing to standard error: what fails is told by our own texts. Not for use by two
// threads at a time.
inline Context quietContext() {
  Context context(proj_context_create());
  proj_log_func(context.get(), nullptr, [](void*, int, const char*) {});
  return context;
}

}  // namespace gridbay::proj
