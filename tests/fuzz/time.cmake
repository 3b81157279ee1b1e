# Time fuzz targets.

# Timecode text read over every display and a set of rates, and written back.
zmt_add_fuzzer(zebmediatypes_timecode_fuzz timecode_fuzz.cpp)
# The JSON readers of TimeDisplay and TimeRange.
zmt_add_fuzzer(zebmediatypes_time_json_fuzz time_json_fuzz.cpp)
