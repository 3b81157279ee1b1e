# Time tests.

# Ticks and frame rates, ratio times, time displays, time ranges.
zmt_add_test(time_values_test SOURCES
  tick_time_test.cpp
  ratio_time_test.cpp
  time_display_test.cpp
  time_range_test.cpp
)

# Timecode text and the console commands.
zmt_add_test(zebmediatypes_timecode_tests SOURCES timecode_test.cpp time_commands_test.cpp)
if(TARGET zebmediatypes-console)
  # The console program run on real input: exit codes, help, one command from
  # the command line, lines from standard input until "quit".
  add_test(NAME zebmediatypes_console
           COMMAND bash ${CMAKE_CURRENT_SOURCE_DIR}/console_test.sh $<TARGET_FILE:zebmediatypes-console>)
  set_tests_properties(zebmediatypes_console PROPERTIES LABELS unit)
endif()
