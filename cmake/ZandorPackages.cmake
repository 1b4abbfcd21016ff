# Debian packages: `cpack -G DEB` in the build folder of shared libraries, configured with the
# prefix /usr. `tests/package/debian` makes them and tries them on a clean system.
if(NOT BUILD_SHARED_LIBS)
    return()
endif()
set(release 1)
set(abi ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
set(libraries "libzandor${abi} (= ${PROJECT_VERSION}-${release})")
set(CPACK_PACKAGE_NAME zandor)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_CONTACT "The Zandor authors <zandor@example.org>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "") # each package has one of its own
set(CPACK_RESOURCE_FILE_LICENSE ${PROJECT_SOURCE_DIR}/LICENSE)
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_VERBATIM_VARIABLES ON)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE ${release})
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS
    ${PROJECT_BINARY_DIR}/src
    ${PROJECT_BINARY_DIR}/src/frontends/headless
    ${PROJECT_BINARY_DIR}/src/frontends/qt
    ${PROJECT_BINARY_DIR}/src/model
    ${PROJECT_BINARY_DIR}/src/model/files
    ${PROJECT_BINARY_DIR}/src/model/reader
    ${PROJECT_BINARY_DIR}/src/model/sql_reader)

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME libzandor${abi})
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
set(CPACK_COMPONENT_RUNTIME_DESCRIPTION "visual query designer to embed - libraries
Tables as movable boxes, joins as lines between them, output columns in a
grid below; whatever the user does is written into the query model of the
program that has the control. With a ready-made model that writes SQL.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libzandor-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS "${libraries}, qt6-base-dev (>= 6.4)")
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SUGGESTS qt6-designer-plugin-zandor)
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION "visual query designer to embed - development files
Headers, link names, and what CMake and pkg-config find the libraries by, for
programs that let their users draw questions to a database.")

set(CPACK_DEBIAN_DESIGNER_PACKAGE_NAME zandor-designer)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_SECTION database)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_DEPENDS "${libraries}, libqt6sql6-sqlite")
set(CPACK_DEBIAN_DESIGNER_PACKAGE_RECOMMENDS qt6-translations-l10n)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_SUGGESTS
    "libqt6sql6-psql, libqt6sql6-mysql, libqt6sql6-odbc")
set(CPACK_COMPONENT_DESIGNER_DESCRIPTION "questions to a database, drawn instead of written
A desktop program over SQLite, PostgreSQL, MySQL and ODBC databases: tables
are boxes, joins are lines, what is to come out stands in a grid. It writes
the SQL, runs it and shows the rows, and never changes the data.")

set(CPACK_DEBIAN_PLUGIN_PACKAGE_NAME qt6-designer-plugin-zandor)
set(CPACK_DEBIAN_PLUGIN_PACKAGE_SECTION devel)
set(CPACK_DEBIAN_PLUGIN_PACKAGE_DEPENDS "${libraries}")
set(CPACK_DEBIAN_PLUGIN_PACKAGE_RECOMMENDS designer-qt6)
set(CPACK_COMPONENT_PLUGIN_DESCRIPTION "visual query designer to embed - plug-in for Qt Designer
Puts the query designer into the widget box of Qt Designer, and lets programs
load forms that have it.")

set(CPACK_DEBIAN_PYTHON_PACKAGE_NAME python3-zandor)
set(CPACK_DEBIAN_PYTHON_PACKAGE_SECTION python)
set(CPACK_DEBIAN_PYTHON_PACKAGE_DEPENDS
    "${libraries}, python3 (>= 3.11~), python3 (<< 3.12), python3-pyqt6")
set(CPACK_COMPONENT_PYTHON_DESCRIPTION "visual query designer to embed - for Python and PyQt6
The widget, the ready-made query model with its SQL, files and readers of
databases, and query models written in Python.")

# What is built is packed, as far as there is a package for it.
get_cmake_property(built COMPONENTS)
set(CPACK_COMPONENTS_ALL)
foreach(component runtime development designer plugin python)
    if(component IN_LIST built)
        list(APPEND CPACK_COMPONENTS_ALL ${component})
    endif()
endforeach()

# What Debian wants of every package: its licence and two changelogs, of the program and of the
# package. Made here, so that a component can be installed before all is built.
find_program(ZANDOR_GZIP gzip REQUIRED)
set(place ${PROJECT_BINARY_DIR}/package)
string(TIMESTAMP date "%a, %d %b %Y %H:%M:%S +0000" UTC)
file(CONFIGURE OUTPUT ${place}/changelog.Debian CONTENT
"zandor (@PROJECT_VERSION@-@release@) unstable; urgency=medium

  * See changelog.gz.

 -- @CPACK_PACKAGE_CONTACT@  @date@
" @ONLY)
set(log ${PROJECT_SOURCE_DIR}/CHANGELOG.md)
set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${log})
execute_process(COMMAND ${ZANDOR_GZIP} -9nc ${log}
    OUTPUT_FILE ${place}/changelog.gz COMMAND_ERROR_IS_FATAL ANY)
execute_process(COMMAND ${ZANDOR_GZIP} -9nc ${place}/changelog.Debian
    OUTPUT_FILE ${place}/changelog.Debian.gz COMMAND_ERROR_IS_FATAL ANY)
foreach(component IN LISTS CPACK_COMPONENTS_ALL)
    string(TOUPPER ${component} upper)
    set(folder ${CMAKE_INSTALL_DATADIR}/doc/${CPACK_DEBIAN_${upper}_PACKAGE_NAME})
    install(FILES ${place}/changelog.gz ${place}/changelog.Debian.gz
        DESTINATION ${folder} COMPONENT ${component})
    install(FILES ${PROJECT_SOURCE_DIR}/LICENSE RENAME copyright
        DESTINATION ${folder} COMPONENT ${component})
endforeach()

# Six libraries of one version, which nobody has apart; and calls of ldconfig that CPack writes
# beside the trigger.
file(CONFIGURE OUTPUT ${place}/overrides CONTENT
"libzandor@abi@: package-name-doesnt-match-sonames
libzandor@abi@: maintscript-calls-ldconfig
" @ONLY)
file(WRITE ${place}/triggers "activate-noawait ldconfig\n")
set(CPACK_DEBIAN_RUNTIME_PACKAGE_CONTROL_EXTRA ${place}/triggers)
install(FILES ${place}/overrides RENAME libzandor${abi}
    DESTINATION ${CMAKE_INSTALL_DATADIR}/lintian/overrides COMPONENT runtime)

# What Python has compiled goes with its source.
file(WRITE ${place}/prerm "#!/bin/sh
set -e
if command -v py3clean >/dev/null; then py3clean -p python3-zandor; fi
")
file(WRITE ${place}/postinst "#!/bin/sh
set -e
if command -v py3compile >/dev/null; then py3compile -p python3-zandor; fi
")
set(CPACK_DEBIAN_PYTHON_PACKAGE_CONTROL_EXTRA ${place}/prerm ${place}/postinst)
include(CPack)
