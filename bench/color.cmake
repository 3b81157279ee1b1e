# color benchmarks.
