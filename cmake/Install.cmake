# What `cmake --install` installs: tool, module, utility library, the headers of a host, examples and documents;
# tools/mayascene adds manual pages and completions. All parts find one another by relative paths, so that the folder
# can be moved as a whole.
include(CMakePackageConfigHelpers)

set(MAYASCENE_PACKAGE lib/cmake/mayascene)
set(MAYASCENE_SHARE share/mayascene)

set_target_properties(mayascene PROPERTIES INSTALL_RPATH "$ORIGIN/../lib")
set_target_properties(MayaImport PROPERTIES INSTALL_RPATH "$ORIGIN")
install(TARGETS mayascene RUNTIME DESTINATION bin)
install(TARGETS MayaImport hostutil LIBRARY DESTINATION lib)

foreach(room hostapi hostutil)
  install(DIRECTORY ${PROJECT_SOURCE_DIR}/${room} DESTINATION include/mayascene FILES_MATCHING PATTERN "*.h"
          PATTERN "*Internal.h" EXCLUDE)
endforeach()

install(DIRECTORY ${PROJECT_SOURCE_DIR}/examples DESTINATION ${MAYASCENE_SHARE})
install(DIRECTORY ${PROJECT_SOURCE_DIR}/docs DESTINATION ${MAYASCENE_SHARE} PATTERN measurements EXCLUDE)
install(DIRECTORY ${PROJECT_SOURCE_DIR}/addons DESTINATION ${MAYASCENE_SHARE} PATTERN __pycache__ EXCLUDE)
install(FILES README.md CHANGELOG.md SECURITY.md LICENSE DESTINATION ${MAYASCENE_SHARE})

write_basic_package_version_file(${PROJECT_BINARY_DIR}/mayasceneConfigVersion.cmake COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_SOURCE_DIR}/cmake/mayasceneConfig.cmake ${PROJECT_BINARY_DIR}/mayasceneConfigVersion.cmake
        DESTINATION ${MAYASCENE_PACKAGE})
