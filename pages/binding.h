#pragma once

#include <cstdint>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <type_traits>

namespace gridbay {

// A value of the model as a control edits it. The object that holds it is looked up each time: the model is
// replaced when a file is opened.
template <class Value>
struct Binding {
  std::function<std::optional<Value>()> get;   // nothing while there is no such object
  std::function<void(const Value&)> set = {};  // none: it is only shown
  // What is wrong with a value that is typed; empty for nothing.
  std::function<std::string(const Value&)> fault = {};
};

// What an accessor gives, an object or a pointer to it, as a pointer.
template <class Found>
auto* pointerTo(Found&& found) {
  if constexpr (std::is_pointer_v<std::remove_reference_t<Found>>) {
    return found;
  } else {
    return &found;
  }
}

// Flags, bytes and enumerations are edited as integers, all else as what it is.
template <class Member>
using EditedAs =
    std::conditional_t<std::is_integral_v<Member> || std::is_enum_v<Member>, std::int32_t, Member>;

// A member of the object that `object()` gives; a null pointer stands for no object.
template <class Access, class Owner, class Member>
Binding<EditedAs<Member>> memberOf(Access object, Member Owner::*member) {
  using Edited = EditedAs<Member>;
  return {.get = [object, member]() -> std::optional<Edited> {
            auto* owner = pointerTo(object());
            if (owner == nullptr) return std::nullopt;
            return static_cast<Edited>(owner->*member);
          },
          .set =
              [object, member](const Edited& value) {
                if (auto* owner = pointerTo(object())) owner->*member = static_cast<Member>(value);
              }};
}

// The length of the list that `list()` gives.
template <class Access>
Binding<std::int32_t> countOf(Access list) {
  return {.get = [list]() -> std::optional<std::int32_t> {
            auto* held = pointerTo(list());
            if (held == nullptr) return std::nullopt;
            return static_cast<std::int32_t>(held->GetCount());
          },
          .set =
              [list](std::int32_t count) {
                if (auto* held = pointerTo(list())) held->SetCount(count);
              }};
}

// A number of points is shown as that of the last one, which is one less.
inline Binding<std::int32_t> lastOf(Binding<std::int32_t> points) {
  using Limits = std::numeric_limits<std::int32_t>;
  return {.get = [get = points.get]() -> std::optional<std::int32_t> {
            const std::optional<std::int32_t> held = get();
            return held && *held != Limits::min() ? std::optional(*held - 1) : held;
          },
          .set = [set = points.set](std::int32_t last) { set(last + 1); },
          .fault =
              [](std::int32_t last) {
                return last == Limits::max() ? "must be below " + std::to_string(last) : std::string();
              }};
}

}  // namespace gridbay
