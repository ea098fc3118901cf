# The generated examples in the standard dialect: the same documents and handlers, generated into the build folder and
# compiled as strictly as compilers can.

# standard_example(NAME PROJECT APP application FORMS form...)
#
# Makes the program NAME_standard of the project file PROJECT, with the handlers that lie beside it.
function(standard_example name project)
  cmake_parse_arguments(PARSE_ARGV 2 arg "" "APP" "FORMS")
  cmake_path(GET project PARENT_PATH folder)
  set(from ${CMAKE_CURRENT_SOURCE_DIR}/${folder})
  set(to ${CMAKE_CURRENT_BINARY_DIR}/${folder}/standard)
  list(TRANSFORM arg_FORMS REPLACE "(.+)" "${from}/\\1.frm" OUTPUT_VARIABLE documents)
  list(TRANSFORM arg_FORMS REPLACE "(.+)" "${from}/\\1.h;${from}/\\1.cpp" OUTPUT_VARIABLE handlers)
  list(APPEND handlers ${from}/${arg_APP}.h ${from}/${arg_APP}.cpp)
  list(TRANSFORM arg_FORMS REPLACE "(.+)" "${to}/\\1.cpp" OUTPUT_VARIABLE sources)
  list(APPEND sources ${to}/${arg_APP}.cpp)
  file(MAKE_DIRECTORY ${to})
  add_custom_command(OUTPUT ${sources}
    COMMAND ${CMAKE_COMMAND} -E copy ${handlers} ${to}
    COMMAND plimgen --dialect standard --output ${to} ${CMAKE_CURRENT_SOURCE_DIR}/${project} > ${to}/plimgen.log
    DEPENDS plimgen standard ${CMAKE_CURRENT_SOURCE_DIR}/${project} ${documents} ${handlers}
    COMMENT "Generating ${name} in the standard dialect"
    VERBATIM)
  add_executable(${name}_standard ${sources})
  target_link_libraries(${name}_standard PRIVATE Ormi::ormi)
  set_target_properties(${name}_standard PROPERTIES CXX_STANDARD 17 CXX_EXTENSIONS OFF)
  target_compile_options(${name}_standard PRIVATE -Wall -Wextra -pedantic)
  # As in the rest of the tree: instrumented code misleads the compiler.
  if(NOT "address" IN_LIST PLIM_SANITIZE)
    target_compile_options(${name}_standard PRIVATE -Werror)
  endif()
endfunction()

standard_example(hello hello/hello.plim APP Hello FORMS MainForm NoteForm)
