# Runs `morvex` once and compares what it wrote and its exit status with the expected.
#
#   -DMORVEX=program -DLIBRARY=extension [-DRUNNER=emulator]   (RUNNER runs a cross-built
#                                program: Wine for the Windows build)
#   -DSHEET=folder/NAME.events   plays the sheet from its folder; expects NAME.out, NAME.err
#                                and the sheet's "#! args: ..." and "#! status: N" lines
#   -DARGS=a;b;c -DEXPECTED=base runs `morvex a b c`; expects base.out, base.err, base.status
#
# A missing .out or .err file expects that stream to be empty; a missing status expects 0.
cmake_minimum_required(VERSION 3.25)

function(read_expected file into)
  if(EXISTS ${file})
    file(READ ${file} text)
  else()
    set(text "")
  endif()
  set(${into} "${text}" PARENT_SCOPE)
endfunction()

set(expected_status 0)
if(DEFINED SHEET)
  get_filename_component(folder ${SHEET} DIRECTORY)
  get_filename_component(name ${SHEET} NAME)
  get_filename_component(base ${SHEET} NAME_WE)
  set(base ${folder}/${base})
  set(arguments play ${name})
  file(STRINGS ${SHEET} header REGEX "^#! ")
  foreach(entry IN LISTS header)
    if(entry MATCHES "^#! args: *(.*)$")
      separate_arguments(extra UNIX_COMMAND "${CMAKE_MATCH_1}")
      list(APPEND arguments ${extra})
    elseif(entry MATCHES "^#! status: *([0-9]+)")
      set(expected_status ${CMAKE_MATCH_1})
    endif()
  endforeach()
else()
  set(folder ${CMAKE_CURRENT_BINARY_DIR})
  set(base ${EXPECTED})
  set(arguments ${ARGS})
  if(EXISTS ${base}.status)
    file(STRINGS ${base}.status expected_status LIMIT_COUNT 1)
  endif()
endif()
read_expected(${base}.out expected_out)
read_expected(${base}.err expected_err)

set(ENV{MORVEX_LIBRARY} ${LIBRARY})
execute_process(COMMAND ${RUNNER} ${MORVEX} ${arguments}
                WORKING_DIRECTORY ${folder}
                RESULT_VARIABLE status
                OUTPUT_VARIABLE out
                ERROR_VARIABLE err)
# A Windows program writes its lines ending in CR LF.
if(MORVEX MATCHES "\\.exe$")
  string(REPLACE "\r\n" "\n" out "${out}")
  string(REPLACE "\r\n" "\n" err "${err}")
endif()

set(failed FALSE)
if(NOT "${status}" STREQUAL "${expected_status}")
  message(SEND_ERROR "exit status ${status}, expected ${expected_status}")
  set(failed TRUE)
endif()
if(NOT out STREQUAL expected_out)
  message(SEND_ERROR "standard output differs.\n--- expected\n${expected_out}--- got\n${out}---")
  set(failed TRUE)
endif()
if(NOT err STREQUAL expected_err)
  message(SEND_ERROR "standard error differs.\n--- expected\n${expected_err}--- got\n${err}---")
  set(failed TRUE)
endif()
if(failed)
  message(FATAL_ERROR "morvex ${arguments} (in ${folder}) did not give what was expected")
endif()
