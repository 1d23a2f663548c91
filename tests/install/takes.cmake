# Builds the guide's example as its reader would, runs its test, and uses its real window.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

set(build ${WORK_DIR}/takes)
file(REMOVE_RECURSE ${build})
run(log ${CMAKE_COMMAND} -S ${SOURCE_DIR}/examples/takes -B ${build} -G ${GENERATOR}
        -DCMAKE_PREFIX_PATH=${WORK_DIR}/prefix -DCMAKE_CXX_COMPILER=${COMPILER} -DCMAKE_CXX_FLAGS=${FLAGS})
run(log ${CMAKE_COMMAND} --build ${build})
run(log ${CMAKE_CTEST_COMMAND} --test-dir ${build} --output-on-failure)
# The button that ends the program.
run(log ${CMAKE_COMMAND} -E chdir ${build} ${SOURCE_DIR}/tests/window/run-under-xvfb.sh
        ${CMAKE_CURRENT_LIST_DIR}/use-window.sh ./takes Takes mousemove --window WINDOW 248 170 click 1)
