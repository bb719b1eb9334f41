# What an installed copy consists of: the shared libraries, their headers, and for each of them the
# files by which CMake and pkg-config find it. Both kinds of file name their places relative to
# themselves, so that an installed tree can be moved.
include(CMakePackageConfigHelpers)

set(pkgconfig_dir "${CMAKE_INSTALL_LIBDIR}/pkgconfig")
file(RELATIVE_PATH PACKAGE_PC_PREFIX
    "${CMAKE_INSTALL_PREFIX}/${pkgconfig_dir}" "${CMAKE_INSTALL_PREFIX}")

# A library as a package of its own, with the target <name>::<name>.
function(gmkernel_install_package name)
    install(TARGETS ${name} EXPORT ${name}Targets
        LIBRARY DESTINATION "${CMAKE_INSTALL_LIBDIR}"
        INCLUDES DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}")
    install(DIRECTORY "${PROJECT_SOURCE_DIR}/include/${name}"
                      "${PROJECT_BINARY_DIR}/include/${name}"
        DESTINATION "${CMAKE_INSTALL_INCLUDEDIR}" FILES_MATCHING PATTERN "*.h")
    set(package_dir "${CMAKE_INSTALL_LIBDIR}/cmake/${name}")
    install(EXPORT ${name}Targets NAMESPACE ${name}:: DESTINATION "${package_dir}")
    configure_package_config_file("${PROJECT_SOURCE_DIR}/cmake/${name}Config.cmake.in"
        "${PROJECT_BINARY_DIR}/${name}Config.cmake"
        INSTALL_DESTINATION "${package_dir}" NO_SET_AND_CHECK_MACRO)
    write_basic_package_version_file("${PROJECT_BINARY_DIR}/${name}ConfigVersion.cmake"
        COMPATIBILITY SameMinorVersion)
    install(FILES "${PROJECT_BINARY_DIR}/${name}Config.cmake"
                  "${PROJECT_BINARY_DIR}/${name}ConfigVersion.cmake"
        DESTINATION "${package_dir}")
    configure_file("${PROJECT_SOURCE_DIR}/cmake/${name}.pc.in"
        "${PROJECT_BINARY_DIR}/${name}.pc" @ONLY)
    install(FILES "${PROJECT_BINARY_DIR}/${name}.pc" DESTINATION "${pkgconfig_dir}")
endfunction()

gmkernel_install_package(gmkernel)
gmkernel_install_package(gmregion)
gmkernel_install_package(gmbridge)
install(FILES "${PROJECT_SOURCE_DIR}/LICENSE" DESTINATION "${CMAKE_INSTALL_DOCDIR}")
