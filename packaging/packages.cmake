# Debian packages, made of what the rooms install: cpack in the build folder. A package is made where there is something to be in it:
#   gridbay-setup          component `programs`: the tools, the desktop, what they load and show
#   libgridbay-setup-dev   components `libraries` and `development`: the libraries for programs of others, with their headers
#   python3-gridbay-setup  component `python`
get_cmake_property(components COMPONENTS)
foreach(package gridbay-setup:programs libgridbay-setup-dev:libraries libgridbay-setup-dev:development python3-gridbay-setup:python)
  string(REPLACE ":" ";" parts ${package})
  list(GET parts 0 name)
  list(GET parts 1 component)
  if(component IN_LIST components)
    list(APPEND CPACK_COMPONENTS_ALL ${component})
    string(TOUPPER ${component} upper)
    set(CPACK_COMPONENT_${upper}_GROUP ${name})
    if(NOT name IN_LIST packages)
      list(APPEND packages ${name})
      install(FILES ${CMAKE_CURRENT_SOURCE_DIR}/copyright DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${name} COMPONENT ${component})
      install(FILES ${CMAKE_CURRENT_BINARY_DIR}/changelog.gz DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${name} COMPONENT ${component})
    endif()
  endif()
endforeach()
set(changelog ${CMAKE_CURRENT_BINARY_DIR}/changelog.gz)
configure_file(changelog ${CMAKE_CURRENT_BINARY_DIR}/changelog @ONLY)
add_custom_command(OUTPUT ${changelog} COMMAND gzip -9nc ${CMAKE_CURRENT_BINARY_DIR}/changelog > ${changelog}
                   DEPENDS ${CMAKE_CURRENT_BINARY_DIR}/changelog VERBATIM)
add_custom_target(package_changelog ALL DEPENDS ${changelog})

set(CPACK_GENERATOR DEB)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_GROUPING ONE_PER_GROUP)
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR}/packages)
set(CPACK_OUTPUT_FILE_PREFIX ${PROJECT_BINARY_DIR}/packages)
set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)

set(CPACK_PACKAGE_NAME gridbay-setup)
# Each package has its own: the first line of its description.
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(CPACK_PACKAGE_VENDOR "Gridbay Setup developers")
set(CPACK_PACKAGE_CONTACT "Gridbay Setup developers <developers@gridbay.invalid>")
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)

set(CPACK_DEBIAN_GRIDBAY-SETUP_PACKAGE_NAME gridbay-setup)
set(CPACK_DEBIAN_GRIDBAY-SETUP_PACKAGE_SECTION science)
set(CPACK_DEBIAN_GRIDBAY-SETUP_DESCRIPTION
    "Setup editor of a nested-grid flow model
Prepares the input of a two-dimensional free-surface flow model: the grids
and how they nest, open boundaries, sources, rain and wind, resistance,
structures, what is written, and where wanted the transport of dissolved
components, mud, or an ecological model. It checks all of that and keeps it
in one readable text file.
.
This package has the command-line tools v27setup and v27setup-wsk and the
desktop vanedeck-shell.")
set(CPACK_DEBIAN_GRIDBAY-SETUP_PACKAGE_RECOMMENDS "proj-data, hicolor-icon-theme, shared-mime-info")
set(CPACK_DEBIAN_GRIDBAY-SETUP_PACKAGE_SUGGESTS "libgridbay-setup-dev, python3-gridbay-setup, qt6-wayland")

set(CPACK_DEBIAN_LIBGRIDBAY-SETUP-DEV_PACKAGE_NAME libgridbay-setup-dev)
set(CPACK_DEBIAN_LIBGRIDBAY-SETUP-DEV_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_LIBGRIDBAY-SETUP-DEV_DESCRIPTION
    "Libraries to make setups of a nested-grid flow model
The libraries by which other programs make, fill and check setups, one for
each edition of the model, with their headers, a CMake package and a file for
pkg-config.")
set(CPACK_DEBIAN_LIBGRIDBAY-SETUP-DEV_PACKAGE_RECOMMENDS "gridbay-setup (= ${PROJECT_VERSION})")

set(CPACK_DEBIAN_PYTHON3-GRIDBAY-SETUP_PACKAGE_NAME python3-gridbay-setup)
set(CPACK_DEBIAN_PYTHON3-GRIDBAY-SETUP_PACKAGE_SECTION python)
set(CPACK_DEBIAN_PYTHON3-GRIDBAY-SETUP_DESCRIPTION
    "Python module for setups of a nested-grid flow model
A module to make, fill, check and walk through setups, to convert rasters and
series, and to reach the values of grids as arrays.")
# The raster reader and the templates are in the package of the programs.
set(CPACK_DEBIAN_PYTHON3-GRIDBAY-SETUP_PACKAGE_DEPENDS
    "python3 (>= 3.11), python3 (<< 3.12), python3-numpy, gridbay-setup (= ${PROJECT_VERSION})")
include(CPack)
foreach(package ${packages})
  cpack_add_component_group(${package})
endforeach()
