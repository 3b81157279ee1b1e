# Time tests.

# Ticks and frame rates, ratio times, time displays, time ranges.
zmt_add_test(time_values_test SOURCES
  tick_time_test.cpp
  ratio_time_test.cpp
  time_display_test.cpp
  time_range_test.cpp
)

# Timecode text and the console commands.
