# The base library of wxWidgets, without its user interface, as the target wxBase::wxBase.
#
# The toolkit's own find module asks for a whole build, user interface included; wx-config tells
# the flags of the base library alone.
find_program(wxBase_CONFIG_EXECUTABLE NAMES wx-config)
mark_as_advanced(wxBase_CONFIG_EXECUTABLE)

if(wxBase_CONFIG_EXECUTABLE)
    foreach(what IN ITEMS version cxxflags libs)
        set(component base)
        if(what STREQUAL "version")
            set(component "")
        endif()
        execute_process(COMMAND "${wxBase_CONFIG_EXECUTABLE}" --${what} ${component}
            OUTPUT_VARIABLE wxBase_${what} OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET)
    endforeach()
    set(wxBase_VERSION "${wxBase_version}")
endif()

include(FindPackageHandleStandardArgs)
find_package_handle_standard_args(wxBase
    REQUIRED_VARS wxBase_CONFIG_EXECUTABLE wxBase_cxxflags wxBase_libs
    VERSION_VAR wxBase_VERSION)

if(wxBase_FOUND AND NOT TARGET wxBase::wxBase)
    separate_arguments(compile_flags UNIX_COMMAND "${wxBase_cxxflags}")
    separate_arguments(link_flags UNIX_COMMAND "${wxBase_libs}")
    set(include_dirs "${compile_flags}")
    list(FILTER include_dirs INCLUDE REGEX "^-I")
    list(TRANSFORM include_dirs REPLACE "^-I" "")
    list(FILTER compile_flags EXCLUDE REGEX "^-I")

    add_library(wxBase::wxBase INTERFACE IMPORTED)
    set_target_properties(wxBase::wxBase PROPERTIES
        INTERFACE_INCLUDE_DIRECTORIES "${include_dirs}"
        INTERFACE_COMPILE_OPTIONS "${compile_flags}"
        INTERFACE_LINK_LIBRARIES "${link_flags}")
endif()
