# time benchmarks.
