# SPDX-License-Identifier: Apache-2.0
# What cmake --install lays down, by component: "runtime" is what a program needs to start,
# "development" what it needs to be built, "documentation" is for people.
include(CMakePackageConfigHelpers)

set(config_dir ${CMAKE_INSTALL_LIBDIR}/cmake/zelvo)
set(generated ${CMAKE_CURRENT_BINARY_DIR}/install)

install(TARGETS zelvo EXPORT zelvo
    LIBRARY COMPONENT runtime NAMELINK_COMPONENT development)
install(TARGETS zelvo_static EXPORT zelvo ARCHIVE COMPONENT development)

# Headers include each other by their bare names, so their folder is itself on the include path.
install(DIRECTORY include/ DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/zelvo COMPONENT development
    FILES_MATCHING PATTERN *.h PATTERN *.hpp)

install(EXPORT zelvo NAMESPACE zelvo:: FILE zelvo-targets.cmake
    DESTINATION ${config_dir} COMPONENT development)
configure_package_config_file(cmake/zelvo-config.cmake.in ${generated}/zelvo-config.cmake
    INSTALL_DESTINATION ${config_dir}
    NO_SET_AND_CHECK_MACRO NO_CHECK_REQUIRED_COMPONENTS_MACRO)
write_basic_package_version_file(${generated}/zelvo-config-version.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES ${generated}/zelvo-config.cmake ${generated}/zelvo-config-version.cmake
    DESTINATION ${config_dir} COMPONENT development)

# Directories of zelvo.pc follow from where the file lies, so that an installed tree can be moved.
file(RELATIVE_PATH up ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
string(REGEX REPLACE "/$" "" prefix "\${pcfiledir}/${up}")
cmake_path(APPEND libdir "\${prefix}" "${CMAKE_INSTALL_LIBDIR}")
cmake_path(APPEND includedir "\${prefix}" "${CMAKE_INSTALL_INCLUDEDIR}" zelvo)
configure_file(cmake/zelvo.pc.in ${generated}/zelvo.pc @ONLY)
install(FILES ${generated}/zelvo.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT development)

install(FILES README.md CHANGELOG.md SECURITY.md LICENSE
    DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT documentation)
install(DIRECTORY docs examples DESTINATION ${CMAKE_INSTALL_DOCDIR} COMPONENT documentation
    PATTERN .clang-tidy EXCLUDE PATTERN Doxyfile EXCLUDE PATTERN pages.css EXCLUDE)
install(DIRECTORY packaging/lnav DESTINATION ${CMAKE_INSTALL_DATADIR}/zelvo
    COMPONENT documentation USE_SOURCE_PERMISSIONS)
install(DIRECTORY packaging/logrotate packaging/rsyslog
    DESTINATION ${CMAKE_INSTALL_DOCDIR}/packaging COMPONENT documentation)

file(RELATIVE_PATH to_headers ${CMAKE_INSTALL_FULL_DOCDIR} ${CMAKE_INSTALL_FULL_INCLUDEDIR}/zelvo)
file(RELATIVE_PATH to_lnav ${CMAKE_INSTALL_FULL_DOCDIR} ${CMAKE_INSTALL_FULL_DATADIR}/zelvo/lnav)
configure_file(cmake/links.cmake.in ${generated}/links.cmake @ONLY)
install(SCRIPT ${generated}/links.cmake COMPONENT documentation)
