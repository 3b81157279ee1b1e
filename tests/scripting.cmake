# Scripting tests: the host, its JavaScript adapter and the script classes.
zmt_add_script_test(script_time_objects scripting/time_objects_test.js)
