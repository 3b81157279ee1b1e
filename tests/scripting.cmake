# Scripting tests: the host, its JavaScript adapter and the script classes.
zmt_add_script_test(script_time_objects scripting/time_objects_test.js)
zmt_add_script_test(script_media_objects scripting/media_objects_test.js)
zmt_add_test(zebscripting_host_test SOURCES scripting/host_test.cpp)
zmt_add_test(zebmediatypes_script_objects_test SOURCES scripting/media_objects_test.cpp)
zmt_add_test(zebscripting_storm_test SOURCES scripting/binding_storm_test.cpp)
if(TARGET zebscripting_storm_test)
  target_link_options(zebscripting_storm_test PRIVATE "LINKER:--no-as-needed")
  target_compile_definitions(zebscripting_storm_test
                             PRIVATE ZMT_SCRIPT_TEST_DIR="${CMAKE_CURRENT_SOURCE_DIR}/scripting")
endif()
# Contexts and the held layout of "AudioFormat" under threads.
zmt_add_test(zebscripting_concurrency_test SOURCES scripting/concurrency_test.cpp CONCURRENT)
if(TARGET zebmediatypes-script AND NOT ZMT_CONCURRENCY_TESTS_ONLY)
  # The runner on real input: output, error lines, exit codes, the example.
  add_test(NAME zebmediatypes_script_runner
           COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/scripting/script_runner_test.sh
                   $<TARGET_FILE:zebmediatypes-script> ${PROJECT_SOURCE_DIR}/tools/examples)
  set_tests_properties(zebmediatypes_script_runner PROPERTIES LABELS unit)
endif()
