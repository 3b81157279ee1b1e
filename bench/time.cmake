# Time benchmarks.

# Ticks and frame rates.

# Timecode text.
