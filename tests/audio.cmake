# Audio tests.

# Channel labels, layouts, layout analysis, conversion matrix.
zmt_add_test(audio_layout_tests SOURCES
  audio_channel_layout_test.cpp
  audio_layout_analysis_test.cpp
  channel_conversion_matrix_test.cpp)
zmt_add_test(audio_layout_concurrency_tests SOURCES audio_layout_concurrency_test.cpp CONCURRENT)

# Formats, channel maps, buses, native rates, descriptions.
