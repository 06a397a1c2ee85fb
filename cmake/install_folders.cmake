# Where things are installed below the prefix.
include(GNUInstallDirs)
# On Debian libraries have their architecture's folder, whatever the prefix.
if(CMAKE_INSTALL_LIBDIR STREQUAL "lib" AND CMAKE_LIBRARY_ARCHITECTURE AND EXISTS /etc/debian_version)
  set(CMAKE_INSTALL_LIBDIR lib/${CMAKE_LIBRARY_ARCHITECTURE})
endif()
set(GRIDBAY_DOC_FOLDER ${CMAKE_INSTALL_DATADIR}/doc/gridbay-setup)
# The programs look for these from where they lie themselves (platform/files/program_path.h).
set(GRIDBAY_PLUGIN_FOLDER ${CMAKE_INSTALL_LIBDIR}/gridbay-setup)
set(GRIDBAY_DATA_FOLDER ${CMAKE_INSTALL_DATADIR}/gridbay-setup)
