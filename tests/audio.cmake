# Audio tests.

# Channel labels, layouts, layout analysis, conversion matrix.
zmt_add_test(audio_layout_tests SOURCES
  audio_channel_layout_test.cpp
  audio_layout_analysis_test.cpp
  channel_conversion_matrix_test.cpp)
zmt_add_test(audio_layout_concurrency_tests SOURCES audio_layout_concurrency_test.cpp CONCURRENT)

# Formats, channel maps, buses, native rates, descriptions.
zmt_add_test(audio_formats_tests SOURCES
  audio_format_test.cpp
  channel_map_test.cpp
  audio_bus_test.cpp
  audio_frame_rate_utils_test.cpp
  audio_descriptions_test.cpp
)
zmt_add_test(audio_descriptions_concurrency_tests SOURCES
  audio_descriptions_concurrency_test.cpp
  CONCURRENT
)
