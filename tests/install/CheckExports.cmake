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
foreach(_forbidden " leda::" " std::" "hulcv_detail" " WmCXString::" " KvCMessageServer::"
                   " KvCOptionValueStorage::" " KV_Dump::" "KvCDebugWmCXString")
  string(FIND "${_symbols}" "${_forbidden}" _at)
  if(NOT _at EQUAL -1)
    message(FATAL_ERROR "exported but internal: '${_forbidden}'")
  endif()
endforeach()
