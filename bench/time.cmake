# Time benchmarks.

# Ticks and frame rates.
zmt_add_benchmark(tick_time_bench SOURCES tick_time_bench.cpp)

# Timecode text.
