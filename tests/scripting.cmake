# Scripting tests: the host, its JavaScript adapter and the script classes.
zmt_add_script_test(script_time_objects scripting/time_objects_test.js)
zmt_add_test(zebscripting_host_test SOURCES scripting/host_test.cpp)

# The audio, video and colour classes: script tables and edge cases, native
# tables, definitions and lifetimes, and the held layout under threads.
zmt_add_script_test(script_audio_objects scripting/audio_objects_test.js)
zmt_add_script_test(script_video_objects scripting/video_objects_test.js)
zmt_add_test(zebmediatypes_script_objects_test SOURCES scripting/media_objects_test.cpp)
zmt_add_test(zebmediatypes_script_objects_concurrency_test
             SOURCES scripting/audio_objects_concurrency_test.cpp CONCURRENT)
