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

# The programs have component libraries beside them. A system's folder of programs holds nothing else than programs, so
# that there they get a folder of their own.
option(PLIM_SEPARATE_PROGRAMS "Install the programs in a folder of their own, with links in the usual one" OFF)
set(PLIM_INSTALL_PROGRAMDIR ${CMAKE_INSTALL_BINDIR})
if(PLIM_SEPARATE_PROGRAMS)
  set(PLIM_INSTALL_PROGRAMDIR ${CMAKE_INSTALL_LIBDIR}/plimworks)
endif()
file(RELATIVE_PATH program_to_lib /${PLIM_INSTALL_PROGRAMDIR} /${CMAKE_INSTALL_LIBDIR})
string(REGEX REPLACE "/$" "" PLIM_PROGRAM_TO_LIB "${program_to_lib}")

# For plimworks_add_component_library(): where component libraries and their headers for generated programs go, in the
# build folder and installed.
set(Plimworks_OUTPUT_DIR ${CMAKE_BINARY_DIR}/bin/Components)
set(Plimworks_COMPONENTS_DIR ${PLIM_INSTALL_PROGRAMDIR}/Components)
set(Plimworks_COMPONENTS_RPATH "$ORIGIN/../${PLIM_PROGRAM_TO_LIB}")
set(Plimworks_RUNTIME_DIR ${PLIM_INSTALL_INCLUDEDIR})
set(Plimworks_LIBRARY_COMPONENT designer)
set(Plimworks_RUNTIME_COMPONENT development)
# Headers that other projects install for programs that use this build folder.
set(PLIM_BUILD_RUNTIME_DIR ${CMAKE_BINARY_DIR}/include)
file(MAKE_DIRECTORY ${PLIM_BUILD_RUNTIME_DIR})
