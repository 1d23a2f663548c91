# For the scripts beside this one.

# run(OUTPUT COMMAND ARGUMENT...): runs the command and sets the variable OUTPUT to what it writes; a command that fails
# ends the script with everything that was written.
function(run output)
  execute_process(COMMAND ${ARGN} OUTPUT_VARIABLE written ERROR_VARIABLE complaints RESULT_VARIABLE result)
  if(NOT result EQUAL 0)
    list(JOIN ARGN " " command)
    message(FATAL_ERROR "${command}\nended with ${result}:\n${written}${complaints}")
  endif()
  set(${output} "${written}" PARENT_SCOPE)
endfunction()

# Ends the script unless the file or directory is there.
function(require_file path)
  if(NOT EXISTS ${path})
    message(FATAL_ERROR "${path} is missing")
  endif()
endfunction()

# Ends the script unless the simulated run of the example in the directory presses what its script presses.
function(require_hello directory)
  execute_process(COMMAND ./hello --simulated WORKING_DIRECTORY ${directory} OUTPUT_VARIABLE written
                  ERROR_VARIABLE complaints RESULT_VARIABLE result)
  if(NOT result EQUAL 0 OR NOT written STREQUAL "button 2\nbutton 1\n")
    message(FATAL_ERROR "hello ended with ${result} and wrote:\n${written}${complaints}")
  endif()
endfunction()
