# What is installed, and the packages by which other projects find the libraries: the CMake packages
# Ormi (for generated programs) and Plimworks (for component libraries), and ormi.pc. The packages are
# made in the build folder too, for use without an installation.
#
# Everything belongs to one of three components, which become packages: designer, runtime (what generated programs need
# where they run) and development.

set(ormi_cmake_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Ormi)
set(plimworks_cmake_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Plimworks)

# Programs and libraries

foreach(program plimworks plimgen plimcheck)
  if(TARGET ${program})
    set_target_properties(${program} PROPERTIES INSTALL_RPATH "$ORIGIN/${PLIM_PROGRAM_TO_LIB}")
    install(TARGETS ${program} EXPORT PlimworksTargets
      RUNTIME DESTINATION ${PLIM_INSTALL_PROGRAMDIR} COMPONENT designer)
    if(PLIM_SEPARATE_PROGRAMS)
      file(RELATIVE_PATH link_target /${CMAKE_INSTALL_BINDIR} /${PLIM_INSTALL_PROGRAMDIR}/${program})
      file(MAKE_DIRECTORY ${PROJECT_BINARY_DIR}/installed)
      file(CREATE_LINK ${link_target} ${PROJECT_BINARY_DIR}/installed/${program} SYMBOLIC)
      install(FILES ${PROJECT_BINARY_DIR}/installed/${program}
        DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT designer)
    endif()
  endif()
endforeach()

# Before version 1 each minor version may break what was linked with another one.
foreach(library be ormi plim plim_checked)
  set(type "")
  if(TARGET ${library})
    get_target_property(type ${library} TYPE)
  endif()
  if(type STREQUAL "SHARED_LIBRARY" AND NOT CMAKE_SYSTEM_NAME STREQUAL "Haiku")
    set_target_properties(${library} PROPERTIES VERSION ${PROJECT_VERSION}
      SOVERSION ${PROJECT_VERSION_MAJOR}.${PROJECT_VERSION_MINOR})
  endif()
endforeach()
install(TARGETS be ormi EXPORT OrmiTargets LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
  COMPONENT runtime NAMELINK_COMPONENT development)
install(TARGETS plim EXPORT PlimworksTargets LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
  COMPONENT designer NAMELINK_COMPONENT development)
if(TARGET be_display_qt)
  # libbe.so looks for it in its own folder.
  install(TARGETS be_display_qt LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT runtime)
endif()

# The paths to the libraries are the same in the build folder and installed. Paths to be replaced when
# installing end with an empty entry, in which the loader looks for every library at every start.

get_property(component_dirs DIRECTORY ${PROJECT_SOURCE_DIR}/components PROPERTY SUBDIRECTORIES)
foreach(dir IN LISTS component_dirs)
  get_property(libraries DIRECTORY ${dir} PROPERTY BUILDSYSTEM_TARGETS)
  foreach(library IN LISTS libraries)
    get_target_property(type ${library} TYPE)
    if(type STREQUAL "MODULE_LIBRARY")
      list(APPEND component_libraries ${library})
    endif()
  endforeach()
endforeach()
if(CMAKE_INSTALL_LIBDIR STREQUAL "lib")
  foreach(target plimworks plimgen plimcheck be ormi plim be_display_qt ${component_libraries})
    if(TARGET ${target})
      set_target_properties(${target} PROPERTIES BUILD_WITH_INSTALL_RPATH ON)
    endif()
  endforeach()
endif()

# Headers

install(DIRECTORY ${PROJECT_SOURCE_DIR}/ormi/include/
  DESTINATION ${PLIM_INSTALL_INCLUDEDIR} COMPONENT development
  FILES_MATCHING PATTERN "*.h")
if(NOT CMAKE_SYSTEM_NAME STREQUAL "Haiku")
  install(DIRECTORY ${PROJECT_SOURCE_DIR}/kits/include/
    DESTINATION ${PLIM_INSTALL_INCLUDEDIR}/be COMPONENT development
    FILES_MATCHING PATTERN "*.h")
endif()
# ComponentKit.h and what it includes.
install(DIRECTORY ${PROJECT_SOURCE_DIR}/src/model
  DESTINATION ${PLIM_INSTALL_INCLUDEDIR}/designer COMPONENT development
  FILES_MATCHING PATTERN "*.h")
install(DIRECTORY ${PROJECT_SOURCE_DIR}/src/props
  DESTINATION ${PLIM_INSTALL_INCLUDEDIR}/designer COMPONENT development
  FILES_MATCHING PATTERN "*Property.h" PATTERN "PropertyEditor.h" PATTERN "StringList.h"
  PATTERN "DialogParts.h" PATTERN "PendingEdit.h" PATTERN "PropertyModalEdit.h" PATTERN "PropertyWatch.h")
install(FILES ${PROJECT_SOURCE_DIR}/src/app/TypedMessage.h
  DESTINATION ${PLIM_INSTALL_INCLUDEDIR}/designer/app COMPONENT development)
install(FILES ${PROJECT_SOURCE_DIR}/src/palette/ClassEntry.h
  ${PROJECT_SOURCE_DIR}/src/palette/LibraryBuild.h ${PROJECT_SOURCE_DIR}/src/palette/PaletteEntry.h
  DESTINATION ${PLIM_INSTALL_INCLUDEDIR}/designer/palette COMPONENT development)

