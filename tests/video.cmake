# Video format tests.
zmt_add_test(video_tests SOURCES
  pixel_format_test.cpp
  pixel_format_selection_test.cpp
  pixel_aspect_ratio_test.cpp
  video_descriptions_test.cpp
)
if(TARGET video_tests)
  # Plane layouts and frame sizes are checked against libavutil's images.
  find_package(PkgConfig REQUIRED)
  pkg_check_modules(AVUTIL REQUIRED IMPORTED_TARGET libavutil)
  target_link_libraries(video_tests PRIVATE PkgConfig::AVUTIL)
endif()
zmt_add_test(video_registry_threads_tests SOURCES pixel_format_registry_threads_test.cpp CONCURRENT)
