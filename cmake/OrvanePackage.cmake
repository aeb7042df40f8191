# The installed package: include/ (the layer's MFC-named headers, and the library's public
# headers in include/OrvaneControls), bin/ (the DLLs), lib/ (import libraries and the
# entry-point library) and lib/cmake/OrvaneControls, which lets a host write
#   find_package(OrvaneControls REQUIRED)
#   target_link_libraries(MyApp PRIVATE OrvaneControls::AfxMain OrvaneControls::Controls)
# The targets of the export set are installed by the folders that define them.
include(CMakePackageConfigHelpers)

install(EXPORT OrvaneControlsTargets
  NAMESPACE OrvaneControls::
  DESTINATION ${ORVANE_INSTALL_CMAKEDIR})
configure_package_config_file(${CMAKE_CURRENT_LIST_DIR}/OrvaneControlsConfig.cmake.in
  ${CMAKE_BINARY_DIR}/package/OrvaneControlsConfig.cmake
  INSTALL_DESTINATION ${ORVANE_INSTALL_CMAKEDIR})
write_basic_package_version_file(${CMAKE_BINARY_DIR}/package/OrvaneControlsConfigVersion.cmake
  VERSION ${PROJECT_VERSION}
  COMPATIBILITY SameMajorVersion)
install(FILES
  ${CMAKE_BINARY_DIR}/package/OrvaneControlsConfig.cmake
  ${CMAKE_BINARY_DIR}/package/OrvaneControlsConfigVersion.cmake
  DESTINATION ${ORVANE_INSTALL_CMAKEDIR})

# The SDK archive: the installed tree as one ZIP, made by
#   cmake --build build --target package
# (build/OrvaneControls-<version>-win64.zip).
set(CPACK_GENERATOR ZIP)
set(CPACK_PACKAGE_NAME OrvaneControls)
set(CPACK_PACKAGE_VENDOR OrvaneControls)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "Windows user-interface controls for C++ host applications")
set(CPACK_PACKAGE_FILE_NAME OrvaneControls-${PROJECT_VERSION}-win64)
set(CPACK_VERBATIM_VARIABLES ON)
include(CPack)
