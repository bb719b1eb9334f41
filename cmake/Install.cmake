# What an installed copy of the library consists of: the shared library, its headers, and the files
# by which CMake and pkg-config find it. Both kinds of file name their places relative to
# themselves, so that an installed tree can be moved.
include(CMakePackageConfigHelpers)

install(TARGETS gmkernel EXPORT gmkernelTargets
    LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}"
    INCLUDES DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}")
install(DIRECTORY "${PROJECT_SOURCE_DIR}/include/gmkernel"
                  "${PROJECT_BINARY_DIR}/include/gmkernel"
    DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}" FILES_MATCHING PATTERN "*.h")
install(FILES "${PROJECT_SOURCE_DIR}/LICENSE" DESTINATION "${CMAKE_INSTALL_DOCDIR}")
set(package_dir "${CMAKE_INSTALL_LIBDIR}/cmake/gmkernel")
install(EXPORT gmkernelTargets NAMESPACE gmkernel:: DESTINATION "${package_dir}")
configure_package_config_file("${CMAKE_CURRENT_LIST_DIR}/gmkernelConfig.cmake.in"
    "${PROJECT_BINARY_DIR}/gmkernelConfig.cmake"
    INSTALL_DESTINATION "${package_dir}" NO_SET_AND_CHECK_MACRO)
write_basic_package_version_file("${PROJECT_BINARY_DIR}/gmkernelConfigVersion.cmake"
    COMPATIBILITY SameMinorVersion)
install(FILES "${PROJECT_BINARY_DIR}/gmkernelConfig.cmake"
              "${PROJECT_BINARY_DIR}/gmkernelConfigVersion.cmake"
    DESTINATION "${package_dir}")

set(pkgconfig_dir "${CMAKE_INSTALL_LIBDIR}/pkgconfig")
file(RELATIVE_PATH GMKERNEL_PC_PREFIX
    "${CMAKE_INSTALL_PREFIX}/${pkgconfig_dir}" "${CMAKE_INSTALL_PREFIX}")
configure_file("${CMAKE_CURRENT_LIST_DIR}/gmkernel.pc.in"
    "${PROJECT_BINARY_DIR}/gmkernel.pc" @ONLY)
install(FILES "${PROJECT_BINARY_DIR}/gmkernel.pc" DESTINATION "${pkgconfig_dir}")
