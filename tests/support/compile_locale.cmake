# Compiles one locale for the tests: cmake -DLOCALEDEF=... -DLOCALE=de_DE
# -DOUTPUT_DIR=... -P compile_locale.cmake
#
# localedef exits with 1 when it only warned (some glibc versions warn about
# their own sources) and the locale is still written; only a missing result
# fails the build.
set(target ${OUTPUT_DIR}/${LOCALE}.utf8)
file(MAKE_DIRECTORY ${OUTPUT_DIR})
execute_process(
  COMMAND ${LOCALEDEF} --no-archive -i ${LOCALE} -f UTF-8 ${target}
  RESULT_VARIABLE result
  OUTPUT_QUIET ERROR_VARIABLE errors)
if(NOT (result EQUAL 0 OR result EQUAL 1) OR NOT EXISTS ${target}/LC_TIME)
  message(FATAL_ERROR "localedef ${LOCALE} failed (${result}): ${errors}")
endif()
