# Installs the headers, both libraries and a CMake package, so that a host can
# write find_package(Redavudeva CONFIG REQUIRED) and link Redavudeva::Redavudeva.
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

install(TARGETS Redavudeva HUEKIT EXPORT RedavudevaTargets
        RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR}
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
        ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR})
install(DIRECTORY include/redavudeva DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
install(EXPORT RedavudevaTargets NAMESPACE Redavudeva::
        DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/Redavudeva)
configure_package_config_file(cmake/RedavudevaConfig.cmake.in
    ${CMAKE_CURRENT_BINARY_DIR}/RedavudevaConfig.cmake
    INSTALL_DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/Redavudeva)
write_basic_package_version_file(${CMAKE_CURRENT_BINARY_DIR}/RedavudevaConfigVersion.cmake
    COMPATIBILITY SameMajorVersion)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/RedavudevaConfig.cmake
              ${CMAKE_CURRENT_BINARY_DIR}/RedavudevaConfigVersion.cmake
        DESTINATION ${CMAKE_INSTALL_LIBDIR}/cmake/Redavudeva)
