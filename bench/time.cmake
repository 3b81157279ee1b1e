# Time benchmarks.

# Ticks and frame rates.
zmt_add_benchmark(tick_time_bench SOURCES tick_time_bench.cpp)

# Timecode text.
# libavutil runs beside ours as the peer; it is a benchmark-only dependency.
pkg_check_modules(AVUTIL REQUIRED IMPORTED_TARGET libavutil)
zmt_add_benchmark(zebmediatypes_timecode_bench SOURCES timecode_bench.cpp LIBS PkgConfig::AVUTIL)
