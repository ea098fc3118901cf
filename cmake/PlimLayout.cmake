# Where things lie, in the build folder and installed: the programs find Components/ beside them and
# the libraries in ../lib, so that they run from the build folder exactly as they do installed.

include(GNUInstallDirs)

set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)
set(CMAKE_ARCHIVE_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)

set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)
# The headers of all libraries, in folders whose names cannot meet those of the system.
set(PLIM_INSTALL_INCLUDEDIR ${CMAKE_INSTALL_INCLUDEDIR}/plimworks)
# Where installed libraries find each other; programs and component libraries have paths of their own.
set(CMAKE_INSTALL_RPATH "$ORIGIN")

# For plimworks_add_component_library(): where component libraries and their headers for generated programs go, in the
# build folder and installed.
set(Plimworks_OUTPUT_DIR ${CMAKE_BINARY_DIR}/bin/Components)
set(Plimworks_COMPONENTS_DIR ${CMAKE_INSTALL_BINDIR}/Components)
set(Plimworks_COMPONENTS_RPATH "$ORIGIN/../../${CMAKE_INSTALL_LIBDIR}")
set(Plimworks_RUNTIME_DIR ${PLIM_INSTALL_INCLUDEDIR})
# Headers that other projects install for programs that use this build folder.
set(PLIM_BUILD_RUNTIME_DIR ${CMAKE_BINARY_DIR}/include)
file(MAKE_DIRECTORY ${PLIM_BUILD_RUNTIME_DIR})
