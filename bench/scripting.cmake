# Scripting benchmarks: script calls against the engine's own floor and
# against the native call. The library is linked for its script classes.
zmt_add_benchmark(zebscripting_bench SOURCES scripting_bench.cpp)
target_link_options(zebscripting_bench PRIVATE "LINKER:--no-as-needed")
