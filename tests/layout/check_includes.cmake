# Fails when a source includes a folder above it: the folders of src/ depend
# downward only (see "Map of the sources" in the README).
#   cmake -DSRC=<src folder> -P check_includes.cmake
# Each rule: a folder (relative to src/), then the include prefixes it must not use.
set(rules
  "platform|value/,text/,timezone/,AdDateTime.h"
  "platform/civil|platform/zone/,platform/locale/"
  "platform/zone|platform/locale/"
  "platform/locale|platform/zone/"
  "value|text/,timezone/"
  "text|timezone/")
# The plumbing: the files directly in platform/.
set(plumbing_rule "platform/zone/;platform/locale/")

set(failures "")
function(check_file file forbidden)
  file(STRINGS ${file} includes REGEX "^#include \"")
  foreach(line IN LISTS includes)
    string(REGEX REPLACE "^#include \"([^\"]+)\".*" "\\1" included "${line}")
    foreach(prefix IN LISTS forbidden)
      string(FIND "${included}" "${prefix}" at)
      if(at EQUAL 0)
        file(RELATIVE_PATH shown ${SRC} ${file})
        set(failures "${failures}\n  ${shown} includes ${included}" PARENT_SCOPE)
      endif()
    endforeach()
  endforeach()
endfunction()

foreach(rule IN LISTS rules)
  string(REPLACE "|" ";" parts "${rule}")
  string(REPLACE "," ";" parts "${parts}")
  list(GET parts 0 folder)
  list(SUBLIST parts 1 -1 forbidden)
  file(GLOB_RECURSE files ${SRC}/${folder}/*.h ${SRC}/${folder}/*.cc)
  foreach(file IN LISTS files)
    check_file(${file} "${forbidden}")
  endforeach()
endforeach()
file(GLOB files ${SRC}/platform/*.h ${SRC}/platform/*.cc)
foreach(file IN LISTS files)
  check_file(${file} "${plumbing_rule}")
endforeach()

if(failures)
  message(FATAL_ERROR "includes against the layering:${failures}")
endif()
