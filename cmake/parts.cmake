# parts.txt in the build folder: what libquorvane.so is linked of, for scripts/check-binary --parts. The
# compiler with its target, each object of this house, and the start files of the system that are there.
set(parts "compiler ${CMAKE_CXX_COMPILER}\n")
set(target)
if(CMAKE_CXX_COMPILER_TARGET)
  set(target --target=${CMAKE_CXX_COMPILER_TARGET})
  string(APPEND parts "compiler ${target}\n")
endif()
string(APPEND parts "own $<JOIN:$<TARGET_OBJECTS:gateway_objects>,\nown >\n")

foreach(name crti.o crtbeginS.o crtendS.o crtn.o crtbegin_so.o crtend_so.o)
  execute_process(COMMAND ${CMAKE_CXX_COMPILER} ${target} -print-file-name=${name}
                  OUTPUT_VARIABLE path OUTPUT_STRIP_TRAILING_WHITESPACE)
  if(IS_ABSOLUTE "${path}")
    string(APPEND parts "start ${path}\n")
  endif()
endforeach()
file(GENERATE OUTPUT ${CMAKE_BINARY_DIR}/parts.txt CONTENT "${parts}")
