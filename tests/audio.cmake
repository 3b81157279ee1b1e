# Audio tests.

# Channel labels, layouts, layout analysis, conversion matrix.
zmt_add_test(audio_layout_tests SOURCES
  audio_channel_layout_test.cpp
  audio_layout_analysis_test.cpp
  channel_conversion_matrix_test.cpp)

# Formats, channel maps, buses, native rates, descriptions.
