cmake_minimum_required(VERSION 3.25)
# Runs the tonvex program once and checks its exit status and output.
#   PROGRAM        the program
#   ARGS           its arguments, separated by '|'
#   INPUT          optional file fed to standard input
#   EXIT           expected exit status (default 0)
#   STDOUT         optional '@@'-separated regular expressions that standard output must match
#   STDOUT_EXACT   optional file whose contents standard output must equal
#   STDERR         optional '@@'-separated regular expressions that standard error must match
# The environment variable TONVEX_CLI_LAUNCHER may name a command line that the
# program runs under, such as valgrind and its options (tools/valgrind-check.sh).
string(REPLACE "|" ";" args "${ARGS}")
set(launcher)
if(DEFINED ENV{TONVEX_CLI_LAUNCHER})
  separate_arguments(launcher UNIX_COMMAND "$ENV{TONVEX_CLI_LAUNCHER}")
endif()
if(NOT DEFINED EXIT)
  set(EXIT 0)
endif()
set(input_option)
if(INPUT)
  set(input_option INPUT_FILE "${INPUT}")
endif()
execute_process(COMMAND ${launcher} "${PROGRAM}" ${args} ${input_option}
  RESULT_VARIABLE status OUTPUT_VARIABLE out ERROR_VARIABLE err)
set(report "command: ${PROGRAM} ${args}\nstatus: ${status}\nstdout:\n${out}\nstderr:\n${err}")
if(NOT status STREQUAL EXIT)
  message(FATAL_ERROR "expected exit status ${EXIT}\n${report}")
endif()
function(expect_matches label text patterns)
  string(REPLACE "@@" ";" patterns "${patterns}")
  foreach(pattern IN LISTS patterns)
    if(NOT "${text}" MATCHES "${pattern}")
      message(FATAL_ERROR "${label} does not match '${pattern}'\n${report}")
    endif()
  endforeach()
endfunction()
if(DEFINED STDOUT)
  expect_matches(stdout "${out}" "${STDOUT}")
endif()
if(DEFINED STDERR)
  expect_matches(stderr "${err}" "${STDERR}")
endif()
if(STDOUT_EXACT)
  file(READ "${STDOUT_EXACT}" expected)
  if(NOT out STREQUAL expected)
    message(FATAL_ERROR "stdout differs from ${STDOUT_EXACT}\n${report}")
  endif()
endif()
