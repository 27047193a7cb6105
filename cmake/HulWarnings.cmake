# hul_set_warnings(<target>): the project's warning set, as errors when HUL_WERROR is on.
function(hul_set_warnings target)
  target_compile_options(${target} PRIVATE -Wall -Wextra -Wpedantic)
  if(HUL_WERROR)
    target_compile_options(${target} PRIVATE -Werror)
  endif()
endfunction()
