# What the libraries of the package have in common.
include(GNUInstallDirs)
include(GenerateExportHeader)

# Warnings are the business of whoever works on this tree, not of a program that adds it.
add_library(zandor_warnings INTERFACE)
if(PROJECT_IS_TOP_LEVEL)
    # GCC 12 takes every u"x" + text for an overlapping copy once it optimises.
    target_compile_options(zandor_warnings INTERFACE
        $<$<CXX_COMPILER_ID:GNU>:-Wno-restrict>
        -Wall -Wextra $<$<BOOL:${ZANDOR_WERROR}>:-Werror>)
endif()

# zandor_library(NAME
#     HEADERS the folders below src/ that hold its houses' include/Zandor
#     HOUSE   the folder of Zandor/ that its export header stands in
#     SOURCES files
#     NEEDS   what its headers need, OWN what its sources alone need
#     LIBS    libraries of the system by their names, of those: for who links it statically)
#
# Makes the library zandor_name, known as Zandor::NAME here and where it is installed.
function(zandor_library name)
    cmake_parse_arguments(PARSE_ARGV 1 given "" "HOUSE" "HEADERS;SOURCES;NEEDS;OWN;LIBS")
    string(TOLOWER ${name} lower)
    string(TOUPPER ${name} upper)
    set(target zandor_${lower})

    add_library(${target} ${given_SOURCES})
    add_library(Zandor::${name} ALIAS ${target})
    target_compile_features(${target} PUBLIC cxx_std_20)
    target_link_libraries(${target}
        PUBLIC ${given_NEEDS}
        PRIVATE "$<BUILD_INTERFACE:${given_OWN}>" $<BUILD_INTERFACE:zandor_warnings>)

    set(generated ${CMAKE_CURRENT_BINARY_DIR}/include)
    generate_export_header(${target}
        BASE_NAME zandor_${lower}
        EXPORT_FILE_NAME ${generated}/Zandor/${given_HOUSE}/export.h)
    get_target_property(type ${target} TYPE)
    if(type STREQUAL STATIC_LIBRARY)
        target_compile_definitions(${target} PUBLIC ZANDOR_${upper}_STATIC_DEFINE)
        if(given_LIBS)
            target_link_libraries(${target} INTERFACE "$<INSTALL_INTERFACE:${given_LIBS}>")
        endif()
    elseif(UNIX AND NOT APPLE AND NOT CMAKE_CXX_FLAGS MATCHES sanitize)
        # What another library does not hand out is missed here and not when a program starts.
        target_link_options(${target} PRIVATE LINKER:-z,defs)
    endif()

    target_include_directories(${target}
        PUBLIC $<BUILD_INTERFACE:${generated}>
        PRIVATE ${PROJECT_SOURCE_DIR}/src)
    foreach(folder IN LISTS given_HEADERS)
        target_include_directories(${target}
            PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/src/${folder}/include>)
    endforeach()
    set_target_properties(${target} PROPERTIES
        CXX_EXTENSIONS OFF
        CXX_VISIBILITY_PRESET hidden
        VISIBILITY_INLINES_HIDDEN ON
        POSITION_INDEPENDENT_CODE ON
        VERSION ${PROJECT_VERSION}
        SOVERSION ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR}
        DEBUG_POSTFIX d
        OUTPUT_NAME Zandor${name}
        EXPORT_NAME ${name})
    zandor_unite(${target})

    if(ZANDOR_INSTALL)
        zandor_install(${name} ${target} ${generated}
            HEADERS ${given_HEADERS} NEEDS ${given_NEEDS} LIBS ${given_LIBS})
    endif()
endfunction()

# With ZANDOR_UNITY, as in a Release, the sources of a target that stand in one folder are compiled
# together, up to sixteen at a time: most of the time goes into headers of Qt and of the standard
# library. What is generated stays by itself. Debug compiles each source alone, and so finds what it
# forgets to include.
function(zandor_unite target)
    if(NOT ZANDOR_UNITY)
        return()
    endif()
    get_target_property(sources ${target} SOURCES)
    get_target_property(folder ${target} SOURCE_DIR)
    foreach(source IN LISTS sources)
        cmake_path(ABSOLUTE_PATH source BASE_DIRECTORY ${folder} NORMALIZE)
        cmake_path(IS_PREFIX PROJECT_BINARY_DIR ${source} generated)
        if(generated OR NOT source MATCHES "[.]cpp$")
            continue()
        endif()
        cmake_path(GET source PARENT_PATH house)
        cmake_path(RELATIVE_PATH house BASE_DIRECTORY ${PROJECT_SOURCE_DIR})
        string(MAKE_C_IDENTIFIER ${house} house)
        math(EXPR part "0${count_${house}} / 16")
        math(EXPR count_${house} "0${count_${house}} + 1")
        set_source_files_properties(${source}
            TARGET_DIRECTORY ${target} PROPERTIES UNITY_GROUP ${house}_${part})
    endforeach()
    set_target_properties(${target} PROPERTIES UNITY_BUILD ON UNITY_BUILD_MODE GROUP)
endfunction()
