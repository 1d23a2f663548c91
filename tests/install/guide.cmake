# Does what the guide says: its first files build, its first window opens and closes, and its glogview commands run.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

set(work ${WORK_DIR}/guide)
file(REMOVE_RECURSE ${work})
file(READ ${SOURCE_DIR}/docs/guide.md guide)

# write_first_block(LANGUAGE NAME): the first block of the guide in the language becomes a file.
function(write_first_block language name)
  string(REGEX MATCH "\n```${language}\n([^`]+)```" found "${guide}")
  if(NOT found)
    message(FATAL_ERROR "the guide has no block of ${language}")
  endif()
  file(WRITE ${work}/${name} "${CMAKE_MATCH_1}")
endfunction()

write_first_block(xml takes.xml)
write_first_block(cpp first.cpp)
write_first_block(cmake CMakeLists.txt)
write_first_block(script takes.script)

run(log ${CMAKE_COMMAND} -S ${work} -B ${work}/build -G ${GENERATOR} -DCMAKE_PREFIX_PATH=${WORK_DIR}/prefix
        -DCMAKE_CXX_COMPILER=${COMPILER} -DCMAKE_CXX_FLAGS=${FLAGS})
run(log ${CMAKE_COMMAND} --build ${work}/build)
run(log ${CMAKE_COMMAND} -E chdir ${work}/build ${SOURCE_DIR}/tests/window/run-under-xvfb.sh
        ${CMAKE_CURRENT_LIST_DIR}/use-window.sh ./first Takes key alt+F4)

# The commands that need no display.
string(REGEX MATCHALL "\nglogview [^\n]*--png [^\n]*" commands "${guide}")
list(LENGTH commands count)
if(count LESS 2)
  message(FATAL_ERROR "the guide has only ${count} commands that write pictures")
endif()
foreach(command IN LISTS commands)
  string(STRIP "${command}" command)
  separate_arguments(arguments UNIX_COMMAND "${command}")
  list(POP_FRONT arguments)
  run(log ${CMAKE_COMMAND} -E chdir ${work} ${WORK_DIR}/prefix/bin/glogview ${arguments})
endforeach()
require_file(${work}/dark.png)
require_file(${work}/after.png)
