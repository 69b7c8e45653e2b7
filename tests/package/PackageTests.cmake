# Tests of what is installed: as a program outside of the project sees it.
set(prefix ${CMAKE_CURRENT_BINARY_DIR}/package/prefix)
set(prefix_libraries ${prefix}/${CMAKE_INSTALL_LIBDIR}/$<TARGET_FILE_NAME:KaReportHost>
                     ${prefix}/${CMAKE_INSTALL_LIBDIR}/$<TARGET_FILE_NAME:KaReport>)
set(outside ${CMAKE_CURRENT_BINARY_DIR}/package/build)

# Into an empty folder: what is not installed any more is not there.
add_test(NAME package.clear COMMAND ${CMAKE_COMMAND} -E rm -rf ${prefix} ${outside})
add_test(NAME package.install COMMAND ${CMAKE_COMMAND} --install ${CMAKE_BINARY_DIR} --prefix ${prefix})
set_tests_properties(package.clear PROPERTIES FIXTURES_SETUP package)
set_tests_properties(package.install PROPERTIES FIXTURES_SETUP package DEPENDS package.clear)

add_test(NAME package.binaries COMMAND ${check_binaries} ${prefix}/bin/kareport ${prefix}/bin/kareport-desk ${prefix_libraries})
add_test(NAME package.exports COMMAND ${PROJECT_SOURCE_DIR}/scripts/check-exports.py
                                      ${prefix}/${CMAKE_INSTALL_INCLUDEDIR}/KaReport ${prefix_libraries})
add_test(NAME package.exports.check COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check-exports-test.sh ${CMAKE_CXX_COMPILER})
add_test(NAME package.listed COMMAND ${PROJECT_SOURCE_DIR}/scripts/check-headers.sh
                                     ${prefix}/${CMAKE_INSTALL_INCLUDEDIR}/KaReport)
add_test(NAME package.listed.check COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/check-headers-test.sh)

add_test(NAME package.use COMMAND ${CMAKE_CTEST_COMMAND}
         --build-and-test ${CMAKE_CURRENT_SOURCE_DIR}/package ${outside}
         --build-generator ${CMAKE_GENERATOR}
         --build-options -DCMAKE_PREFIX_PATH=${prefix} -DCMAKE_BUILD_TYPE=Debug -DHOST_TEMPLATES=${PROJECT_SOURCE_DIR}/examples
         --test-command ${outside}/consumer)
set_tests_properties(package.use PROPERTIES FIXTURES_SETUP package.built)
add_test(NAME package.own-host COMMAND ${outside}/own-host-program ${CMAKE_CURRENT_BINARY_DIR}/package)
add_test(NAME package.standalone COMMAND ${outside}/standalone)
add_test(NAME package.headers COMMAND ${CMAKE_COMMAND} --build ${outside} --target headers)
set_tests_properties(package.own-host package.standalone package.headers PROPERTIES FIXTURES_REQUIRED package.built)
set_tests_properties(package.headers PROPERTIES TIMEOUT 900)
add_test(NAME package.pkg-config COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/package/pkg-config-test.sh ${CMAKE_CXX_COMPILER}
         ${prefix}/${CMAKE_INSTALL_LIBDIR} ${outside} ${PROJECT_VERSION})
# The example host is built and run in the same way, as its guide says.
set(example ${CMAKE_CURRENT_BINARY_DIR}/package/example)
add_test(NAME package.example COMMAND ${CMAKE_CTEST_COMMAND}
         --build-and-test ${PROJECT_SOURCE_DIR}/examples/host ${example}
         --build-generator ${CMAKE_GENERATOR}
         --build-options -DCMAKE_PREFIX_PATH=${prefix} -DCMAKE_BUILD_TYPE=Debug
         --test-command ${example}/host ${CMAKE_CURRENT_BINARY_DIR}/package)
add_test(NAME package.example.plain COMMAND ${example}/plain --once)
set_tests_properties(package.example PROPERTIES FIXTURES_SETUP package.examples)
set_tests_properties(package.example.plain PROPERTIES FIXTURES_REQUIRED package.examples TIMEOUT 60
                                                      ENVIRONMENT QT_QPA_PLATFORM=offscreen)
add_test(NAME package.completion COMMAND ${CMAKE_CURRENT_SOURCE_DIR}/package/completion-test.sh ${prefix} site-functions)
set_tests_properties(package.completion PROPERTIES FIXTURES_REQUIRED package)
set_tests_properties(package.binaries package.exports package.listed package.use package.pkg-config package.example
                     PROPERTIES FIXTURES_REQUIRED package)
# What our package says to those who link with it leads none of them into the current folder.
add_test(NAME package.paths COMMAND ${check_binaries} --outside ${outside}/consumer ${outside}/standalone
                                    ${outside}/own-host-program ${outside}/own-host/$<TARGET_SONAME_FILE_NAME:KaReportHost>
                                    ${example}/host ${example}/plain)
set_tests_properties(package.paths PROPERTIES FIXTURES_REQUIRED "package.built;package.examples")
add_test(NAME package.api COMMAND ${PROJECT_SOURCE_DIR}/scripts/api-docs.sh ${CMAKE_CURRENT_BINARY_DIR}/package/api)

# They build programs outside, which takes longer than all the rest.
set_tests_properties(package.use package.own-host package.standalone package.headers package.pkg-config package.example
                     package.example.plain package.paths PROPERTIES LABELS heavy)
