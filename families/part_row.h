#pragma once

#include "core/keyword_table.h"

namespace gridbay {

// The row of an object that is a part of another one: what stands in its own table stands here.
template <class Object, class Part>
struct PartRow {
  Part Object::*member;

  void save(const Object& object, KvsFile& file, const std::string& documentPath) const {
    Part::table().save(object.*member, file, documentPath);
  }
  void load(Object& object, KvsSection from, const std::string& documentPath) const {
    Part::table().load(object.*member, from, documentPath);
  }
  void copy(Object& object, const Object& other) const { Part::table().copy(object.*member, other.*member); }
  bool same(const Object& a, const Object& b, StateScope scope) const {
    return Part::table().same(a.*member, b.*member, scope);
  }
  void assign(Object& object, const Object& other, StateScope scope) const {
    Part::table().assign(object.*member, other.*member, scope);
  }
  void refresh(Object& object, const Object& other) const {
    Part::table().refresh(object.*member, other.*member);
  }
  void visitLists(Object& object, Object& other, auto&& visit) const {
    Part::table().visitLists(object.*member, other.*member, visit);
  }
  bool access(Object& object, std::string_view path, PathAccess& access) const {
    return Part::table().access(object.*member, path, access);
  }
};

template <class Object, class Part>
constexpr PartRow<Object, Part> part(Part Object::*member) {
  return {member};
}

}  // namespace gridbay
