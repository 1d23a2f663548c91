# Builds the example as its reader would, with find_package, and runs it.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

set(build ${WORK_DIR}/hello-cmake)
file(REMOVE_RECURSE ${build})
run(log ${CMAKE_COMMAND} -S ${SOURCE_DIR}/examples/hello -B ${build} -G ${GENERATOR}
        -DCMAKE_PREFIX_PATH=${WORK_DIR}/prefix -DCMAKE_CXX_COMPILER=${COMPILER} -DCMAKE_CXX_FLAGS=${FLAGS})
run(log ${CMAKE_COMMAND} --build ${build})
require_hello(${build})

# What the targets ask of programs must not reach into the tree that they were built in, or into libraries that only
# the desktop knows.
file(GLOB exported ${WORK_DIR}/prefix/${LIBDIR}/cmake/GlogPanes/*.cmake)
if(NOT exported)
  message(FATAL_ERROR "the CMake package has no files")
endif()
foreach(file ${exported})
  file(READ ${file} text)
  foreach(leak "${SOURCE_DIR}" "PkgConfig::" SDL2 pango cairo glog_flags)
    string(FIND "${text}" "${leak}" place)
    if(NOT place EQUAL -1)
      message(FATAL_ERROR "${file} names ${leak}")
    endif()
  endforeach()
endforeach()
