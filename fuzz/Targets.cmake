# What the fuzzers and the tests that replay their corpora have in common.

# glog_fuzz_programs(PREFIX DRIVER): a program PREFIXName for each target FuzzName.cpp, from the target, what targets
# share, and the driver: a library or link option with the main function. Sets glog_fuzz_names to the names.
function(glog_fuzz_programs prefix driver)
  set(folder ${CMAKE_SOURCE_DIR}/fuzz)
  file(GLOB shared CONFIGURE_DEPENDS ${folder}/support/*.cpp)
  add_library(${prefix}support STATIC ${shared})
  target_include_directories(${prefix}support PUBLIC ${CMAKE_SOURCE_DIR})
  target_link_libraries(${prefix}support PUBLIC dialogs PkgConfig::PIXMAN PRIVATE glog_flags)
  set(names "")
  file(GLOB targets CONFIGURE_DEPENDS ${folder}/Fuzz*.cpp)
  foreach(source ${targets})
    get_filename_component(target ${source} NAME_WE)
    string(REPLACE Fuzz "" name ${target})
    glog_program(${prefix}${name} ${source})
    target_link_libraries(${prefix}${name} PRIVATE ${prefix}support ${driver})
    list(APPEND names ${name})
  endforeach()
  set(glog_fuzz_names ${names} PARENT_SCOPE)
endfunction()

# glog_storm_program(NAME): the program of random events over the gallery's pages and random dialogs.
function(glog_storm_program name)
  set(folder ${CMAKE_SOURCE_DIR}/fuzz/storm)
  file(GLOB sources CONFIGURE_DEPENDS ${folder}/*.cpp)
  file(GLOB gallery CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/tools/gallery/*.cpp)
  list(FILTER gallery EXCLUDE REGEX "/(main|CommandLine)\\.cpp$")
  glog_program(${name} ${sources} ${gallery} ${CMAKE_SOURCE_DIR}/tools/TextFile.cpp)
  target_include_directories(${name} PRIVATE ${CMAKE_SOURCE_DIR})
  target_link_libraries(${name} PRIVATE dialogs)
  # It finds the pages beside itself, as the gallery does.
  add_dependencies(${name} gallery_pages artwork)
endfunction()
