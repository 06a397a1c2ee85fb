#pragma once

#include <type_traits>
#include <utility>

#include "core/kvs_base.h"

namespace gridbay {
namespace root_detail {

template <class Member>
struct OwnerOf;
template <class Owner, class Pointer>
struct OwnerOf<Pointer Owner::*> {
  using type = Owner;
};

}  // namespace root_detail

// What a member that a room has in the root holds, for a template that has the member as its parameter;
// `object` is any part of a whole model.
template <auto member>
auto& rootMember(CKvsBase& object) {
  return *(object.parts<typename root_detail::OwnerOf<decltype(member)>::type>()->*member);
}
template <auto member>
using RootMember = std::remove_reference_t<decltype(rootMember<member>(std::declval<CKvsBase&>()))>;

}  // namespace gridbay
