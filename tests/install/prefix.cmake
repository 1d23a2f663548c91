# Installs and moves the prefix: whatever remembers the first place fails in the tests that follow.
include(${CMAKE_CURRENT_LIST_DIR}/Run.cmake)

file(REMOVE_RECURSE ${WORK_DIR})
run(log ${CMAKE_COMMAND} --install ${BUILD_DIR} --prefix ${WORK_DIR}/first-place)
file(RENAME ${WORK_DIR}/first-place ${WORK_DIR}/prefix)

foreach(path
        bin/glogview bin/gallery bin/glog-artwork
        include/glogpanes/buttons/OvalButtonPane.h include/glogpanes/desktop/Desktop.h
        include/glogpanes/dialogs/LoadGlog.h include/glogpanes/frame/Provider.h include/glogpanes/host/GlogPane.h
        include/glogpanes/text/LabelPane.h
        ${LIBDIR}/cmake/GlogPanes/GlogPanesConfig.cmake ${LIBDIR}/cmake/GlogPanes/GlogPanesConfigVersion.cmake
        ${LIBDIR}/libglogdesktop.so ${LIBDIR}/libglogpanes.so ${LIBDIR}/libglogdialogs.so
        ${LIBDIR}/pkgconfig/glogdesktop.pc ${LIBDIR}/pkgconfig/glogpanes.pc ${LIBDIR}/pkgconfig/glogdialogs.pc
        share/glogpanes/artwork/fonts.xml share/glogpanes/gallery share/glogpanes/glog.xsd)
  require_file(${WORK_DIR}/prefix/${path})
endforeach()
