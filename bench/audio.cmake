# audio benchmarks.
