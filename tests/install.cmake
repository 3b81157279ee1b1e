# The README's example, and the installed package used from a moved prefix.

# Every README block marked with a file's path is that file's text, so the
# example cannot go stale: the consumer below is what the README shows.
add_test(NAME readme_example
         COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/readme_example_test.sh ${PROJECT_SOURCE_DIR})
set_tests_properties(readme_example PROPERTIES LABELS unit)

# Installs into a scratch prefix, moves it, runs the console program from it
# with no environment set, and builds and runs tests/consumer against it. Not
# in sanitizer or fuzzer builds: the consumer is built without their runtimes.
if(TARGET zebmediatypes-console AND NOT ZMT_SANITIZE AND NOT ZMT_BUILD_FUZZERS)
  add_test(NAME installed_package
           COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/install_test.sh ${PROJECT_BINARY_DIR}
                   ${PROJECT_SOURCE_DIR} ${CMAKE_CXX_COMPILER} ${CMAKE_INSTALL_BINDIR}
                   ${CMAKE_INSTALL_LIBDIR})
  set_tests_properties(installed_package PROPERTIES LABELS install)
endif()
