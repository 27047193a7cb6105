# Install rules and the package config: a consumer does
#   find_package(HulCvTools CONFIG REQUIRED)
#   target_link_libraries(app PRIVATE HulCvTools::HulCvTools)
include(CMakePackageConfigHelpers)

install(TARGETS leda HulPlatform HulCvTools
        EXPORT HulCvToolsTargets
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
        RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR}
        INCLUDES DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})

# Headers keep their paths below the repository root, so that installed and
# in-tree code include them the same way ("HulCvTools/Control/...", "platform/leda/...").
install(DIRECTORY ${PROJECT_SOURCE_DIR}/HulCvTools
        DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}
        FILES_MATCHING PATTERN "*.h" PATTERN "*.def")
foreach(_dir leda support icode view transform)
  if(IS_DIRECTORY ${PROJECT_SOURCE_DIR}/platform/${_dir})
    install(DIRECTORY ${PROJECT_SOURCE_DIR}/platform/${_dir}
            DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/platform
            FILES_MATCHING PATTERN "*.h")
  endif()
endforeach()

set(_hul_cmake_dir ${CMAKE_INSTALL_LIBDIR}/cmake/HulCvTools)
install(EXPORT HulCvToolsTargets NAMESPACE HulCvTools:: DESTINATION ${_hul_cmake_dir})
configure_package_config_file(${PROJECT_SOURCE_DIR}/cmake/HulCvToolsConfig.cmake.in
                              ${PROJECT_BINARY_DIR}/HulCvToolsConfig.cmake
                              INSTALL_DESTINATION ${_hul_cmake_dir})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/HulCvToolsConfigVersion.cmake
                                 COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/HulCvToolsConfig.cmake
              ${PROJECT_BINARY_DIR}/HulCvToolsConfigVersion.cmake
        DESTINATION ${_hul_cmake_dir})
