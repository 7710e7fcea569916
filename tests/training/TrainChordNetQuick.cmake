# Runs the chord net training agent twice in its quick mode and checks that both runs
# write the same source file, that the file carries the given entries and the
# exported definitions, and that the agent branched from its history.
cmake_minimum_required(VERSION 3.25)
file(REMOVE_RECURSE "${WORK}")
file(MAKE_DIRECTORY "${WORK}")
foreach(run first second)
  execute_process(COMMAND "${AGENT}" --quick --log "${WORK}/${run}.log" "${WORK}/${run}.cpp"
    WORKING_DIRECTORY "${WORK}" RESULT_VARIABLE status OUTPUT_VARIABLE output ERROR_VARIABLE errors)
  if(NOT status EQUAL 0)
    message(FATAL_ERROR "quick run ${run} failed (${status}):\n${output}${errors}")
  endif()
endforeach()

execute_process(COMMAND ${CMAKE_COMMAND} -E compare_files "${WORK}/first.cpp" "${WORK}/second.cpp"
  RESULT_VARIABLE differ)
if(NOT differ EQUAL 0)
  message(FATAL_ERROR "two quick runs from the same seed wrote different files")
endif()

file(READ "${WORK}/first.cpp" source)
foreach(expected
    "\nTONVEX_API float weight_definitions[] =\n{\n-12.8459, 84.8939, 22.1978, -43.6413, -25.9571, 75.0373, 47.4166, -31.6487, -0.473688, 62.579, "
    "\nTONVEX_API TPredefinedWeights ChordAnalysisNeuronalNet = \n"
    "-8.27008, 13.1361, -9.52837, 11.3069, -29.4672, -16.8347, -13.2241, 1.7355, \n  };")
  string(FIND "${source}" "${expected}" at)
  if(at EQUAL -1)
    message(FATAL_ERROR "the written source lacks:\n${expected}")
  endif()
endforeach()

file(READ "${WORK}/first.log" log)
if(NOT log MATCHES "progress stalls: branching from the state of cycle [0-9]+")
  message(FATAL_ERROR "the quick run never branched:\n${log}")
endif()
