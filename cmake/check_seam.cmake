# cmake -P check_seam.cmake FILE…: fails when a file includes anything but the standard library, the core's own headers
# and the seam.

set(allowed
  "^(<[a-z_]+>|\"(daemon|routing|registry|adapters)/[a-z_]+\\.h\"|\"platform/(host|mach)\\.h\"|\"messages/kvd_messages\\.h\")$")

set(refused "")
math(EXPR last "${CMAKE_ARGC} - 1")
foreach(index RANGE 3 ${last})
  set(file "${CMAKE_ARGV${index}}")
  file(STRINGS "${file}" includes REGEX "^[ \t]*#[ \t]*include")
  foreach(line IN LISTS includes)
    string(REGEX REPLACE "^[ \t]*#[ \t]*include[ \t]*([<\"][^>\"]*[>\"]).*$" "\\1" header "${line}")
    if(NOT header MATCHES "${allowed}")
      string(APPEND refused "\n  ${file}: ${header}")
    endif()
  endforeach()
endforeach()

if(refused)
  message(FATAL_ERROR "The core may include the standard library, its own headers, platform/host.h, "
    "platform/mach.h and messages/kvd_messages.h only:${refused}")
endif()
