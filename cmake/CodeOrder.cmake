# Where the functions of a library lie.
#
# When somebody has paused, the processor has forgotten all of the program, and its answer to a click takes the longer,
# the more pages of code that runs through. So the functions that answer people lie side by side, ahead of those that do
# not: cmake/order/NAME.txt lists those of libglogNAME in the order in which they lie, by their symbols. It is measured by
# bench/order/run. Functions that are not in the list lie where they always would, and names in it that are no
# function's do no harm, so that it may grow old.

# The linker's own script for shared libraries, empty for a linker that has none.
function(glog_find_linker_script result)
  execute_process(COMMAND ${CMAKE_CXX_COMPILER} -shared -Wl,--verbose -o ${CMAKE_BINARY_DIR}/CMakeFiles/empty.so
                  OUTPUT_VARIABLE told ERROR_QUIET)
  set(script "")
  set(fence "\n==================================================\n")
  string(LENGTH "${fence}" width)
  string(FIND "${told}" "${fence}" begin)
  string(FIND "${told}" "${fence}" end REVERSE)
  if(end GREATER begin AND begin GREATER_EQUAL 0)
    math(EXPR begin "${begin} + ${width}")
    math(EXPR length "${end} - ${begin}")
    string(SUBSTRING "${told}" ${begin} ${length} script)
  endif()
  set(${result} "${script}" PARENT_SCOPE)
endfunction()

# glog_order_code(NAME): only for speed, so that other builds than that for use do without, as does one with a linker
# that cannot.
function(glog_order_code name)
  set(list ${CMAKE_SOURCE_DIR}/cmake/order/${name}.txt)
  if(NOT CMAKE_BUILD_TYPE MATCHES "^Rel" OR GLOG_SANITIZE OR NOT EXISTS ${list})
    return()
  endif()
  glog_find_linker_script(script)
  set(first "*(.text.unlikely") # what the linker puts at the beginning of the code
  string(FIND "${script}" "${first}" place)
  if(place LESS 0)
    message(STATUS "The linker has no script in which the code of ${name} could be ordered")
    return()
  endif()
  file(STRINGS ${list} symbols REGEX "^[^#]")
  list(TRANSFORM symbols REPLACE "(.+)" "    *(.text.\\1)\n")
  string(JOIN "" sections ${symbols})
  string(REPLACE "${first}" "\n${sections}    ${first}" script "${script}")
  set(ordered ${CMAKE_BINARY_DIR}/${name}.ld)
  file(CONFIGURE OUTPUT ${ordered} CONTENT "${script}" @ONLY) # leaves it alone when nothing has changed
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${list})
  target_compile_options(${name} PRIVATE -ffunction-sections)
  target_link_options(${name} PRIVATE LINKER:-T,${ordered})
  set_property(TARGET ${name} APPEND PROPERTY LINK_DEPENDS ${ordered})
endfunction()
