include(CMakePackageConfigHelpers)

# Three components: library, development, programs.
install(TARGETS KaReportHost KaReport ka_package_headers ka_package EXPORT KaReportTargets
        RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT library
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT development
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT development)
# They name each other as the files beside them, so one include path serves: <KaReport/UReportDoc.h>.
set(installed_headers)
foreach(library KaReportHost KaReport)
    get_property(headers TARGET ${library} PROPERTY KA_INSTALLED_HEADERS)
    list(APPEND installed_headers ${headers})
endforeach()
install(FILES ${installed_headers} DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/KaReport COMPONENT development)
install(TARGETS kareport kareport-desk RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT programs)
install(FILES LICENSES.md CHANGELOG.md DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT programs)
install(FILES examples/survey.xml DESTINATION ${CMAKE_INSTALL_DATADIR}/kareport/templates COMPONENT library)
install(FILES docs/kareport.1 docs/kareport-desk.1 DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 COMPONENT programs)
# Where each shell looks for what completes a command, in the system's folders as well as in /usr/local. A package of Debian has a
# folder of its own for zsh.
set(completion ${PROJECT_BINARY_DIR}/completion)
install(FILES ${completion}/kareport.bash RENAME kareport COMPONENT programs
        DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
install(FILES ${completion}/kareport.fish COMPONENT programs DESTINATION ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)
install(CODE [[
    set(ka_zsh_folder site-functions)
    if(CMAKE_INSTALL_PREFIX MATCHES "(^|/)usr/?$")
        set(ka_zsh_folder vendor-completions)
    endif()
]] COMPONENT programs)
install(FILES ${completion}/kareport.zsh RENAME _kareport COMPONENT programs
        DESTINATION "${CMAKE_INSTALL_DATADIR}/zsh/\${ka_zsh_folder}")
install(FILES packaging/kareport-desk.desktop DESTINATION ${CMAKE_INSTALL_DATADIR}/applications COMPONENT programs)
install(FILES packaging/kareport.svg DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps COMPONENT programs)
foreach(size 16 22 24 32 48 64 128 256 512)
    install(FILES packaging/icons/${size}x${size}/kareport.png COMPONENT programs
            DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/${size}x${size}/apps)
endforeach()
# The examples that the desktop program offers, which run where they are.
file(GLOB example_files CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/examples/*.json ${PROJECT_SOURCE_DIR}/examples/*.xml)
install(FILES ${example_files} examples/README.md DESTINATION ${CMAKE_INSTALL_DATADIR}/kareport/examples COMPONENT programs)
install(DIRECTORY examples/data DESTINATION ${CMAKE_INSTALL_DATADIR}/kareport/examples COMPONENT programs)
install(FILES packaging/kareport.xml DESTINATION ${CMAKE_INSTALL_DATADIR}/mime/packages COMPONENT programs)

set(config_dir ${CMAKE_INSTALL_LIBDIR}/cmake/KaReport)
install(EXPORT KaReportTargets NAMESPACE KaReport:: DESTINATION ${config_dir} COMPONENT development)
configure_package_config_file(cmake/KaReportConfig.cmake.in ${CMAKE_CURRENT_BINARY_DIR}/KaReportConfig.cmake
                              INSTALL_DESTINATION ${config_dir})
write_basic_package_version_file(${CMAKE_CURRENT_BINARY_DIR}/KaReportConfigVersion.cmake
                                 COMPATIBILITY SameMinorVersion)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/KaReportConfig.cmake ${CMAKE_CURRENT_BINARY_DIR}/KaReportConfigVersion.cmake
        DESTINATION ${config_dir} COMPONENT development)

# The folder is told from where the file is found, as the installation may be moved, or made elsewhere than it was configured.
file(RELATIVE_PATH pc_prefix /${CMAKE_INSTALL_LIBDIR}/pkgconfig /)
string(REGEX REPLACE "/$" "" pc_prefix "${pc_prefix}")
configure_file(cmake/kareport.pc.in ${CMAKE_CURRENT_BINARY_DIR}/kareport.pc @ONLY)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/kareport.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT development)
