# Installation: the public headers, the versioned shared library, the tonvex
# program, a CMake package (find_package(Tonvex) gives Tonvex::tonvex) and a
# pkg-config file. The internal static library, the tests and the training tools
# stay in the build tree.
#
# Everything installed is relocatable: the CMake package and tonvex.pc find the
# prefix from their own location, and the program finds the library through a
# relative run path, so `cmake --install build --prefix P` may choose any P.
include(CMakePackageConfigHelpers)

set(TONVEX_INSTALL_CMAKEDIR ${CMAKE_INSTALL_LIBDIR}/cmake/Tonvex)
set(TONVEX_INSTALL_PKGCONFIGDIR ${CMAKE_INSTALL_LIBDIR}/pkgconfig)

install(TARGETS tonvex EXPORT TonvexTargets
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
  RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
file(GLOB TONVEX_PUBLIC_HEADERS CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/include/tonvex/*.h)
install(FILES ${TONVEX_PUBLIC_HEADERS} DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/tonvex)

install(EXPORT TonvexTargets NAMESPACE Tonvex:: DESTINATION ${TONVEX_INSTALL_CMAKEDIR})
configure_package_config_file(${PROJECT_SOURCE_DIR}/cmake/TonvexConfig.cmake.in
  ${PROJECT_BINARY_DIR}/generated/TonvexConfig.cmake
  INSTALL_DESTINATION ${TONVEX_INSTALL_CMAKEDIR})
# Releases that keep the major version keep the interface.
write_basic_package_version_file(${PROJECT_BINARY_DIR}/generated/TonvexConfigVersion.cmake
  COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/generated/TonvexConfig.cmake
              ${PROJECT_BINARY_DIR}/generated/TonvexConfigVersion.cmake
  DESTINATION ${TONVEX_INSTALL_CMAKEDIR})

# tonvex.pc names its prefix relative to its own directory (${pcfiledir}).
file(RELATIVE_PATH TONVEX_PC_TO_PREFIX /prefix/${TONVEX_INSTALL_PKGCONFIGDIR} /prefix)
string(REGEX REPLACE "/$" "" TONVEX_PC_TO_PREFIX "${TONVEX_PC_TO_PREFIX}")
configure_file(${PROJECT_SOURCE_DIR}/cmake/tonvex.pc.in ${PROJECT_BINARY_DIR}/generated/tonvex.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/generated/tonvex.pc DESTINATION ${TONVEX_INSTALL_PKGCONFIGDIR})
