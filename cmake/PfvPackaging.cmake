# Installation and the Debian package. Installed layout (prefix /usr in the package):
#   bin/pfv                         the program
#   lib/pfv/                        the platform's libraries and the viewer's modules
#   share/pfv/resources, examples   configuration, catalogues, icons; the sample lines
#   share/applications, icons, mime the desktop entry, its icon and the .pprx document type
# The program finds lib/pfv and share/pfv/resources beside its own folder, so nothing needs an
# environment variable.
include(GNUInstallDirs)

# Fixed (not the multiarch folder GNUInstallDirs may pick): the program looks exactly there.
set(PFV_INSTALL_LIBDIR lib/pfv)
set(pfv_installed_libraries vor_kernel vor_model vor_interaction vor_visu vor_dialog vor_frame
                            vor_pert QELZitBltModel QELZitBltVisu QELProductFlowViewer
                            QELFpaViewerCmds)
if(PFV_WITH_QT)
  list(APPEND pfv_installed_libraries vor_qt)
endif()
# Libraries and modules find each other in their own folder, the program one folder over.
set_target_properties(${pfv_installed_libraries} PROPERTIES INSTALL_RPATH "$ORIGIN")
set_target_properties(pfv PROPERTIES INSTALL_RPATH "$ORIGIN/../${PFV_INSTALL_LIBDIR}")
install(TARGETS pfv RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
install(TARGETS ${pfv_installed_libraries}
        LIBRARY DESTINATION ${PFV_INSTALL_LIBDIR}
        RUNTIME DESTINATION ${PFV_INSTALL_LIBDIR})
install(DIRECTORY ${PFV_RESOURCE_DIR}/ DESTINATION ${CMAKE_INSTALL_DATADIR}/pfv/resources)
install(FILES ${CMAKE_SOURCE_DIR}/examples/underbody.pprx
              ${CMAKE_SOURCE_DIR}/examples/underbody-hub.pprx
        DESTINATION ${CMAKE_INSTALL_DATADIR}/pfv/examples)
install(FILES ${CMAKE_SOURCE_DIR}/packaging/pfv.desktop
        DESTINATION ${CMAKE_INSTALL_DATADIR}/applications)
install(FILES ${CMAKE_SOURCE_DIR}/packaging/pfv.svg
        DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps)
install(FILES ${CMAKE_SOURCE_DIR}/packaging/pfv-pprx.xml
        DESTINATION ${CMAKE_INSTALL_DATADIR}/mime/packages)

set(CPACK_PACKAGE_NAME pfv)
set(CPACK_PACKAGE_VENDOR "Product Flow Viewer developers")
set(CPACK_PACKAGE_CONTACT "Product Flow Viewer developers <pfv@localhost>")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY
    "Process planning of body-in-white lines: PERT charts of activities with ZitBlt lists")
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION science)
# Library dependencies (Qt, Xerces-C++ ...) are read off the binaries.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_BINARY_DIR}/lib)
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS "shared-mime-info, desktop-file-utils")
include(CPack)
