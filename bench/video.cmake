# video benchmarks.
