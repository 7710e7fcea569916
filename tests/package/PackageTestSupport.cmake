# Helpers of the package tests.

# Runs a command; stops the test with its output when it fails. The output goes
# into the variable named by OUTPUT, if given.
function(run_or_fail)
  cmake_parse_arguments(PARSE_ARGV 0 R "" "OUTPUT" "COMMAND")
  execute_process(COMMAND ${R_COMMAND} RESULT_VARIABLE status OUTPUT_VARIABLE out ERROR_VARIABLE err)
  if(NOT status EQUAL 0)
    string(JOIN " " shown ${R_COMMAND})
    message(FATAL_ERROR "command failed (${status}): ${shown}\nstdout:\n${out}\nstderr:\n${err}")
  endif()
  if(R_OUTPUT)
    set(${R_OUTPUT} "${out}" PARENT_SCOPE)
  endif()
endfunction()

# Runs the example program and compares its output with the file EXPECTED.
function(expect_example_output program)
  run_or_fail(COMMAND "${program}" OUTPUT out)
  file(READ "${EXPECTED}" expected)
  if(NOT out STREQUAL expected)
    message(FATAL_ERROR "${program} printed\n${out}\ninstead of\n${expected}")
  endif()
endfunction()
