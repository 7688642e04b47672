# Packages built by CPack from the install rules (cpack -G DEB, cpack -G TGZ, or
# the "package" workflow preset):
#   libdatetimelib<SOVERSION>  the shared library and its SONAME link, named after
#                              the SONAME as Debian's library policy asks
#   libdatetimelib-dev         the header, the unversioned link, the CMake package
#                              files and datetimelib.pc
#   adtime                     the tool and its manual page
# and a .tar.gz of the whole install tree. Debian packages want the prefix /usr
# (which gives the multiarch library folder) and no run path: the package preset
# configures both.

set(DATETIMELIB_PACKAGE_MAINTAINER
  "datetimelib maintainers <maintainers@users.noreply.c-seed-cfb3884e.example>"
  CACHE STRING "The Maintainer of the Debian packages")
# The date of this release, in the form of a Debian changelog entry.
set(DATETIMELIB_RELEASE_DATE "Sun, 06 Dec 2026 00:00:00 +0000")

set(DATETIMELIB_RUNTIME_PACKAGE libdatetimelib${DATETIMELIB_SOVERSION})
set(DATETIMELIB_DEV_PACKAGE libdatetimelib-dev)
set(DATETIMELIB_TOOL_PACKAGE adtime)

# Each package carries its copyright file and changelog in /usr/share/doc/<name>.
configure_file(${CMAKE_CURRENT_LIST_DIR}/debian/changelog.in
  ${PROJECT_BINARY_DIR}/debian/changelog @ONLY)
add_custom_command(OUTPUT ${PROJECT_BINARY_DIR}/debian/changelog.gz
  COMMAND gzip -9 -n -c ${PROJECT_BINARY_DIR}/debian/changelog
          > ${PROJECT_BINARY_DIR}/debian/changelog.gz
  DEPENDS ${PROJECT_BINARY_DIR}/debian/changelog
  VERBATIM)
add_custom_target(datetimelib_package_changelog ALL
  DEPENDS ${PROJECT_BINARY_DIR}/debian/changelog.gz)
set(components runtime development)
set(packages ${DATETIMELIB_RUNTIME_PACKAGE} ${DATETIMELIB_DEV_PACKAGE})
if(TARGET adtime)
  list(APPEND components tool)
  list(APPEND packages ${DATETIMELIB_TOOL_PACKAGE})
endif()
foreach(component package IN ZIP_LISTS components packages)
  install(FILES ${CMAKE_CURRENT_LIST_DIR}/debian/copyright
    DESTINATION ${CMAKE_INSTALL_DATAROOTDIR}/doc/${package}
    RENAME copyright COMPONENT ${component})
  install(FILES ${PROJECT_BINARY_DIR}/debian/changelog.gz
    DESTINATION ${CMAKE_INSTALL_DATAROOTDIR}/doc/${package} COMPONENT ${component})
endforeach()

set(CPACK_PACKAGE_NAME datetimelib)
set(CPACK_PACKAGE_VENDOR "the datetimelib developers")
set(CPACK_PACKAGE_CONTACT "${DATETIMELIB_PACKAGE_MAINTAINER}")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_GENERATOR DEB TGZ)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_COMPONENTS_ALL ${components})

# The tarball: the install tree as one archive.
set(CPACK_ARCHIVE_COMPONENT_INSTALL OFF)

# The Debian packages: one per component, dependencies from the binaries.
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME ${DATETIMELIB_RUNTIME_PACKAGE})
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
# The loader's cache is refreshed by dpkg's ldconfig trigger, as in Debian's own
# library packages; ldconfig_trigger.cmake removes CPack's ldconfig calls.
set(CPACK_DEBIAN_RUNTIME_PACKAGE_CONTROL_EXTRA ${CMAKE_CURRENT_LIST_DIR}/debian/triggers)
set(CPACK_POST_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/debian/ldconfig_trigger.cmake)
set(CPACK_DEBIAN_RUNTIME_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_RUNTIME_DESCRIPTION
"calendar date-times as 32-bit seconds counts - shared library
datetimelib gives host applications one calendar date-time value, AdDateTime:
construction from local fields with a range test, calendar fields, arithmetic,
formatting and parsing (strftime patterns, the locale's own forms, a compact
form and dates as people type them), and the time zone's daylight-saving dates.
Failure is a status of the value, never an exception.

This package holds the shared library.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME ${DATETIMELIB_DEV_PACKAGE})
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS
  "${DATETIMELIB_RUNTIME_PACKAGE} (= ${PROJECT_VERSION})")
set(CPACK_DEBIAN_DEVELOPMENT_DESCRIPTION
"calendar date-times as 32-bit seconds counts - development files
datetimelib gives host applications one calendar date-time value, AdDateTime,
with formatting, parsing and time-zone questions.

This package holds the header AdDateTime.h, the link to build against, the
CMake package (find_package(datetimelib)) and datetimelib.pc for pkg-config.")

set(CPACK_DEBIAN_TOOL_PACKAGE_NAME ${DATETIMELIB_TOOL_PACKAGE})
set(CPACK_DEBIAN_TOOL_PACKAGE_SECTION utils)
# dpkg-shlibdeps finds the library in the build folder but cannot tell which
# package holds it: that dependency is stated here.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${PROJECT_BINARY_DIR})
set(CPACK_DEBIAN_TOOL_PACKAGE_DEPENDS
  "${DATETIMELIB_RUNTIME_PACKAGE} (>= ${PROJECT_VERSION})")
set(CPACK_DEBIAN_TOOL_DESCRIPTION
"read, write and inspect calendar date-times from the command line
adtime reads dates as people type them, such as yesterday.14:30, or in the
locale's forms, writes seconds counts with strftime patterns or in a
locale's own form, and reports the time zone's offset and daylight-saving
dates, as text, TSV or JSON, one result per line.")

include(CPack)
