# Compiles the example in a fresh WORK_DIR with the flags pkg-config gives for the
# installation in PREFIX, and runs it with the installed library. HOST_FLAGS (may
# be empty) are added to the compiler command.
cmake_minimum_required(VERSION 3.25)
include(${CMAKE_CURRENT_LIST_DIR}/PackageTestSupport.cmake)

file(REMOVE_RECURSE "${WORK_DIR}")
file(MAKE_DIRECTORY "${WORK_DIR}")
set(ENV{PKG_CONFIG_PATH} "${PREFIX}/${LIBDIR}/pkgconfig")
run_or_fail(COMMAND "${PKG_CONFIG}" --modversion tonvex OUTPUT version)
string(STRIP "${version}" version)
if(NOT version STREQUAL VERSION)
  message(FATAL_ERROR "pkg-config reports version '${version}', not '${VERSION}'")
endif()
run_or_fail(COMMAND "${PKG_CONFIG}" --cflags --libs tonvex OUTPUT flags)
separate_arguments(flags UNIX_COMMAND "${flags}")
run_or_fail(COMMAND "${CXX}" -std=c++17 ${HOST_FLAGS} "${EXAMPLE_SOURCE}/name_chords.cpp" ${flags}
            -o "${WORK_DIR}/name_chords")
set(ENV{LD_LIBRARY_PATH} "${PREFIX}/${LIBDIR}")
expect_example_output("${WORK_DIR}/name_chords")
