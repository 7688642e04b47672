# Fails when the shared library asks for static TLS: a host that dlopens it after
# other such libraries could then fail with "cannot allocate memory in static TLS
# block".
#   cmake -DREADELF=<readelf> -DLIBRARY=<libdatetimelib.so> -P check_library.cmake
execute_process(COMMAND ${READELF} -d ${LIBRARY} OUTPUT_VARIABLE dynamic
                RESULT_VARIABLE failed)
if(failed)
  message(FATAL_ERROR "${READELF} -d ${LIBRARY} failed")
endif()
if(dynamic MATCHES "STATIC_TLS")
  message(FATAL_ERROR "${LIBRARY} carries the STATIC_TLS flag")
endif()
