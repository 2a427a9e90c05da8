# find_package(mayascene): the targets and variables for the developer of a host.
#
#   mayascene::hostapi        the headers of the border
#   mayascene::hostutil       the utility library, which host and module share
#   MAYASCENE_IMPORT_MODULE   the file of the import module, for the host to load
#   MAYASCENE_TOOL            the command-line tool
get_filename_component(mayascene_prefix "${CMAKE_CURRENT_LIST_DIR}/../../.." ABSOLUTE)

if(NOT TARGET mayascene::hostapi)
  add_library(mayascene::hostapi INTERFACE IMPORTED)
  target_include_directories(mayascene::hostapi INTERFACE ${mayascene_prefix}/include/mayascene)

  add_library(mayascene::hostutil SHARED IMPORTED)
  set_target_properties(mayascene::hostutil PROPERTIES IMPORTED_LOCATION ${mayascene_prefix}/lib/libhostutil.so
                                                       IMPORTED_SONAME libhostutil.so)
  target_link_libraries(mayascene::hostutil INTERFACE mayascene::hostapi)
endif()

set(MAYASCENE_IMPORT_MODULE ${mayascene_prefix}/lib/MayaImport.so)
set(MAYASCENE_TOOL ${mayascene_prefix}/bin/mayascene)
