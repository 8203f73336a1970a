# The installed copy: library, CMake package, pkg-config file. The headers are installed by the
# folders they live in.

include(CMakePackageConfigHelpers)

set(DRAWMERE_PACKAGE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/Drawmere)

install(TARGETS drawmere EXPORT DrawmereTargets)
install(EXPORT DrawmereTargets NAMESPACE Drawmere:: DESTINATION ${DRAWMERE_PACKAGE_DIR})

configure_package_config_file(cmake/DrawmereConfig.cmake.in DrawmereConfig.cmake
    INSTALL_DESTINATION ${DRAWMERE_PACKAGE_DIR}
    NO_SET_AND_CHECK_MACRO
)
write_basic_package_version_file(DrawmereConfigVersion.cmake COMPATIBILITY SameMinorVersion)
install(FILES
    ${CMAKE_CURRENT_BINARY_DIR}/DrawmereConfig.cmake
    ${CMAKE_CURRENT_BINARY_DIR}/DrawmereConfigVersion.cmake
    DESTINATION ${DRAWMERE_PACKAGE_DIR}
)

# Relative to the file itself, so that an installed copy can be moved.
cmake_path(RELATIVE_PATH CMAKE_INSTALL_FULL_LIBDIR BASE_DIRECTORY ${CMAKE_INSTALL_PREFIX}
    OUTPUT_VARIABLE DRAWMERE_LIBDIR)
cmake_path(RELATIVE_PATH CMAKE_INSTALL_PREFIX
    BASE_DIRECTORY ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig
    OUTPUT_VARIABLE DRAWMERE_PREFIX_FROM_PC)
configure_file(cmake/drawmere.pc.in drawmere.pc @ONLY)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/drawmere.pc
    DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig
)
