# Installs the build tree into an empty PREFIX and checks that exactly the package
# lands there: headers, the shared library with its version links, the CMake
# package, tonvex.pc and (WITH_PROGRAM) the program with its man page and bash
# completion; nothing internal.
cmake_minimum_required(VERSION 3.25)
include(${CMAKE_CURRENT_LIST_DIR}/PackageTestSupport.cmake)

file(REMOVE_RECURSE "${PREFIX}")
run_or_fail(COMMAND "${CMAKE_COMMAND}" --install "${BUILD_DIR}" --prefix "${PREFIX}" --config "${CONFIG}")

string(TOLOWER "${CONFIG}" config)
if(config STREQUAL "")
  set(config noconfig)
endif()
set(expected
  ${LIBDIR}/libtonvex.so ${LIBDIR}/libtonvex.so.${SOVERSION} ${LIBDIR}/libtonvex.so.${VERSION}
  ${LIBDIR}/cmake/Tonvex/TonvexConfig.cmake ${LIBDIR}/cmake/Tonvex/TonvexConfigVersion.cmake
  ${LIBDIR}/cmake/Tonvex/TonvexTargets.cmake ${LIBDIR}/cmake/Tonvex/TonvexTargets-${config}.cmake
  ${LIBDIR}/pkgconfig/tonvex.pc)
if(WITH_PROGRAM)
  list(APPEND expected ${BINDIR}/tonvex ${MANDIR}/man1/tonvex.1 ${DATADIR}/bash-completion/completions/tonvex)
endif()
file(GLOB headers RELATIVE "${SOURCE_DIR}/include" "${SOURCE_DIR}/include/tonvex/*.h")
foreach(header IN LISTS headers)
  list(APPEND expected ${INCLUDEDIR}/${header})
endforeach()

file(GLOB_RECURSE installed RELATIVE "${PREFIX}" LIST_DIRECTORIES false "${PREFIX}/*")
list(SORT installed)
list(SORT expected)
if(NOT installed STREQUAL expected)
  set(missing ${expected})
  list(REMOVE_ITEM missing ${installed})
  set(extra ${installed})
  list(REMOVE_ITEM extra ${expected})
  message(FATAL_ERROR "installed files differ\nmissing: ${missing}\nunexpected: ${extra}")
endif()

# libtonvex.so -> libtonvex.so.<major> -> libtonvex.so.<version> (reading a file
# that is no link stops the script)
file(READ_SYMLINK "${PREFIX}/${LIBDIR}/libtonvex.so" first)
file(READ_SYMLINK "${PREFIX}/${LIBDIR}/libtonvex.so.${SOVERSION}" second)
if(NOT first STREQUAL "libtonvex.so.${SOVERSION}" OR NOT second STREQUAL "libtonvex.so.${VERSION}")
  message(FATAL_ERROR "the library links point to '${first}' and '${second}'")
endif()
