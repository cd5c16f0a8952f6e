# The core: everything that is the daemon, and nothing of the platform but the seam.
#
# It is compiled against a directory of links that holds its own folders, the two headers of the seam and the layout of
# the requests. No other header of the tree can be found from there; check_seam.cmake refuses what an include path
# cannot (relative includes, headers outside the standard library).

set(core_sources
  daemon/kvd.cpp
  daemon/lifecycle.cpp
  daemon/messages.cpp
  routing/dispatcher.cpp
  routing/display.cpp
  routing/keys.cpp
  routing/retrigger.cpp
  routing/silence.cpp
  routing/target.cpp
  routing/volume.cpp
  registry/bridge.cpp
  registry/registry.cpp
  adapters/lumbra.cpp
  adapters/lyrabox.cpp
  adapters/slidewell.cpp
  adapters/snapvale.cpp
  adapters/spindle.cpp
  adapters/vistremeplayer.cpp
  adapters/vistremeplayerx.cpp
)

set(core_include ${CMAKE_BINARY_DIR}/core-include)
file(MAKE_DIRECTORY ${core_include}/platform ${core_include}/messages)
foreach(visible daemon routing registry adapters platform/host.h platform/mach.h messages/kvd_messages.h)
  file(CREATE_LINK ${PROJECT_SOURCE_DIR}/${visible} ${core_include}/${visible} SYMBOLIC)
endforeach()

file(GLOB core_files CONFIGURE_DEPENDS
  ${PROJECT_SOURCE_DIR}/daemon/* ${PROJECT_SOURCE_DIR}/routing/*
  ${PROJECT_SOURCE_DIR}/registry/* ${PROJECT_SOURCE_DIR}/adapters/*)
add_custom_command(
  OUTPUT ${CMAKE_BINARY_DIR}/core-seam.stamp
  COMMAND ${CMAKE_COMMAND} -P ${PROJECT_SOURCE_DIR}/cmake/check_seam.cmake ${core_files}
  COMMAND ${CMAKE_COMMAND} -E touch ${CMAKE_BINARY_DIR}/core-seam.stamp
  DEPENDS ${core_files} ${PROJECT_SOURCE_DIR}/cmake/check_seam.cmake
  COMMENT "Checking that the core includes nothing beyond the seam"
  VERBATIM)
add_custom_target(core_seam DEPENDS ${CMAKE_BINARY_DIR}/core-seam.stamp)

add_library(kvd_core STATIC ${core_sources})
add_dependencies(kvd_core core_seam)
target_include_directories(kvd_core PRIVATE ${core_include} INTERFACE ${PROJECT_SOURCE_DIR})
