# Audio tests.

# Channel labels, layouts, layout analysis, conversion matrix.
zmt_add_test(audio_layout_tests SOURCES
  audio_channel_layout_test.cpp
  audio_layout_analysis_test.cpp
  channel_conversion_matrix_test.cpp)
# First use of the supported set and the named-layout descriptions from many threads.
zmt_add_test(audio_layout_concurrency_tests SOURCES audio_layout_concurrency_test.cpp CONCURRENT)

# Formats, buses, native rates, channel maps, descriptions.
zmt_add_test(audio_formats_tests SOURCES
  audio_format_test.cpp
  channel_map_test.cpp
  audio_descriptions_test.cpp
)

# The down-mix, checked against libswresample's matrix builder.
find_package(PkgConfig REQUIRED)
pkg_check_modules(SWRESAMPLE REQUIRED IMPORTED_TARGET libswresample libavutil)
zmt_add_test(audio_downmix_tests SOURCES downmix_matrix_test.cpp)
if(TARGET audio_downmix_tests)
  target_link_libraries(audio_downmix_tests PRIVATE PkgConfig::SWRESAMPLE)
endif()
