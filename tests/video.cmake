# Video format tests.
zmt_add_test(video_tests SOURCES
  pixel_format_test.cpp
  pixel_format_selection_test.cpp
  pixel_aspect_ratio_test.cpp
  video_descriptions_test.cpp
)
zmt_add_test(video_registry_threads_tests SOURCES pixel_format_registry_threads_test.cpp CONCURRENT)
