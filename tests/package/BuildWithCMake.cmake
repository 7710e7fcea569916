# Configures and builds the example in a fresh WORK_DIR against the installation in
# PREFIX through find_package(Tonvex), and runs it. HOST_FLAGS (may be empty) are
# added to the example's compiler and linker flags.
cmake_minimum_required(VERSION 3.25)
include(${CMAKE_CURRENT_LIST_DIR}/PackageTestSupport.cmake)

file(REMOVE_RECURSE "${WORK_DIR}")
run_or_fail(COMMAND "${CMAKE_COMMAND}" -S "${EXAMPLE_SOURCE}" -B "${WORK_DIR}" -G "${GENERATOR}"
            "-DCMAKE_CXX_COMPILER=${CXX}" -DCMAKE_BUILD_TYPE=Release "-DCMAKE_PREFIX_PATH=${PREFIX}"
            "-DCMAKE_CXX_FLAGS=${HOST_FLAGS}" "-DCMAKE_EXE_LINKER_FLAGS=${HOST_FLAGS}"
            -DCMAKE_FIND_USE_PACKAGE_REGISTRY=OFF)
# The package must come from the installation, not from anywhere else.
file(STRINGS "${WORK_DIR}/CMakeCache.txt" found REGEX "^Tonvex_DIR:")
if(NOT found STREQUAL "Tonvex_DIR:PATH=${PREFIX}/${LIBDIR}/cmake/Tonvex")
  message(FATAL_ERROR "Tonvex found elsewhere: ${found}")
endif()
run_or_fail(COMMAND "${CMAKE_COMMAND}" --build "${WORK_DIR}")
expect_example_output("${WORK_DIR}/name_chords")
