# Installs the built project into a fresh prefix, then configures, builds and runs a
# separate project that finds the package with find_package(HulCvTools CONFIG REQUIRED).
file(REMOVE_RECURSE ${HUL_WORK_DIR})
set(_prefix ${HUL_WORK_DIR}/prefix)
set(_build ${HUL_WORK_DIR}/build)

function(hul_run)
  execute_process(COMMAND ${ARGV} RESULT_VARIABLE _result)
  if(NOT _result EQUAL 0)
    message(FATAL_ERROR "failed (${_result}): ${ARGV}")
  endif()
endfunction()

set(_flags "")
if(HUL_SANITIZE)
  set(_flags "-fsanitize=address,undefined -fno-sanitize-recover=all")
endif()

hul_run(${CMAKE_COMMAND} --install ${HUL_BUILD_DIR} --prefix ${_prefix})
hul_run(${CMAKE_COMMAND} -S ${HUL_CONSUMER_SOURCE_DIR} -B ${_build} -G ${HUL_GENERATOR}
        -DCMAKE_PREFIX_PATH=${_prefix} -DCMAKE_CXX_FLAGS=${_flags})
hul_run(${CMAKE_COMMAND} --build ${_build})
hul_run(${_build}/consumer)
