# How every target of this tree is compiled.

add_library(glog_flags INTERFACE)
target_compile_options(glog_flags INTERFACE -Wall -Wextra -Wpedantic -Werror -fno-omit-frame-pointer)
# Clang looks into std::auto_ptr, which deletes helpers of drawing by a type that has no virtual destructor; see
# text/GTextPaneDrawingHelper.h.
target_compile_options(glog_flags INTERFACE $<$<CXX_COMPILER_ID:Clang>:-Wno-delete-abstract-non-virtual-dtor>)
if(GLOG_SANITIZE)
  # A recovering sanitizer would let a broken test pass.
  add_compile_options(-fsanitize=${GLOG_SANITIZE} -fno-sanitize-recover=all)
  add_link_options(-fsanitize=${GLOG_SANITIZE})
endif()

# glog_library(NAME FOLDER...): the shared library libglogNAME from all sources of the folders.
function(glog_library name)
  set(sources "")
  foreach(folder ${ARGN})
    file(GLOB found CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/${folder}/*.cpp)
    list(APPEND sources ${found})
  endforeach()
  add_library(${name} SHARED ${sources})
  set_target_properties(${name} PROPERTIES OUTPUT_NAME glog${name} VERSION ${PROJECT_VERSION} SOVERSION 0)
  target_include_directories(${name} PUBLIC $<BUILD_INTERFACE:${CMAKE_SOURCE_DIR}>
                             $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}/glogpanes>)
  target_compile_definitions(${name} PUBLIC BOOST_ENABLE_ASSERT_HANDLER)
  target_compile_features(${name} PUBLIC cxx_std_17)
  target_link_libraries(${name} PRIVATE $<BUILD_INTERFACE:glog_flags>)
  # A library calls its own functions straight, not through a table where others could put theirs. What programs may
  # replace are variables.
  target_compile_options(${name} PRIVATE -fno-semantic-interposition)
  target_link_options(${name} PRIVATE -Wl,-Bsymbolic-functions)
  glog_order_code(${name})
endfunction()

# glog_program(NAME SOURCES...): a program of this tree.
function(glog_program name)
  add_executable(${name} ${ARGN})
  target_link_libraries(${name} PRIVATE glog_flags)
endfunction()

# What tests and tools do is done by the libraries: a sanitizer's checks are compiled into them three times as fast
# without optimisation.
set(glog_quick_options "")
if(GLOG_SANITIZE)
  set(glog_quick_options -O0)
endif()

# glog_add_test(NAME FOLDER LIBS...): one GoogleTest program from all sources of tests/FOLDER. ctest knows each of its
# tests by name, as a process of its own, labelled "alone". Many processes take long, so with
# "ctest -C together -LE alone" the program runs in two halves instead, NAME.0 and NAME.1.
function(glog_add_test name folder)
  file(GLOB sources CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/tests/${folder}/*.cpp)
  if(NOT sources)
    return()
  endif()
  glog_program(${name} ${sources})
  target_include_directories(${name} PRIVATE ${CMAKE_SOURCE_DIR})
  target_link_libraries(${name} PRIVATE ${ARGN} test_main)
  if(TARGET artwork)
    add_dependencies(${name} artwork)
  endif()
  target_compile_options(${name} PRIVATE ${glog_quick_options})
  target_precompile_headers(${name} REUSE_FROM test_headers)
  target_compile_definitions(${name} PRIVATE GLOG_TEST_SOURCE_DIR="${CMAKE_SOURCE_DIR}/tests"
                             GLOG_TEST_OUTPUT_DIR="${CMAKE_BINARY_DIR}/test-output")
  gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 60 PROPERTIES TIMEOUT 120 LABELS alone)
  # Without a sanitizer in another order, so that no test lives on what an earlier one left.
  set(order "")
  if(NOT GLOG_SANITIZE)
    set(order ";GTEST_SHUFFLE=1;GTEST_RANDOM_SEED=1")
  endif()
  foreach(half 0 1)
    add_test(NAME ${name}.${half} COMMAND ${name} CONFIGURATIONS together)
    set_tests_properties(${name}.${half} PROPERTIES TIMEOUT 600 ENVIRONMENT
                         "GTEST_BRIEF=1;GTEST_TOTAL_SHARDS=2;GTEST_SHARD_INDEX=${half}${order}")
  endforeach()
endfunction()
