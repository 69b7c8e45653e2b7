# Debian packages: the libraries, what is needed to build against them, and the programs.
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME kareport)
set(CPACK_PACKAGE_VENDOR KaReport)
set(CPACK_PACKAGE_CONTACT "KaReport developers <kareport@localhost>")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_COMPONENTS_ALL library development programs)
set(CPACK_COMPONENTS_GROUPING ONE_PER_GROUP)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION science)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_LIBRARY_OUTPUT_DIRECTORY})
set(same_version "(= ${PROJECT_VERSION})")

set(CPACK_DEBIAN_LIBRARY_PACKAGE_NAME libkareport0)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_SECTION libs)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_DEPENDS fonts-dejavu-core)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_RECOMMENDS qt6-translations-l10n)
set(CPACK_DEBIAN_LIBRARY_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_COMPONENT_LIBRARY_DESCRIPTION "Fixed-pitch reports for civil engineering and surveying: libraries
 Lays values out in pages and lines, shows, prints and saves them.")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME libkareport-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_DEPENDS "libkareport0 ${same_version}, qt6-base-dev (>= 6.4)")
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SUGGESTS pkg-config)
set(CPACK_COMPONENT_DEVELOPMENT_DESCRIPTION "Fixed-pitch reports for civil engineering and surveying: development files
 Headers, and what CMake and pkg-config need to link against the libraries.")

set(CPACK_DEBIAN_PROGRAMS_PACKAGE_NAME kareport)
# libkareport0 for the templates and the font; the programs themselves link the layers. libpq5 is loaded, not linked.
set(CPACK_DEBIAN_PROGRAMS_PACKAGE_DEPENDS "libkareport0 ${same_version}, libpq5")
set(CPACK_DEBIAN_PROGRAMS_PACKAGE_RECOMMENDS cups)
set(CPACK_COMPONENT_PROGRAMS_DESCRIPTION "Fixed-pitch reports for civil engineering and surveying: programs
 kareport makes reports from templates and data on the command line; kareport-desk makes, shows, edits and prints them.")

include(CPack)
