# Run by CPack once it has built the packages (CPACK_POST_BUILD_SCRIPTS). CPack
# gives a package that holds a shared library a postinst and a postrm that call
# ldconfig; Debian packages leave that to dpkg's ldconfig trigger, which the
# library's package declares in DEBIAN/triggers. This takes the two scripts out
# and rebuilds that package with dpkg-deb.
foreach(file IN LISTS CPACK_PACKAGE_FILES)
  get_filename_component(name "${file}" NAME)
  if(NOT name MATCHES "^${CPACK_DEBIAN_RUNTIME_PACKAGE_NAME}_.*\\.deb$")
    continue()
  endif()
  set(tree "${CPACK_TOPLEVEL_DIRECTORY}/ldconfig_trigger")
  file(REMOVE_RECURSE "${tree}")
  execute_process(COMMAND dpkg-deb -R "${file}" "${tree}" COMMAND_ERROR_IS_FATAL ANY)
  file(REMOVE "${tree}/DEBIAN/postinst" "${tree}/DEBIAN/postrm")
  execute_process(COMMAND dpkg-deb --root-owner-group -b "${tree}" "${file}"
                  OUTPUT_QUIET COMMAND_ERROR_IS_FATAL ANY)
  file(REMOVE_RECURSE "${tree}")
endforeach()
