# Time: ticks, frame rates, ratio times, displays, timecode, ranges, console commands.
target_sources(zebmediatypes PRIVATE
  tick_time.cpp
  commands/time_commands.cpp
)
