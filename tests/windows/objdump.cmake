# Writes `objdump -p` of a DLL to a file, for the checks to read: cmake -DOBJDUMP=<tool>
# -DDLL=<dll> -DOUTPUT=<file> -P objdump.cmake
if(NOT EXISTS "${DLL}")
  message(FATAL_ERROR "${DLL} does not exist: build it first (make windows)")
endif()
execute_process(COMMAND "${OBJDUMP}" -p "${DLL}" OUTPUT_FILE "${OUTPUT}" RESULT_VARIABLE status)
if(NOT status EQUAL 0)
  message(FATAL_ERROR "${OBJDUMP} -p ${DLL} failed: ${status}")
endif()
