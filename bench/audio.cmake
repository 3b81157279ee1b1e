# Audio benchmarks.

# Conversion matrix.

# Native rates and descriptions.
zmt_add_benchmark(audio_bench SOURCES audio_bench.cpp)
