# Time tests.

# Ticks and frame rates, ratio times, time displays, time ranges.

# Timecode text and the console commands.