# The CMake packages

include(CMakePackageConfigHelpers)
# Where the package finds what belongs to it, from the folder that it is in; first for the build folder.
set(PLIMWORKS_ROOT ".")
set(PLIMWORKS_COMPONENTS bin/Components)
set(PLIMWORKS_RUNTIME include)
set(PLIMWORKS_FUNCTIONS ${PROJECT_SOURCE_DIR}/cmake/PlimworksLibrary.cmake)
configure_file(${PROJECT_SOURCE_DIR}/cmake/PlimworksConfig.cmake.in
  ${PROJECT_BINARY_DIR}/PlimworksConfig.cmake @ONLY)
file(RELATIVE_PATH PLIMWORKS_ROOT ${CMAKE_INSTALL_FULL_LIBDIR}/cmake/Plimworks ${CMAKE_INSTALL_PREFIX})
set(PLIMWORKS_COMPONENTS ${Plimworks_COMPONENTS_DIR})
set(PLIMWORKS_RUNTIME ${PLIM_INSTALL_INCLUDEDIR})
set(PLIMWORKS_FUNCTIONS "\${CMAKE_CURRENT_LIST_DIR}/PlimworksLibrary.cmake")
configure_file(${PROJECT_SOURCE_DIR}/cmake/PlimworksConfig.cmake.in
  ${PROJECT_BINARY_DIR}/installed/PlimworksConfig.cmake @ONLY)
configure_file(${PROJECT_SOURCE_DIR}/cmake/OrmiConfig.cmake.in ${PROJECT_BINARY_DIR}/OrmiConfig.cmake @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/OrmiConfig.cmake
  DESTINATION ${ormi_cmake_dir} COMPONENT development)
install(FILES ${PROJECT_BINARY_DIR}/installed/PlimworksConfig.cmake
  ${PROJECT_SOURCE_DIR}/cmake/PlimworksLibrary.cmake ${PROJECT_SOURCE_DIR}/cmake/PlimworksLibrary.cpp
  DESTINATION ${plimworks_cmake_dir} COMPONENT development)
foreach(package Ormi Plimworks)
  string(TOLOWER ${package} lower)
  write_basic_package_version_file(${PROJECT_BINARY_DIR}/${package}ConfigVersion.cmake
    COMPATIBILITY SameMinorVersion)
  export(EXPORT ${package}Targets NAMESPACE ${package}::
    FILE ${PROJECT_BINARY_DIR}/${package}Targets.cmake)
  install(EXPORT ${package}Targets NAMESPACE ${package}::
    DESTINATION ${${lower}_cmake_dir} COMPONENT development)
  install(FILES ${PROJECT_BINARY_DIR}/${package}ConfigVersion.cmake
    DESTINATION ${${lower}_cmake_dir} COMPONENT development)
endforeach()

# ormi.pc

# write_ormi_pc(FILE PREFIX LIBDIR INCLUDEDIR...)
function(write_ormi_pc file prefix libdir)
  set(ORMI_PC_PREFIX ${prefix})
  set(ORMI_PC_LIBDIR ${libdir})
  list(TRANSFORM ARGN PREPEND "-I")
  list(JOIN ARGN " " ORMI_PC_CFLAGS)
  configure_file(${PROJECT_SOURCE_DIR}/cmake/ormi.pc.in ${file} @ONLY)
endfunction()

# The folders of the kits' headers under root, where the host has none of its own.
function(get_kit_dirs root result)
  set(dirs "")
  if(NOT CMAKE_SYSTEM_NAME STREQUAL "Haiku")
    set(dirs /support /kernel /app /storage /interface /translation)
    list(TRANSFORM dirs PREPEND ${root})
    list(PREPEND dirs ${root})
  endif()
  set(${result} ${dirs} PARENT_SCOPE)
endfunction()

get_kit_dirs(${PROJECT_SOURCE_DIR}/kits/include kit_dirs)
write_ormi_pc(${PROJECT_BINARY_DIR}/pkgconfig/ormi.pc ${PROJECT_BINARY_DIR} "\${prefix}/lib"
  ${PROJECT_SOURCE_DIR}/ormi/include ${PLIM_COMPONENT_RUNTIME_DIRS} ${PLIM_BUILD_RUNTIME_DIR} ${kit_dirs})

# The installed one finds its prefix from where it lies, so that an installation may be moved.
file(RELATIVE_PATH pc_to_prefix ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig ${CMAKE_INSTALL_PREFIX})
string(REGEX REPLACE "/$" "" pc_to_prefix ${pc_to_prefix})
get_kit_dirs("\${prefix}/${PLIM_INSTALL_INCLUDEDIR}/be" kit_dirs)
write_ormi_pc(${PROJECT_BINARY_DIR}/pkgconfig/installed/ormi.pc "\${pcfiledir}/${pc_to_prefix}"
  "\${prefix}/${CMAKE_INSTALL_LIBDIR}" "\${prefix}/${PLIM_INSTALL_INCLUDEDIR}" ${kit_dirs})
install(FILES ${PROJECT_BINARY_DIR}/pkgconfig/installed/ormi.pc
  DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig COMPONENT development)
