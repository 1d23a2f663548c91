# Every installed header is complete with what is installed beside it, and asks of its reader no library but Boost.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

set(include_dir ${WORK_DIR}/prefix/include/glogpanes)
file(GLOB_RECURSE headers RELATIVE ${include_dir} ${include_dir}/*.h)
list(LENGTH headers count)
if(count LESS 90)
  message(FATAL_ERROR "only ${count} headers are installed")
endif()

set(lines "")
foreach(header ${headers})
  string(APPEND lines "#include \"${header}\"\n")
endforeach()
file(WRITE ${WORK_DIR}/all-headers.cpp "${lines}")
run(log ${COMPILER} -std=c++17 -Wall -Wextra -Wpedantic -Werror -DBOOST_ENABLE_ASSERT_HANDLER -fsyntax-only
        -I${include_dir} ${WORK_DIR}/all-headers.cpp)
