# zebcore fuzz targets.
zmt_add_fuzzer(zebcore_json_fuzzer zebcore_json_fuzzer.cpp)
