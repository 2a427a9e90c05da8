# The helper for the libraries of the product.

# add_room(NAME KIND SOURCES ... [LINKS ...]): one library of the product. KIND is STATIC, SHARED or MODULE.
function(add_room name kind)
  cmake_parse_arguments(ROOM "" "" "SOURCES;LINKS" ${ARGN})
  add_library(${name} ${kind} ${ROOM_SOURCES})
  target_link_libraries(${name} PUBLIC ${ROOM_LINKS} PRIVATE $<BUILD_INTERFACE:mayascene_options>)
  target_include_directories(${name} PUBLIC ${PROJECT_SOURCE_DIR})
  if(MAYASCENE_COVERAGE AND name IN_LIST MAYASCENE_MEASURED_ROOMS)
    # Every source gets its own copies of inline functions and templates: of shared ones the linker keeps a single copy,
    # and the others would count as never run. The compiler would warn about each copy.
    target_compile_options(${name} PRIVATE --coverage -fno-weak -w)
  endif()
endfunction()
