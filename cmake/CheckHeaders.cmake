# Compiles every public header alone, with each compiler that is present, and lists those that fail.
#
#   cmake -DSOURCE_DIR=<tree> -DWORK_DIR=<scratch> -P CheckHeaders.cmake
#
# With ccache at hand, a run after the first costs about a second.
cmake_minimum_required(VERSION 3.25)

set(folders host frame buttons scrolling lists text menus tabs graphics dialogs desktop)
set(flags -std=c++17 -Wall -Wextra -Wpedantic -Werror -DBOOST_ENABLE_ASSERT_HANDLER -I${SOURCE_DIR})
set(optional_compilers clang++ clang++-14)

# Headers right in the folders: what lies deeper in desktop/ is its own affair.
set(headers "")
foreach(folder ${folders})
  file(GLOB found RELATIVE ${SOURCE_DIR} ${SOURCE_DIR}/${folder}/*.h)
  list(APPEND headers ${found})
endforeach()
if(NOT headers)
  message(FATAL_ERROR "No headers in ${SOURCE_DIR}")
endif()

find_program(CCACHE ccache)
if(CCACHE)
  set(launcher ${CCACHE})
else()
  set(launcher "")
endif()
find_program(GXX g++ REQUIRED)
set(compilers ${GXX})
find_program(CLANGXX NAMES ${optional_compilers})
if(CLANGXX)
  list(APPEND compilers ${CLANGXX})
endif()

# One small source for each pair. It includes the header twice, which finds a missing guard as well. Its name is
# relative, so that the compiler cache serves all build trees alike.
file(MAKE_DIRECTORY ${WORK_DIR})
set(jobs "")
foreach(compiler ${compilers})
  get_filename_component(compiler_name ${compiler} NAME)
  foreach(header ${headers})
    string(REPLACE "/" "_" name ${header})
    set(source ${compiler_name}-${name}.cpp)
    file(CONFIGURE OUTPUT ${WORK_DIR}/${source} CONTENT "#include \"${header}\"\n#include \"${header}\"\n")
    string(APPEND jobs "${compiler} ${header} ${source}\n")
  endforeach()
endforeach()
file(WRITE ${WORK_DIR}/jobs ${jobs})

cmake_host_system_information(RESULT cores QUERY NUMBER_OF_LOGICAL_CORES)
list(JOIN flags " " flags)
execute_process(
  COMMAND xargs -P ${cores} -L 1 sh -c
          "${launcher} $0 ${flags} -c $2 -o $2.o || { echo \"$1 does not compile alone with $0\"; exit 1; }"
  WORKING_DIRECTORY ${WORK_DIR}
  INPUT_FILE ${WORK_DIR}/jobs
  OUTPUT_VARIABLE failures
  ERROR_VARIABLE diagnostics
  RESULT_VARIABLE result)
list(LENGTH headers count)
list(LENGTH compilers kinds)
if(result)
  message(FATAL_ERROR "${diagnostics}\n${failures}")
endif()
message(STATUS "${count} headers compile alone with ${kinds} compiler(s)")
