# Installing: libraries, what they hand out, and how CMake and pkg-config find them.
include(CMakePackageConfigHelpers)
set(zandor_package_folder ${CMAKE_INSTALL_LIBDIR}/cmake/Zandor)

# Called by zandor_library: HEADERS are the folders of its houses, NEEDS what it links publicly,
# LIBS what a static one is linked with.
function(zandor_install name target generated)
    cmake_parse_arguments(PARSE_ARGV 3 given "" "" "HEADERS;NEEDS;LIBS")
    install(TARGETS ${target} EXPORT Zandor${name}Targets
        RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT runtime
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT runtime
            NAMELINK_COMPONENT development
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT development
        INCLUDES DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
    install(EXPORT Zandor${name}Targets NAMESPACE Zandor::
        DESTINATION ${zandor_package_folder} COMPONENT development)
    list(TRANSFORM given_HEADERS PREPEND ${PROJECT_SOURCE_DIR}/src/)
    list(TRANSFORM given_HEADERS APPEND /include/Zandor)
    install(DIRECTORY ${given_HEADERS} ${generated}/Zandor
        DESTINATION ${CMAKE_INSTALL_INCLUDEDIR} COMPONENT development)

    # What it links is known by name: Zandor::Model is the component Model and the module
    # zandor-model, Qt6::Sql the package Qt6 with its component Sql and the module Qt6Sql.
    set(components)
    set(qt)
    set(modules)
    foreach(need IN LISTS given_NEEDS)
        string(REGEX REPLACE ".*::" "" part ${need})
        if(need MATCHES "^Zandor::")
            list(APPEND components ${part})
            string(TOLOWER "zandor-${part}" module)
            list(APPEND modules "${module} = ${PROJECT_VERSION}")
        elseif(need MATCHES "^Qt6::")
            list(APPEND qt ${part})
            list(APPEND modules "Qt6${part} >= 6.4")
        else()
            message(FATAL_ERROR "${name} hands ${need} on, which the package cannot name")
        endif()
    endforeach()
    set_property(GLOBAL APPEND PROPERTY ZANDOR_COMPONENTS ${name})
    set_property(GLOBAL APPEND_STRING PROPERTY ZANDOR_NEEDS
        "set(zandor_needs_${name} ${components})\nset(zandor_qt_${name} ${qt})\n")

    set(cflags)
    set(libs)
    get_target_property(type ${target} TYPE)
    if(type STREQUAL STATIC_LIBRARY)
        string(TOUPPER ${name} upper)
        set(cflags " -DZANDOR_${upper}_STATIC_DEFINE")
        list(TRANSFORM given_LIBS PREPEND " -l" OUTPUT_VARIABLE libs)
        list(JOIN libs "" libs)
    endif()
    list(JOIN modules ", " modules)
    string(TOLOWER "zandor-${name}" module)
    set(postfix $<$<CONFIG:Debug>:d>)
    # From where the file lies, so that the whole can be installed anywhere.
    file(RELATIVE_PATH up /prefix/${CMAKE_INSTALL_LIBDIR}/pkgconfig /prefix)
    file(GENERATE OUTPUT ${CMAKE_CURRENT_BINARY_DIR}/$<CONFIG>/${module}.pc CONTENT
"prefix=\${pcfiledir}/${up}
libdir=\${prefix}/${CMAKE_INSTALL_LIBDIR}
includedir=\${prefix}/${CMAKE_INSTALL_INCLUDEDIR}

Name: ${module}
Description: ${PROJECT_DESCRIPTION}: ${name}
Version: ${PROJECT_VERSION}
Requires: ${modules}
Libs: -L\${libdir} -lZandor${name}${postfix}${libs}
Cflags: -I\${includedir}${cflags}
")
    install(FILES ${CMAKE_CURRENT_BINARY_DIR}/$<CONFIG>/${module}.pc
        DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT development)
endfunction()

# Once all libraries are known: what find_package(Zandor) reads.
function(zandor_install_package)
    get_property(ZANDOR_COMPONENTS GLOBAL PROPERTY ZANDOR_COMPONENTS)
    get_property(ZANDOR_NEEDS GLOBAL PROPERTY ZANDOR_NEEDS)
    configure_package_config_file(${PROJECT_SOURCE_DIR}/cmake/ZandorConfig.cmake.in
        ${PROJECT_BINARY_DIR}/ZandorConfig.cmake
        INSTALL_DESTINATION ${zandor_package_folder})
    # Before 1.0 a new minor version may change what the one before promised.
    write_basic_package_version_file(${PROJECT_BINARY_DIR}/ZandorConfigVersion.cmake
        COMPATIBILITY SameMinorVersion)
    install(FILES
        ${PROJECT_BINARY_DIR}/ZandorConfig.cmake
        ${PROJECT_BINARY_DIR}/ZandorConfigVersion.cmake
        DESTINATION ${zandor_package_folder} COMPONENT development)
endfunction()
