# Configures and builds the parent project in parent/ (Tonvex from SOURCE_DIR by
# FetchContent) in a fresh WORK_DIR, runs its example program, and installs the
# parent: Tonvex adds no install rules to a project that embeds it.
cmake_minimum_required(VERSION 3.25)
include(${CMAKE_CURRENT_LIST_DIR}/PackageTestSupport.cmake)

file(REMOVE_RECURSE "${WORK_DIR}")
run_or_fail(COMMAND "${CMAKE_COMMAND}" -S "${CMAKE_CURRENT_LIST_DIR}/parent" -B "${WORK_DIR}/build"
            -G "${GENERATOR}" "-DCMAKE_CXX_COMPILER=${CXX}" "-DTONVEX_SOURCE=${SOURCE_DIR}"
            "-DCMAKE_CXX_FLAGS=${HOST_FLAGS}" "-DCMAKE_EXE_LINKER_FLAGS=${HOST_FLAGS}"
            "-DCMAKE_SHARED_LINKER_FLAGS=${HOST_FLAGS}")
run_or_fail(COMMAND "${CMAKE_COMMAND}" --build "${WORK_DIR}/build" --target name_chords)
expect_example_output("${WORK_DIR}/build/name_chords")

run_or_fail(COMMAND "${CMAKE_COMMAND}" --install "${WORK_DIR}/build" --prefix "${WORK_DIR}/prefix")
file(GLOB_RECURSE installed "${WORK_DIR}/prefix/*")
if(installed)
  message(FATAL_ERROR "installing the parent project installed Tonvex's files: ${installed}")
endif()
