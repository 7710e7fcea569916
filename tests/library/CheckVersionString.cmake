# The version string can be found in the binary by text search.
file(STRINGS "${LIBRARY}" found REGEX "@\\(#\\)PROGRAM:Tonvex  PROJECT:Tonvex-103\\.4")
if(NOT found)
  message(FATAL_ERROR "version string not found in ${LIBRARY}")
endif()
