# video benchmarks.
pkg_check_modules(AVUTIL REQUIRED IMPORTED_TARGET libavutil)
zmt_add_benchmark(video_bench SOURCES video_bench.cpp LIBS PkgConfig::AVUTIL)
