# zmt_set_warnings(<target>): the project's warning set, errors when ZMT_WERROR.
function(zmt_set_warnings target)
  target_compile_options(${target} PRIVATE -Wall -Wextra -Wconversion -Wshadow
                         $<$<BOOL:${ZMT_WERROR}>:-Werror>)
endfunction()
