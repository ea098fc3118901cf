# How the project's targets are compiled, and how tests are declared.

add_library(plim_options INTERFACE)
target_compile_options(plim_options INTERFACE -Wall -Wextra -Werror -Wno-multichar)
if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND CMAKE_CXX_COMPILER_VERSION VERSION_LESS 13)
  # Optimising, GCC 12 sees overlapping copies in every "text" + std::string (its bug 105651).
  target_compile_options(plim_options INTERFACE -Wno-restrict)
endif()
if(CMAKE_BUILD_TYPE STREQUAL "Release" AND NOT PLIM_SANITIZE)
  # Nobody puts a function of his own in the place of one of our libraries', so they may call, and inline,
  # their functions directly. It also spares the loader most of its look-ups when a program starts.
  add_compile_options(-fno-semantic-interposition)
  add_link_options(-Wl,-Bsymbolic-functions)
endif()
if(PLIM_SANITIZE)
  list(JOIN PLIM_SANITIZE "," sanitizers)
  add_compile_options(-fsanitize=${sanitizers} -fno-omit-frame-pointer)
  add_link_options(-fsanitize=${sanitizers})
  if("undefined" IN_LIST PLIM_SANITIZE)
    add_compile_options(-fno-sanitize-recover=undefined)
  endif()
endif()

# plim_test(NAME SOURCES file... [LIBRARIES target...])
#
# One GoogleTest program; every test in it is a test of CTest, in a process of its own.
function(plim_test name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "" "" "SOURCES;LIBRARIES;ENVIRONMENT")
  add_executable(${name} ${arg_SOURCES})
  target_link_libraries(${name} PRIVATE plim_options ${arg_LIBRARIES} GTest::gmock GTest::gtest
    GTest::gtest_main)
  target_include_directories(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests)
  target_compile_definitions(${name} PRIVATE
    TEST_DATA_DIR="${CMAKE_CURRENT_SOURCE_DIR}" PLIM_BUILD_DIR="${CMAKE_BINARY_DIR}"
    PLIM_SOURCE_DIR="${PROJECT_SOURCE_DIR}")
  set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
  # Tests never take a display or settings that happen to be there: they run offscreen, in a home of
  # their own, with the kits' lock checker on.
  set(environment "BE_CHECK_LOCKS=1" "QT_QPA_PLATFORM=offscreen"
    "HOME=${CMAKE_BINARY_DIR}/tests/home" "XDG_CONFIG_HOME=${CMAKE_BINARY_DIR}/tests/home/.config"
    "XDG_DATA_HOME=${CMAKE_BINARY_DIR}/tests/home/.local/share" ${arg_ENVIRONMENT})
  gtest_discover_tests(${name} TEST_PREFIX ${name}. DISCOVERY_TIMEOUT 60 DISCOVERY_MODE PRE_TEST
    PROPERTIES TIMEOUT 120)
  # Only the first value of a list would get through there: the tests get it once they are known.
  set(script ${CMAKE_CURRENT_BINARY_DIR}/${name}_environment.cmake)
  file(CONFIGURE OUTPUT ${script} @ONLY CONTENT
    [=[
if(@name@_TESTS)
  set_tests_properties(${@name@_TESTS} PROPERTIES ENVIRONMENT "@environment@")
endif()
]=])
  set_property(DIRECTORY APPEND PROPERTY TEST_INCLUDE_FILES ${script})
endfunction()
