# A room is a folder with a library of its own, gridbay_NAME. It names its sources and the rooms that it uses;
# scripts/check-rooms holds its includes to these.
#
#   room(basic USES pages core platform SOURCES bathymetry.cpp ...)
#
# The sources of a room are compiled a few at a time: they include much the same, which costs more than they do.
# What a source declares for itself alone has a name of its own in its room; APART compiles each by itself, as where a
# program is linked with a part of a room alone.
function(room name)
  cmake_parse_arguments(ROOM "APART" "" "USES;SOURCES;LIBRARIES" ${ARGN})
  if(GRIDBAY_FUZZ AND NOT name STREQUAL "pages")  # opens no page
    list(FILTER ROOM_SOURCES EXCLUDE REGEX "_(page|pages|dialog|factory|doc)\\.cpp$|navigation_tree")
  endif()
  add_library(gridbay_${name} STATIC ${ROOM_SOURCES})
  if(NOT ROOM_APART)
    set_target_properties(gridbay_${name} PROPERTIES UNITY_BUILD ON UNITY_BUILD_BATCH_SIZE 5)
  endif()
  foreach(used ${ROOM_USES})
    target_link_libraries(gridbay_${name} PUBLIC gridbay_${used})
  endforeach()
  target_link_libraries(gridbay_${name} PUBLIC ${ROOM_LIBRARIES})
  precompile(gridbay_${name})
endfunction()

# For a room that makes programs or modules of its own: only what it uses.
function(room_uses name)
endfunction()

# The headers that nearly every source includes are compiled once for all of a kind of target.
function(precompile target)
  if(NOT TARGET gridbay_precompiled)
    file(WRITE ${PROJECT_BINARY_DIR}/precompiled.cpp "")
    add_library(gridbay_precompiled OBJECT ${PROJECT_BINARY_DIR}/precompiled.cpp)
    target_link_libraries(gridbay_precompiled PRIVATE fmt::fmt)
    target_precompile_headers(gridbay_precompiled PRIVATE ${PROJECT_SOURCE_DIR}/cmake/precompiled.h)
  endif()
  target_precompile_headers(${target} REUSE_FROM gridbay_precompiled)
endfunction()
