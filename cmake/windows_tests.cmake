# Tests in the Windows builds: GoogleTest compiled from its Debian sources, and each test
# program one CTest test, run whole under Wine (one Wine start per program, not per case).
set(MORVEX_GOOGLETEST_SOURCE_DIR /usr/src/googletest
    CACHE PATH "GoogleTest sources to build with the cross compiler (Debian package googletest)")
if(NOT EXISTS ${MORVEX_GOOGLETEST_SOURCE_DIR}/CMakeLists.txt)
  message(FATAL_ERROR "No GoogleTest sources in ${MORVEX_GOOGLETEST_SOURCE_DIR}: "
                      "install the Debian package googletest")
endif()

set(INSTALL_GTEST OFF CACHE BOOL "" FORCE)
add_subdirectory(${MORVEX_GOOGLETEST_SOURCE_DIR} ${CMAKE_BINARY_DIR}/googletest EXCLUDE_FROM_ALL)
foreach(target gtest gtest_main gmock gmock_main)
  # Third-party code: not held to the project's warnings-as-errors.
  set_target_properties(${target} PROPERTIES COMPILE_OPTIONS "")
  if(NOT TARGET GTest::${target})
    add_library(GTest::${target} ALIAS ${target})
  endif()
endforeach()

include(GoogleTest)

# Replaces GoogleTest's discovery: the program runs once, under Wine, and reports every case.
function(gtest_discover_tests target)
  cmake_parse_arguments(PARSE_ARGV 1 arg "NO_PRETTY_TYPES;NO_PRETTY_VALUES"
                        "WORKING_DIRECTORY;TEST_PREFIX;TEST_SUFFIX;TEST_LIST;DISCOVERY_TIMEOUT;DISCOVERY_MODE;XML_OUTPUT_DIR"
                        "EXTRA_ARGS;PROPERTIES;TEST_FILTER")
  if(NOT arg_WORKING_DIRECTORY)
    set(arg_WORKING_DIRECTORY ${CMAKE_CURRENT_BINARY_DIR})
  endif()
  add_test(NAME ${arg_TEST_PREFIX}${target}${arg_TEST_SUFFIX} COMMAND ${target} ${arg_EXTRA_ARGS}
           WORKING_DIRECTORY ${arg_WORKING_DIRECTORY})
  if(arg_PROPERTIES)
    set_tests_properties(${arg_TEST_PREFIX}${target}${arg_TEST_SUFFIX} PROPERTIES ${arg_PROPERTIES})
  endif()
endfunction()
