# What an installation holds, and how programs outside of this tree find it:
#
#   include/glogpanes/            headers; #include "buttons/OvalButtonPane.h"
#   lib/                          libglogdesktop, libglogpanes, libglogdialogs
#   lib/cmake/GlogPanes/          find_package(GlogPanes)
#   lib/pkgconfig/                glogdesktop, glogpanes, glogdialogs
#   bin/                          glogview, gallery, glog-artwork
#   share/glogpanes/              artwork, the gallery's pages, glog.xsd
#
# Tools, gallery and artwork are installed by the folders that build them. Nothing in the installation names the place
# it was installed to, so that the whole prefix can be moved.
include(CMakePackageConfigHelpers)

set(GLOG_INSTALL_INCLUDEDIR ${CMAKE_INSTALL_INCLUDEDIR}/glogpanes)
set(GLOG_INSTALL_CMAKEDIR ${CMAKE_INSTALL_LIBDIR}/cmake/GlogPanes)
set(GLOG_INSTALL_PKGCONFIGDIR ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
set(GLOG_INSTALL_DATADIR ${CMAKE_INSTALL_DATADIR}/glogpanes)

set(installed_libraries "")
foreach(library desktop panes dialogs)
  if(TARGET ${library})
    list(APPEND installed_libraries ${library})
  endif()
endforeach()

# Of these folders every header is for programs.
foreach(folder host frame buttons scrolling lists text menus tabs graphics)
  if(IS_DIRECTORY ${CMAKE_SOURCE_DIR}/${folder})
    install(DIRECTORY ${folder} DESTINATION ${GLOG_INSTALL_INCLUDEDIR} FILES_MATCHING PATTERN "*.h")
  endif()
endforeach()

# Of these only what opens a desktop, loads dialogs and adds a program's own panes and resources to them.
set(public_headers
    desktop/AssertionHandler.h
    desktop/Desktop.h
    desktop/SimulatedDesktop.h
    desktop/observe/JsonLine.h
    desktop/observe/MessageTrace.h
    desktop/observe/TreeDump.h
    desktop/resources/ResourceError.h
    desktop/resources/Resources.h)
if(TARGET dialogs)
  list(APPEND public_headers
       dialogs/FindItem.h
       dialogs/ItemRegistry.h
       dialogs/ItemType.h
       dialogs/KeyFault.h
       dialogs/KeyList.h
       dialogs/LoadError.h
       dialogs/LoadGlog.h
       dialogs/MessageReporter.h
       dialogs/RecordBytes.h
       dialogs/RecordFile.h
       dialogs/Utf8.h)
endif()
foreach(header ${public_headers})
  get_filename_component(folder ${header} DIRECTORY)
  install(FILES ${header} DESTINATION ${GLOG_INSTALL_INCLUDEDIR}/${folder})
endforeach()

# The libraries lie beside each other, wherever that is.
set_target_properties(${installed_libraries} PROPERTIES INSTALL_RPATH "$ORIGIN")
install(TARGETS ${installed_libraries} EXPORT GlogPanesTargets LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR})
install(EXPORT GlogPanesTargets NAMESPACE GlogPanes:: DESTINATION ${GLOG_INSTALL_CMAKEDIR})

configure_package_config_file(
  ${CMAKE_SOURCE_DIR}/cmake/GlogPanesConfig.cmake.in ${CMAKE_BINARY_DIR}/package/GlogPanesConfig.cmake
  INSTALL_DESTINATION ${GLOG_INSTALL_CMAKEDIR}
  PATH_VARS GLOG_INSTALL_DATADIR
  NO_CHECK_REQUIRED_COMPONENTS_MACRO)
# Until 1.0 any minor version may break programs.
write_basic_package_version_file(${CMAKE_BINARY_DIR}/package/GlogPanesConfigVersion.cmake
                                 COMPATIBILITY SameMinorVersion)
install(FILES ${CMAKE_BINARY_DIR}/package/GlogPanesConfig.cmake
              ${CMAKE_BINARY_DIR}/package/GlogPanesConfigVersion.cmake
        DESTINATION ${GLOG_INSTALL_CMAKEDIR})

# The prefix seen from the directory of the .pc files.
file(RELATIVE_PATH GLOG_PC_TO_PREFIX /prefix/${GLOG_INSTALL_PKGCONFIGDIR} /prefix)
string(REGEX REPLACE "/$" "" GLOG_PC_TO_PREFIX ${GLOG_PC_TO_PREFIX})
set(pc_requires_panes glogdesktop)
set(pc_requires_dialogs glogpanes)
set(pc_title_desktop "Glog desktop")
set(pc_title_panes "Glog Panes")
set(pc_title_dialogs "Glog dialogs")
set(pc_text_desktop "The desktop under the panes: windows, drawing, text and events")
set(pc_text_panes "Stock user-interface panes")
set(pc_text_dialogs "Windows with panes from dialog files")
foreach(library ${installed_libraries})
  set(GLOG_PC_NAME glog${library})
  set(GLOG_PC_TITLE ${pc_title_${library}})
  set(GLOG_PC_TEXT ${pc_text_${library}})
  set(GLOG_PC_REQUIRES "${pc_requires_${library}}")
  configure_file(${CMAKE_SOURCE_DIR}/cmake/library.pc.in ${CMAKE_BINARY_DIR}/package/glog${library}.pc @ONLY)
  install(FILES ${CMAKE_BINARY_DIR}/package/glog${library}.pc DESTINATION ${GLOG_INSTALL_PKGCONFIGDIR})
endforeach()

if(EXISTS ${CMAKE_SOURCE_DIR}/docs/glog.xsd)
  install(FILES docs/glog.xsd DESTINATION ${GLOG_INSTALL_DATADIR})
endif()

# cpack: one Debian package with everything.
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME glogpanes)
set(CPACK_PACKAGE_VENDOR "Glog Panes")
set(CPACK_PACKAGE_CONTACT "Glog Panes maintainers <maintainers@glogpanes.example>")
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_PACKAGE_DESCRIPTION
    "A shared library of stock panes, the desktop that they live on, and a loader of
dialogs in XML; with a viewer for dialogs and a gallery of everything there is.")
# The headers include Boost's, and the artwork's font table names the Roboto files. The rest, dpkg-shlibdeps finds.
set(CPACK_DEBIAN_PACKAGE_DEPENDS "libboost-dev, fonts-roboto-unhinted")
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_LIBRARY_OUTPUT_DIRECTORY})
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
include(CPack)
