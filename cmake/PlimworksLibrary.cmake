# plimworks_add_component_library(NAME source...
#   [RUNTIME folder]
#   [LIBRARIES target...])
#
# Builds the component library NAME.so, a module that the designer loads. RUNTIME is the folder of the headers that
# generated programs include; by convention they lie in a folder called NAME in it. LIBRARIES are linked beside the
# designer's own.
#
# The library is built into the folder Components of the build folder (Plimworks_OUTPUT_DIR says another one), which
# plimgen --components takes, and is installed where the designer looks for it: into Plimworks_COMPONENTS_DIR, with the
# headers in Plimworks_RUNTIME_DIR, where generated programs find them beside <Ormi.h>. The target NAME_runtime is for
# programs in the same project that use the headers before they are installed. Plimworks_LIBRARY_COMPONENT and
# Plimworks_RUNTIME_COMPONENT, where they are set, name the components of the installation that the two belong to.
#
# The library tells the designer what it was built for: one with other classes leaves it out and says so.

set(PLIMWORKS_LIBRARY_BUILD_SOURCE ${CMAKE_CURRENT_LIST_DIR}/PlimworksLibrary.cpp)

function(plimworks_add_component_library name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "RUNTIME" "LIBRARIES")
  if(NOT arg_UNPARSED_ARGUMENTS)
    message(FATAL_ERROR "plimworks_add_component_library(${name}): name its source files.")
  endif()

  add_library(${name} MODULE ${arg_UNPARSED_ARGUMENTS} ${PLIMWORKS_LIBRARY_BUILD_SOURCE})
  target_compile_features(${name} PRIVATE cxx_std_17)
  target_link_libraries(${name} PRIVATE Plimworks::plim ${arg_LIBRARIES})
  # The views that components show may be those of generated programs, which are in headers alone.
  target_include_directories(${name} PRIVATE
    $<TARGET_PROPERTY:Ormi::ormi,INTERFACE_INCLUDE_DIRECTORIES>)
  # The designer passes over what it cannot load without a word, so a missing function is an error here. Clang's
  # sanitizers have theirs in the program alone.
  get_directory_property(link_options LINK_OPTIONS)
  if(NOT (CMAKE_CXX_COMPILER_ID MATCHES "Clang" AND "${CMAKE_CXX_FLAGS};${link_options}" MATCHES "-fsanitize="))
    target_link_options(${name} PRIVATE LINKER:--no-undefined)
  endif()

  set(output "${Plimworks_OUTPUT_DIR}")
  if(NOT output)
    set(output ${CMAKE_BINARY_DIR}/Components)
  endif()
  set_target_properties(${name} PROPERTIES PREFIX "" LIBRARY_OUTPUT_DIRECTORY ${output}
    INSTALL_RPATH "${Plimworks_COMPONENTS_RPATH}")
  set(component "")
  if(Plimworks_LIBRARY_COMPONENT)
    set(component COMPONENT ${Plimworks_LIBRARY_COMPONENT})
  endif()
  install(TARGETS ${name} LIBRARY DESTINATION ${Plimworks_COMPONENTS_DIR} ${component})

  if(arg_RUNTIME)
    get_filename_component(runtime ${arg_RUNTIME} ABSOLUTE)
    add_library(${name}_runtime INTERFACE)
    target_include_directories(${name}_runtime INTERFACE ${runtime})
    target_link_libraries(${name}_runtime INTERFACE Ormi::ormi)
    target_include_directories(${name} PRIVATE ${runtime})
    set(component "")
    if(Plimworks_RUNTIME_COMPONENT)
      set(component COMPONENT ${Plimworks_RUNTIME_COMPONENT})
    endif()
    install(DIRECTORY ${runtime}/ DESTINATION ${Plimworks_RUNTIME_DIR} ${component}
      FILES_MATCHING PATTERN "*.h")
  endif()
endfunction()
