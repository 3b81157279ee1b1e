# Colour, MIME and lifecycle tests.
zmt_add_test(color_test SOURCES color/color_test.cpp)
zmt_add_test(mime_types_test SOURCES color/mime_types_test.cpp)
zmt_add_test(initialization_test SOURCES color/initialization_test.cpp)
zmt_add_test(color_concurrency_test SOURCES color/color_concurrency_test.cpp CONCURRENT)
