# What every target is built with.

set(CMAKE_C_STANDARD 11)
set(CMAKE_C_STANDARD_REQUIRED ON)
set(CMAKE_C_EXTENSIONS OFF)
set(CMAKE_CXX_STANDARD 20)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
set(CMAKE_C_VISIBILITY_PRESET hidden)
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)

option(MAYASCENE_SANITIZE "Build with the address, leak and undefined behaviour sanitizers" OFF)
option(MAYASCENE_COVERAGE "Build for line and branch coverage" OFF)
option(MAYASCENE_FUZZ "Build the fuzz targets as fuzzers, with the integer sanitizers too; needs clang" OFF)

# bin/ holds the tool, lib/ the utility library and the module; they find each other from where they lie.
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)
set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)

# What all code is compiled with, the code under test, and the tests.
add_library(mayascene_common_options INTERFACE)
add_library(mayascene_options INTERFACE)
add_library(mayascene_test_options INTERFACE)
target_link_libraries(mayascene_options INTERFACE mayascene_common_options)
target_link_libraries(mayascene_test_options INTERFACE mayascene_common_options)
target_include_directories(mayascene_common_options INTERFACE ${PROJECT_SOURCE_DIR})
target_compile_options(
  mayascene_common_options
  INTERFACE -Wall
            -Wextra
            -Wconversion
            -Wshadow
            # Arithmetic gives the same bits on every processor.
            -ffp-contract=off)
# Tests are compiled more often than run: not to optimise them is the faster way to know.
target_compile_options(mayascene_test_options INTERFACE -O0)
# 1 under the sanitizers, where what takes long is done in part; the other builds do all of it.
target_compile_definitions(mayascene_test_options INTERFACE MAYASCENE_SANITIZED=$<BOOL:${MAYASCENE_SANITIZE}>)
if(MAYASCENE_SANITIZE)
  # "function" checks a call through a pointer by the address of a type's description, of which every shared library has
  # its own: it would take each call across the border for a wrong one.
  set(MAYASCENE_SANITIZERS -fsanitize=address,undefined,float-cast-overflow -fno-sanitize-recover=all
                           $<$<CXX_COMPILER_ID:Clang>:-fno-sanitize=function>)
  target_compile_options(mayascene_options INTERFACE ${MAYASCENE_SANITIZERS} -fno-omit-frame-pointer)
  # The tests' own code has those that see a bad read or write in either and bad arithmetic in inline functions,
  # and compiles faster so.
  target_compile_options(
    mayascene_test_options
    INTERFACE -fsanitize=address,float-cast-overflow,signed-integer-overflow,shift,integer-divide-by-zero,bounds
              -fno-sanitize-recover=all
              -fno-omit-frame-pointer)
  target_link_options(mayascene_common_options INTERFACE ${MAYASCENE_SANITIZERS})
endif()
if(MAYASCENE_COVERAGE)
  # Only these are compiled with counters (see add_room); whatever they are linked into writes them down.
  set(MAYASCENE_MEASURED_ROOMS scan hostutil plugin_services plugin_entry MayaImport maya comp)
  target_link_options(mayascene_common_options INTERFACE --coverage)
endif()
if(MAYASCENE_FUZZ)
  # "function" is left out as above. Comparisons are not traced: the dictionary and the mutator know the words, and
  # tracing takes half of the runs.
  target_compile_options(
    mayascene_options
    INTERFACE -fsanitize=fuzzer-no-link,address,undefined,float-cast-overflow,integer
              -fno-sanitize=function
              -fno-sanitize-recover=all
              -fno-sanitize-coverage=trace-cmp
              -fsanitize-ignorelist=${PROJECT_SOURCE_DIR}/fuzz/sanitizer_ignorelist.txt
              -fsanitize-coverage-ignorelist=${PROJECT_SOURCE_DIR}/fuzz/coverage_ignorelist.txt
              -fno-omit-frame-pointer
              -gline-tables-only)
  target_link_options(mayascene_options INTERFACE
                      -fsanitize=fuzzer-no-link,address,undefined,float-cast-overflow,integer)
endif()
