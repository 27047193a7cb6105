# Checks the dynamic symbol table of libHulCvTools: the control operations are
# exported, while container instantiations, stand-in services and the library's own
# helpers are not.
execute_process(COMMAND nm -DC --defined-only ${HUL_LIBRARY}
                OUTPUT_VARIABLE _symbols RESULT_VARIABLE _result)
if(NOT _result EQUAL 0)
  message(FATAL_ERROR "nm failed on ${HUL_LIBRARY}")
endif()
foreach(_required "KvCCvToolsControl::boot(KvCOptionValueStorage*)"
                  "KvCCvToolsControl::shutdown()"
                  "KvCCvToolsOptionsInterface::boot(KvCOptionValueStorage*)")
  string(FIND "${_symbols}" "${_required}" _at)
  if(_at EQUAL -1)
    message(FATAL_ERROR "not exported: ${_required}")
  endif()
endforeach()
# Symbols are checked line by line: "<address> <type> <name>".
string(REPLACE "\n" ";" _lines "${_symbols}")
foreach(_line IN LISTS _lines)
  string(REGEX REPLACE "^[0-9a-f]+ [A-Za-z] " "" _name "${_line}")
  # The call graphs' graph type is exported on purpose; no other container code is.
  if(_name MATCHES "^leda::" AND NOT _name MATCHES "^leda::GRAPH<KvCFcgFunctionInfo\\*, KvCFcgEdgeInfo\\*>")
    message(FATAL_ERROR "exported container internals: ${_name}")
  endif()
  foreach(_forbidden "hulcv_detail" "WmCXString::" "KvCMessageServer::"
                     "KvCOptionValueStorage::" "KV_Dump::" "KvCDebugWmCXString"
                     "KvCSubtreeWalk" "KvCELocDB" "KvCCvStructToolImpl")
    string(FIND "${_name}" "${_forbidden}" _at)
    if(_at EQUAL 0)
      message(FATAL_ERROR "exported but internal: ${_name}")
    endif()
  endforeach()
endforeach()
