# Shows that CheckHeaders.cmake can fail: it has to find the one bad header in a tree, and be content without it.
#
#   cmake -DSCRIPT=<CheckHeaders.cmake> -DWORK_DIR=<scratch> -P HeadersSelfTest.cmake
cmake_minimum_required(VERSION 3.25)

set(tree ${WORK_DIR}/tree)

function(check result output)
  execute_process(COMMAND ${CMAKE_COMMAND} -DSOURCE_DIR=${tree} -DWORK_DIR=${WORK_DIR}/objects -P ${SCRIPT}
                  RESULT_VARIABLE status OUTPUT_VARIABLE text ERROR_VARIABLE text)
  set(${result} ${status} PARENT_SCOPE)
  set(${output} "${text}" PARENT_SCOPE)
endfunction()

function(expect_named header content)
  file(WRITE ${tree}/host/${header} "${content}")
  check(status text)
  file(REMOVE ${tree}/host/${header})
  if(status EQUAL 0)
    message(FATAL_ERROR "host/${header} went unnoticed")
  endif()
  if(NOT text MATCHES "host/${header} does not compile alone")
    message(FATAL_ERROR "host/${header} was not named:\n${text}")
  endif()
  if(text MATCHES "Good.h does not compile")
    message(FATAL_ERROR "a good header was blamed:\n${text}")
  endif()
endfunction()

file(REMOVE_RECURSE ${WORK_DIR})
file(WRITE ${tree}/host/Good.h "#pragma once\n#include <vector>\nstd::vector<int> Numbers();\n")
expect_named(LacksInclude.h "#pragma once\nstd::vector<int> Numbers();\n")
expect_named(LacksGuard.h "struct Twice {}\;\n")
expect_named(Warns.h "#pragma once\ninline int F(int unused) { return 0\; }\n")

check(status text)
if(NOT status EQUAL 0)
  message(FATAL_ERROR "a good tree was refused:\n${text}")
endif()

file(REMOVE ${tree}/host/Good.h)
check(status text)
if(status EQUAL 0)
  message(FATAL_ERROR "an empty tree passed")
endif()
