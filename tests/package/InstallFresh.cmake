# Installs the build tree into an empty PREFIX and checks that exactly the package
# lands there: headers, the shared library with its version links, the CMake
# package, tonvex.pc and (WITH_PROGRAM) the program; nothing internal.
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
  list(APPEND expected ${BINDIR}/tonvex)
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

# libtonvex.so -> libtonvex.so.<major> -> libtonvex.so.<version>
foreach(pair "libtonvex.so|libtonvex.so.${SOVERSION}" "libtonvex.so.${SOVERSION}|libtonvex.so.${VERSION}")
  string(REPLACE "|" ";" pair "${pair}")
  list(GET pair 0 link)
  list(GET pair 1 target)
  if(NOT IS_SYMLINK "${PREFIX}/${LIBDIR}/${link}")
    message(FATAL_ERROR "${LIBDIR}/${link} is not a symbolic link")
  endif()
  file(READ_SYMLINK "${PREFIX}/${LIBDIR}/${link}" points_to)
  if(NOT points_to STREQUAL target)
    message(FATAL_ERROR "${LIBDIR}/${link} points to '${points_to}', not '${target}'")
  endif()
endforeach()
