# Scripting fuzz targets.

# Fuzz-built scripts (and the script tests as seeds) against every registered
# script class. The library is linked for its classes' registrars.
zmt_add_fuzzer(zebscripting_script_fuzz script_fuzz.cpp)
target_link_options(zebscripting_script_fuzz PRIVATE "LINKER:--no-as-needed")
