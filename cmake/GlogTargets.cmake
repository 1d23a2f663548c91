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
endfunction()

# glog_program(NAME SOURCES...): a program of this tree.
function(glog_program name)
  add_executable(${name} ${ARGN})
  target_link_libraries(${name} PRIVATE glog_flags)
endfunction()

# glog_add_test(NAME FOLDER LIBS...): one GoogleTest program from all sources of tests/FOLDER. Its tests are known to
# ctest, each a process of its own; with GLOG_TEST_SHARDS it runs in so many processes instead.
function(glog_add_test name folder)
  file(GLOB sources CONFIGURE_DEPENDS ${CMAKE_SOURCE_DIR}/tests/${folder}/*.cpp)
  if(NOT sources)
    return()
  endif()
  glog_program(${name} ${sources})
  target_include_directories(${name} PRIVATE ${CMAKE_SOURCE_DIR})
  target_link_libraries(${name} PRIVATE ${ARGN} GTest::gtest GTest::gtest_main)
  target_precompile_headers(${name} PRIVATE <gtest/gtest.h>)
  target_compile_definitions(${name} PRIVATE GLOG_TEST_SOURCE_DIR="${CMAKE_SOURCE_DIR}/tests"
                             GLOG_TEST_OUTPUT_DIR="${CMAKE_BINARY_DIR}/test-output")
  if(NOT GLOG_TEST_SHARDS)
    gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 60 PROPERTIES TIMEOUT 120)
    return()
  endif()
  math(EXPR last "${GLOG_TEST_SHARDS} - 1")
  foreach(shard RANGE ${last})
    add_test(NAME ${name}.${shard} COMMAND ${name})
    set_tests_properties(${name}.${shard} PROPERTIES TIMEOUT 600 ENVIRONMENT
                         "GTEST_TOTAL_SHARDS=${GLOG_TEST_SHARDS};GTEST_SHARD_INDEX=${shard}")
  endforeach()
endfunction()
