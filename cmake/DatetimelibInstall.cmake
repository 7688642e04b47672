# Install rules: the shared library with its SONAME links, the public header, a
# CMake package (datetimelib::datetimelib) and a pkg-config file. Every path is
# relative to the install prefix, so an installed tree can be moved as a whole.
include(CMakePackageConfigHelpers)

set(DATETIMELIB_CMAKE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/datetimelib)

install(TARGETS datetimelib EXPORT datetimelibTargets
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
    COMPONENT runtime NAMELINK_COMPONENT development
  PUBLIC_HEADER DESTINATION ${CMAKE_INSTALL_INCLUDEDIR} COMPONENT development)

install(EXPORT datetimelibTargets
  NAMESPACE datetimelib::
  DESTINATION ${DATETIMELIB_CMAKE_DIR}
  COMPONENT development)

configure_package_config_file(
  ${CMAKE_CURRENT_LIST_DIR}/datetimelibConfig.cmake.in
  ${PROJECT_BINARY_DIR}/datetimelibConfig.cmake
  INSTALL_DESTINATION ${DATETIMELIB_CMAKE_DIR})

# Semantic versioning: before 1.0 only the same minor release is compatible.
if(PROJECT_VERSION_MAJOR EQUAL 0)
  set(DATETIMELIB_COMPATIBILITY SameMinorVersion)
else()
  set(DATETIMELIB_COMPATIBILITY SameMajorVersion)
endif()
write_basic_package_version_file(
  ${PROJECT_BINARY_DIR}/datetimelibConfigVersion.cmake
  VERSION ${PROJECT_VERSION}
  COMPATIBILITY ${DATETIMELIB_COMPATIBILITY})

install(FILES
    ${PROJECT_BINARY_DIR}/datetimelibConfig.cmake
    ${PROJECT_BINARY_DIR}/datetimelibConfigVersion.cmake
  DESTINATION ${DATETIMELIB_CMAKE_DIR}
  COMPONENT development)

# The .pc file finds the prefix from its own place (pkg-config's ${pcfiledir}),
# which keeps it right after the installed tree is moved.
set(DATETIMELIB_PC_DIR ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
if(IS_ABSOLUTE "${CMAKE_INSTALL_LIBDIR}")
  set(DATETIMELIB_PC_PREFIX "${CMAKE_INSTALL_PREFIX}")
else()
  file(RELATIVE_PATH DATETIMELIB_PC_UP "/prefix/${DATETIMELIB_PC_DIR}" "/prefix")
  string(REGEX REPLACE "/$" "" DATETIMELIB_PC_UP "${DATETIMELIB_PC_UP}")
  set(DATETIMELIB_PC_PREFIX "\${pcfiledir}/${DATETIMELIB_PC_UP}")
endif()
foreach(dir LIBDIR INCLUDEDIR)
  if(IS_ABSOLUTE "${CMAKE_INSTALL_${dir}}")
    set(DATETIMELIB_PC_${dir} "${CMAKE_INSTALL_${dir}}")
  else()
    set(DATETIMELIB_PC_${dir} "\${prefix}/${CMAKE_INSTALL_${dir}}")
  endif()
endforeach()
configure_file(${CMAKE_CURRENT_LIST_DIR}/datetimelib.pc.in
  ${PROJECT_BINARY_DIR}/datetimelib.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/datetimelib.pc
  DESTINATION ${DATETIMELIB_PC_DIR}
  COMPONENT development)
include(${CMAKE_CURRENT_LIST_DIR}/DatetimelibPackaging.cmake)
