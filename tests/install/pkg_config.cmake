# Compiles the example with the flags that pkg-config gives, and runs it.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

set(ENV{PKG_CONFIG_PATH} ${WORK_DIR}/prefix/${LIBDIR}/pkgconfig)
set(build ${WORK_DIR}/hello-pkg-config)
file(REMOVE_RECURSE ${build})
file(MAKE_DIRECTORY ${build})

foreach(library glogdesktop glogpanes glogdialogs)
  run(log pkg-config --exists --print-errors ${library})
endforeach()

run(package_flags pkg-config --cflags --libs glogdialogs)
separate_arguments(package_flags UNIX_COMMAND "${package_flags}")
separate_arguments(flags UNIX_COMMAND "${FLAGS}")
run(log ${COMPILER} -std=c++17 ${flags} ${SOURCE_DIR}/examples/hello/main.cpp ${package_flags}
        -Wl,-rpath,${WORK_DIR}/prefix/${LIBDIR} -o ${build}/hello)
file(COPY ${SOURCE_DIR}/examples/hello/hello.xml DESTINATION ${build})
require_hello(${build})
