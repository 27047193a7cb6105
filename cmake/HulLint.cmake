# The `lint` target: clang-tidy with the repository's .clang-tidy over the library's own
# sources, every finding an error. Defined when clang-tidy is found; HUL_LINT (set by the
# `lint` preset) requires it. The stand-ins, tests, benchmarks and demo are not linted.
if(HUL_LINT)
  find_program(HUL_CLANG_TIDY NAMES clang-tidy clang-tidy-14 REQUIRED)
else()
  find_program(HUL_CLANG_TIDY NAMES clang-tidy clang-tidy-14)
endif()

if(HUL_CLANG_TIDY)
  get_target_property(_hul_lint_sources HulCvTools SOURCES)
  list(FILTER _hul_lint_sources INCLUDE REGEX "\\.cpp$")
  # One clang-tidy per source, so the build tool runs them in parallel and one file's
  # findings never hide another's. clang-tidy reads the build tree's compile commands, so
  # it sees each source with the flags it is built with. The outputs are symbolic: never
  # written, so every build of `lint` checks every source again.
  set(_hul_lint_outputs "")
  foreach(_src IN LISTS _hul_lint_sources)
    file(RELATIVE_PATH _rel ${PROJECT_SOURCE_DIR} ${_src})
    set(_out ${PROJECT_BINARY_DIR}/lint/${_rel}.tidy)
    add_custom_command(OUTPUT ${_out}
      COMMAND ${HUL_CLANG_TIDY} -p ${PROJECT_BINARY_DIR} --quiet --warnings-as-errors=* ${_src}
      WORKING_DIRECTORY ${PROJECT_SOURCE_DIR}
      COMMENT "clang-tidy ${_rel}"
      VERBATIM)
    set_source_files_properties(${_out} PROPERTIES SYMBOLIC ON)
    list(APPEND _hul_lint_outputs ${_out})
  endforeach()
  add_custom_target(lint DEPENDS ${_hul_lint_outputs})
endif()
