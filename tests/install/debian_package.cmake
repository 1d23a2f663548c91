# Packs the Debian package and looks into it.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

set(out ${WORK_DIR}-package)
file(REMOVE_RECURSE ${out})
run(log ${CPACK} --config ${BUILD_DIR}/CPackConfig.cmake -G DEB -B ${out})
file(GLOB packages ${out}/glogpanes_${VERSION}_*.deb)
list(LENGTH packages count)
if(NOT count EQUAL 1)
  message(FATAL_ERROR "cpack made ${count} packages:\n${log}")
endif()

# require_text(TEXT PART...): ends the script unless each part occurs in the text.
function(require_text text)
  foreach(part ${ARGN})
    string(FIND "${text}" "${part}" place)
    if(place EQUAL -1)
      message(FATAL_ERROR "\"${part}\" is missing in:\n${text}")
    endif()
  endforeach()
endfunction()

run(control dpkg-deb -I ${packages})
require_text("${control}" "Package: glogpanes" "Version: ${VERSION}" libboost-dev fonts-roboto-unhinted libsdl2-2.0-0
             libcairo2 libpango-1.0-0 libpixman-1-0 libpugixml1v5)
run(content dpkg-deb -c ${packages})
require_text("${content}" /usr/bin/glogview /usr/bin/gallery /usr/lib/libglogdesktop.so.0
             /usr/lib/libglogpanes.so.0 /usr/lib/libglogdialogs.so.0 /usr/include/glogpanes/host/GlogPane.h
             /usr/lib/cmake/GlogPanes/GlogPanesConfig.cmake /usr/share/glogpanes/artwork/fonts.xml)

# Unpacked elsewhere it works without being installed.
run(log dpkg-deb -x ${packages} ${out}/unpacked)
run(log ${out}/unpacked/usr/bin/glogview ${SOURCE_DIR}/examples/hello/hello.xml --png ${out}/hello.png)
require_file(${out}/hello.png)
