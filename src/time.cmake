# Time: ticks, frame rates, ratio times, displays, timecode, ranges, console commands.

# Ticks and frame rates, ratio times, time displays, time ranges.
target_sources(zebmediatypes PRIVATE
  tick_time.cpp
  ratio_time.cpp
  time_display.cpp
  time_range.cpp
)

# Timecode text and the console commands.
target_sources(zebmediatypes PRIVATE
  timecode.cpp
  commands/time_commands.cpp
)
