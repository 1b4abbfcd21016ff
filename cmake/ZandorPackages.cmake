# Debian packages: `cpack -G DEB` in the build folder of shared libraries.
set(abi ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
set(CPACK_PACKAGE_NAME zandor)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_CONTACT "The Zandor authors <zandor@example.org>")
set(CPACK_RESOURCE_FILE_LICENSE ${PROJECT_SOURCE_DIR}/LICENSE)
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_COMPONENTS_ALL runtime development designer)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS
    ${PROJECT_BINARY_DIR}/src
    ${PROJECT_BINARY_DIR}/src/frontends/headless
    ${PROJECT_BINARY_DIR}/src/frontends/qt
    ${PROJECT_BINARY_DIR}/src/model
    ${PROJECT_BINARY_DIR}/src/model/files
    ${PROJECT_BINARY_DIR}/src/model/reader)

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME libzandor${abi})
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
set(CPACK_COMPONENT_RUNTIME_DESCRIPTION "visual query designer to embed - libraries
 Tables as movable boxes, joins as lines between them, output columns in a
 grid below; whatever the user does is written into the query model of the
 program that has the control. With a ready-made model that writes SQL.")
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libzandor-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS
    "libzandor${abi} (= ${PROJECT_VERSION}), qt6-base-dev")
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION "visual query designer to embed - development files
 Headers, link names, and what CMake and pkg-config find the libraries by.")
set(CPACK_DEBIAN_DESIGNER_PACKAGE_NAME zandor-designer)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_SECTION database)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_DEPENDS "libzandor${abi} (= ${PROJECT_VERSION})")
set(CPACK_COMPONENT_DESIGNER_DESCRIPTION "questions to a database, drawn instead of written
 A desktop program over SQLite, PostgreSQL and ODBC databases: tables are
 boxes, joins are lines, what is to come out stands in a grid. It writes the
 SQL, runs it and shows the rows, and never changes the data.")

# What Debian wants of every package.
find_program(ZANDOR_GZIP gzip REQUIRED)
set(changelog ${PROJECT_BINARY_DIR}/changelog.gz)
add_custom_command(OUTPUT ${changelog}
    COMMAND ${ZANDOR_GZIP} -9nc ${PROJECT_SOURCE_DIR}/CHANGELOG.md > ${changelog}
    DEPENDS ${PROJECT_SOURCE_DIR}/CHANGELOG.md
    VERBATIM)
add_custom_target(zandor_changelog ALL DEPENDS ${changelog})
foreach(component IN LISTS CPACK_COMPONENTS_ALL)
    string(TOUPPER ${component} upper)
    set(folder ${CMAKE_INSTALL_DATADIR}/doc/${CPACK_DEBIAN_${upper}_PACKAGE_NAME})
    install(FILES ${changelog} DESTINATION ${folder} COMPONENT ${component})
    install(FILES ${PROJECT_SOURCE_DIR}/LICENSE RENAME copyright
        DESTINATION ${folder} COMPONENT ${component})
endforeach()
include(CPack)
