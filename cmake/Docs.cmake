# The target "docs": reference pages of the public headers, in docs/html of the build folder.
# A warning of the generator fails the target.
find_package(Doxygen QUIET)
if(DOXYGEN_FOUND)
    configure_file("${PROJECT_SOURCE_DIR}/docs/Doxyfile.in" "${PROJECT_BINARY_DIR}/Doxyfile" @ONLY)
    add_custom_target(docs
        COMMAND "${CMAKE_COMMAND}" -E make_directory "${PROJECT_BINARY_DIR}/docs"
        COMMAND Doxygen::doxygen "${PROJECT_BINARY_DIR}/Doxyfile"
        WORKING_DIRECTORY "${PROJECT_SOURCE_DIR}"
        COMMENT "Reference pages in ${PROJECT_BINARY_DIR}/docs/html"
        VERBATIM)
endif()
