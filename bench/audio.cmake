# Audio benchmarks.

# Conversion matrix.
pkg_check_modules(SWR REQUIRED IMPORTED_TARGET libswresample libavutil)
zmt_add_benchmark(channel_conversion_matrix_bench
  SOURCES channel_conversion_matrix_bench.cpp
  LIBS PkgConfig::SWR)

# Native rates and descriptions.
zmt_add_benchmark(audio_bench SOURCES audio_bench.cpp)
