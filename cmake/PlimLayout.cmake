# Where things lie, in the build folder and installed: the programs find Components/ beside them and
# the libraries in ../lib, so that they run from the build folder exactly as they do installed.

include(GNUInstallDirs)

set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/bin)
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)
set(CMAKE_ARCHIVE_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/lib)
set(PLIM_COMPONENTS_DIR ${CMAKE_BINARY_DIR}/bin/Components)

set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)
# The headers of all libraries, in folders whose names cannot meet those of the system.
set(PLIM_INSTALL_INCLUDEDIR ${CMAKE_INSTALL_INCLUDEDIR}/plimworks)
# Where installed libraries find each other; programs and component libraries have paths of their own.
set(CMAKE_INSTALL_RPATH "$ORIGIN")
