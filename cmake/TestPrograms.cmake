# The helpers for the programs of the tests.

# set_test_options(NAME): the options and definitions of every test program.
function(set_test_options name)
  target_link_libraries(${name} PRIVATE mayascene_test_options GTest::gmock)
  target_compile_definitions(
    ${name}
    PRIVATE MAYASCENE_SOURCE_DIR="${PROJECT_SOURCE_DIR}" MAYASCENE_TOOL="$<TARGET_FILE:mayascene>"
            MAYASCENE_MODULE="$<TARGET_FILE:MayaImport>")
endfunction()

# share_test_headers(NAME): gives a library of tests the precompiled headers of the test programs, and compiles it like
# them, for a program and not for a shared library.
function(share_test_headers name)
  set_test_options(${name})
  set_target_properties(${name} PROPERTIES POSITION_INDEPENDENT_CODE OFF)
  target_compile_options(${name} PRIVATE -fPIE)
  target_precompile_headers(${name} REUSE_FROM test_headers)
endfunction()

# add_room_test(NAME [ALONE] SOURCES ... [LINKS ...]): one GoogleTest program; each of its tests is a test of ctest. The
# headers that all test sources include are compiled once, for all programs. ALONE: the test runs neither tool nor module.
function(add_room_test name)
  cmake_parse_arguments(TEST "ALONE" "" "SOURCES;LINKS" ${ARGN})
  add_executable(${name} ${TEST_SOURCES})
  target_link_libraries(${name} PRIVATE ${TEST_LINKS} GTest::gmock_main)
  set_test_options(${name})
  target_precompile_headers(${name} REUSE_FROM test_headers)
  if(NOT TEST_ALONE)
    add_dependencies(${name} mayascene MayaImport)
  endif()
  gtest_discover_tests(${name} PROPERTIES TIMEOUT 300)
endfunction()
