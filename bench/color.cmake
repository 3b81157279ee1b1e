# color benchmarks.
zmt_add_benchmark(color_bench SOURCES color_bench.cpp)
