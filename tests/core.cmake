# zebcore tests.
zmt_add_test(zebcore_test SOURCES
  zebcore_string_test.cpp
  zebcore_json_test.cpp
  zebcore_guid_test.cpp
  zebcore_services_test.cpp)
zmt_add_test(zebcore_concurrency_test SOURCES zebcore_concurrency_test.cpp CONCURRENT)
