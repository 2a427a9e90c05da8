# The options of all targets.

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

# bin/ holds the tool, lib/ the utility library and the module; they find each other by relative paths.
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)
set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)

# Options for all code, for the product, and for the tests.
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
# Tests are compiled more often than run, so compiling them without optimisation takes less time in all.
target_compile_options(mayascene_test_options INTERFACE -O0)
# 1 under the sanitizers, where long tests do only a part of their work.
target_compile_definitions(mayascene_test_options INTERFACE MAYASCENE_SANITIZED=$<BOOL:${MAYASCENE_SANITIZE}>)
if(MAYASCENE_SANITIZE)
  # "function" checks a call through a pointer by the address of a type's description. Every shared library has a copy
  # of its own, so it would report each call across the border.
  set(MAYASCENE_SANITIZERS -fsanitize=address,undefined,float-cast-overflow -fno-sanitize-recover=all
                           $<$<CXX_COMPILER_ID:Clang>:-fno-sanitize=function>)
  target_compile_options(mayascene_options INTERFACE ${MAYASCENE_SANITIZERS} -fno-omit-frame-pointer)
  # The tests' own code has only the checks that find bad reads and writes, and bad arithmetic in inline functions of
  # the product. It compiles faster without the others.
  target_compile_options(
    mayascene_test_options
    INTERFACE -fsanitize=address,float-cast-overflow,signed-integer-overflow,shift,integer-divide-by-zero,bounds
              -fno-sanitize-recover=all
              -fno-omit-frame-pointer)
  target_link_options(mayascene_common_options INTERFACE ${MAYASCENE_SANITIZERS})
endif()
if(MAYASCENE_COVERAGE)
  # Only these are compiled with counters (see add_room); every program that links them writes the counts.
  set(MAYASCENE_MEASURED_ROOMS scan hostutil plugin_services plugin_entry MayaImport maya comp)
  target_link_options(mayascene_common_options INTERFACE --coverage)
endif()
if(MAYASCENE_FUZZ)
  # "function" is left out as above. Comparisons are not traced: the dictionary and the mutator know the words, and
  # without tracing there are twice as many runs.
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
