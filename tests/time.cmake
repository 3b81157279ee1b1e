# Time tests.

# Ticks and frame rates, ratio times, time displays, time ranges.
zmt_add_test(time_values_test SOURCES
  tick_time_test.cpp
  ratio_time_test.cpp
  time_display_test.cpp
  time_range_test.cpp
)

# Timecode text (the console commands are run through the console program
# below, and from several threads in the concurrency test).
zmt_add_test(zebmediatypes_timecode_tests SOURCES timecode_test.cpp)
zmt_add_test(zebmediatypes_time_commands_concurrency_tests
             SOURCES time_commands_concurrency_test.cpp CONCURRENT)
if(TARGET zebmediatypes-console)
  # The console program run on real input: exit codes, help, what the commands
  # print, lines from standard input until "quit".
  add_test(NAME zebmediatypes_console
           COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/console_test.sh $<TARGET_FILE:zebmediatypes-console>)
  set_tests_properties(zebmediatypes_console PROPERTIES LABELS unit)
endif()
