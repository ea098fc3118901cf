# The Debian packages, one for each component of the installation. scripts/package makes them from a build that is
# configured for it (preset package).

set(PLIM_MAINTAINER "Plimworks packaging <nobody@plimworks.invalid>"
  CACHE STRING "Who answers for the packages: name and address")

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME plimworks)
# Each package has a description of its own, which this one would be put before.
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(CPACK_PACKAGE_VENDOR Plimworks)
set(CPACK_PACKAGE_CONTACT "${PLIM_MAINTAINER}")
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR}/packages)
set(CPACK_PACKAGING_INSTALL_PREFIX ${CMAKE_INSTALL_PREFIX})
set(CPACK_COMPONENTS_ALL designer runtime development)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)

# What the components' folders get beside what is installed, and what is compressed there.
set(CPACK_PRE_BUILD_SCRIPTS ${CMAKE_CURRENT_SOURCE_DIR}/debian/Finish.cmake)
set(CPACK_POST_BUILD_SCRIPTS ${CMAKE_CURRENT_SOURCE_DIR}/debian/LeaveToTriggers.cmake)

set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SOURCE plimworks)
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(CPACK_DEBIAN_COMPRESSION_TYPE xz)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
# Between each other the packages depend on the same version: the classes that they share change with each one.
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
# The libraries of the other packages, which are not installed where the packages are made.
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_LIBRARY_OUTPUT_DIRECTORY})
# For those who package programs that link the libraries.
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)

# The desktop entry, the document types, the icons and the manual pages are taken up by the file triggers of the
# packages that read them. Libraries need one here.
foreach(component DESIGNER RUNTIME)
  set(CPACK_DEBIAN_${component}_PACKAGE_CONTROL_EXTRA ${CMAKE_CURRENT_SOURCE_DIR}/debian/triggers)
endforeach()

set(CPACK_DEBIAN_DESIGNER_PACKAGE_NAME plimworks)
set(CPACK_DEBIAN_DESIGNER_PACKAGE_SECTION devel)
set(CPACK_COMPONENT_DESIGNER_DEPENDS runtime)
# What is generated is compiled with what the other package has.
set(CPACK_DEBIAN_DESIGNER_PACKAGE_RECOMMENDS "plimworks-dev, shared-mime-info, hicolor-icon-theme")
set(CPACK_DEBIAN_DESIGNER_DESCRIPTION "visual application designer for the Be API
Plimworks lays out windows: components are chosen on a palette, placed on
forms with the mouse, and given their properties and events. It writes the
C++ source of a complete application, in which the developer's own code
survives every regeneration.

This package has the designer, the generator plimgen for scripts and
builds, plimcheck, which tries component libraries, and the libraries with
the components of the palette.
")

set(CPACK_DEBIAN_RUNTIME_PACKAGE_NAME plimworks-runtime)
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SECTION libs)
# The display module looks for an X server through libxcb, which it loads itself. The platforms xcb and offscreen come
# with the library of Qt that it links; the others are plugins in packages of their own.
set(CPACK_DEBIAN_RUNTIME_PACKAGE_DEPENDS "libxcb1")
set(CPACK_DEBIAN_RUNTIME_PACKAGE_RECOMMENDS "qt6-wayland, shared-mime-info")
set(CPACK_DEBIAN_RUNTIME_PACKAGE_SUGGESTS "qt6-qpa-plugins")
set(CPACK_DEBIAN_RUNTIME_DESCRIPTION "run-time libraries of applications made with Plimworks
Applications that Plimworks generates use the Be API and a small class
library, Ormi. This package has both, and the module that shows their
windows on X11 and Wayland by way of Qt.
")

set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_NAME plimworks-dev)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SECTION libdevel)
set(CPACK_COMPONENT_DEVELOPMENT_DEPENDS designer runtime)
set(CPACK_DEBIAN_DEVELOPMENT_PACKAGE_SUGGESTS "cmake, g++, pkg-config")
set(CPACK_DEBIAN_DEVELOPMENT_DESCRIPTION "development files for applications made with Plimworks
What compiles the applications that Plimworks generates, and component
libraries for its palette: the headers of the Be API, of Ormi and of the
designer's classes, the CMake packages Ormi and Plimworks, and ormi.pc for
pkg-config.
")

include(CPack)
