# How the project's targets are compiled, and how tests are declared.

add_library(plim_options INTERFACE)
target_compile_options(plim_options INTERFACE -Wall -Wextra -Werror -Wno-multichar)
if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU" AND CMAKE_CXX_COMPILER_VERSION VERSION_LESS 13)
  # Optimising, GCC 12 sees overlapping copies in every "text" + std::string (its bug 105651).
  target_compile_options(plim_options INTERFACE -Wno-restrict)
endif()
if(CMAKE_BUILD_TYPE STREQUAL "Debug" AND NOT PLIM_SANITIZE)
  # Compiles as quickly as no optimisation does, and the tests draw and lay out in a fraction of the time.
  add_compile_options(-Og)
endif()
if(CMAKE_BUILD_TYPE MATCHES "^(Debug|Release)$" AND NOT PLIM_SANITIZE)
  # Nobody puts a function of his own in the place of one of our libraries', so they may call, and inline,
  # their functions directly. It also spares the loader most of its look-ups when a program starts.
  add_compile_options(-fno-semantic-interposition)
  add_link_options(-Wl,-Bsymbolic-functions)
endif()

# What keeps a fault from becoming a way in, as far as it costs next to nothing; docs/performance.md has the figures, also of
# what is left out. Programs can be loaded anywhere.
if(CMAKE_SYSTEM_NAME STREQUAL "Linux")
  include(CheckPIESupported)
  check_pie_supported(LANGUAGES CXX)
endif()
if(CMAKE_SYSTEM_NAME STREQUAL "Linux" AND CMAKE_BUILD_TYPE STREQUAL "Release" AND NOT PLIM_SANITIZE)
  add_compile_options(-U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2 -fstack-protector-strong)
  include(CheckCXXCompilerFlag)
  check_cxx_compiler_flag(-fstack-clash-protection PLIM_HAS_STACK_CLASH_PROTECTION)
  if(PLIM_HAS_STACK_CLASH_PROTECTION)
    add_compile_options(-fstack-clash-protection)
  endif()
  add_link_options(-Wl,-z,relro)
endif()
if(PLIM_SANITIZE)
  list(JOIN PLIM_SANITIZE "," sanitizers)
  add_compile_options(-fsanitize=${sanitizers} -fno-omit-frame-pointer)
  add_link_options(-fsanitize=${sanitizers})
endif()
if("address" IN_LIST PLIM_SANITIZE)
  # Compiling takes half the time of -O2, and the tests hardly run longer. So much instrumented code
  # misleads the compiler's flow analysis: warnings are errors in the other builds.
  add_compile_options(-O1 -g1)
  target_compile_options(plim_options INTERFACE -Wno-error)
endif()
if("undefined" IN_LIST PLIM_SANITIZE)
  add_compile_options(-fno-sanitize-recover=undefined)
endif()

# How the sanitizers behave in tests, and in the programs that tests start. A request for more memory
# than there is fails as it does without them. The kernel kit keeps ended threads until they are waited for.
# The leak checker crashes, now and then, on what it notes of the thread-local data of ended threads: it notes none, and
# finds such data as it finds all that is on the heap.
string(CONCAT address_options "allocator_may_return_null=1:detect_stack_use_after_return=1:strict_string_checks=1:"
  "intercept_tls_get_addr=0:suppressions=${PROJECT_SOURCE_DIR}/tests/asan.supp")
set(plim_address_environment
  "ASAN_OPTIONS=${address_options}"
  "LSAN_OPTIONS=suppressions=${PROJECT_SOURCE_DIR}/tests/lsan.supp:print_suppressions=0"
  "UBSAN_OPTIONS=print_stacktrace=1")
set(sanitizer_environment)
# Instrumented programs are slow: how many times as long as else a test may take, and what it waits for.
set(plim_patience 1)
if(PLIM_SANITIZE)
  set(plim_patience 4)
  list(APPEND sanitizer_environment "PLIM_PATIENCE=${plim_patience}")
endif()
if("address" IN_LIST PLIM_SANITIZE)
  list(APPEND sanitizer_environment ${plim_address_environment})
endif()
if("thread" IN_LIST PLIM_SANITIZE)
  string(CONCAT thread_options "allocator_may_return_null=1:report_thread_leaks=0:"
    "second_deadlock_stack=1:history_size=5:suppressions=${PROJECT_SOURCE_DIR}/tests/tsan.supp")
  list(APPEND sanitizer_environment "TSAN_OPTIONS=${thread_options}")
endif()

# plim_limit(SECONDS TEST...)
#
# Sets how long these tests may take.
function(plim_limit seconds)
  math(EXPR limit "${seconds} * ${plim_patience}")
  set_tests_properties(${ARGN} PROPERTIES TIMEOUT ${limit})
endfunction()

# plim_test(NAME SOURCES file... [LIBRARIES target...] [TOGETHER] [CHECKED])
#
# One GoogleTest program; every test in it is a test of CTest, in a process of its own. With TOGETHER, for tests that
# share what takes long to set up, all are one test of CTest. With CHECKED there is a second program NAME_checked of the
# same tests, with plim_checked in place of plim, where the build has it; its tests are together.
function(plim_test name)
  cmake_parse_arguments(PARSE_ARGV 1 arg "TOGETHER;CHECKED" "" "SOURCES;LIBRARIES;ENVIRONMENT")
  add_executable(${name} ${arg_SOURCES})
  target_link_libraries(${name} PRIVATE plim_options ${arg_LIBRARIES} GTest::gmock GTest::gtest
    GTest::gtest_main)
  target_include_directories(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests)
  if("address" IN_LIST PLIM_SANITIZE AND "plim" IN_LIST arg_LIBRARIES)
    target_sources(${name} PRIVATE $<TARGET_OBJECTS:editor_keeper>)
  endif()
  if(CMAKE_BUILD_TYPE STREQUAL "Debug" OR "address" IN_LIST PLIM_SANITIZE)
    # Halves the time of compiling; most of the time that a test takes passes in the libraries. Lines are enough to
    # see where a test failed.
    target_compile_options(${name} PRIVATE -O0 -g1)
  endif()
  target_compile_definitions(${name} PRIVATE
    TEST_DATA_DIR="${CMAKE_CURRENT_SOURCE_DIR}" PLIM_BUILD_DIR="${CMAKE_BINARY_DIR}"
    PLIM_SOURCE_DIR="${PROJECT_SOURCE_DIR}")
  set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
  # Tests never take a display or settings that happen to be there: they run offscreen, in a home of
  # their own, with the kits' lock checker on.
  set(environment "BE_CHECK_LOCKS=1" "QT_QPA_PLATFORM=offscreen"
    "HOME=${CMAKE_BINARY_DIR}/tests/home" "XDG_CONFIG_HOME=${CMAKE_BINARY_DIR}/tests/home/.config"
    "XDG_DATA_HOME=${CMAKE_BINARY_DIR}/tests/home/.local/share" ${sanitizer_environment}
    ${arg_ENVIRONMENT})
  if(arg_CHECKED AND TARGET plim_checked)
    list(TRANSFORM arg_LIBRARIES REPLACE "^plim$" plim_checked)
    add_executable(${name}_checked $<TARGET_OBJECTS:${name}> $<TARGET_OBJECTS:editor_keeper>)
    target_link_libraries(${name}_checked PRIVATE ${arg_LIBRARIES} GTest::gmock GTest::gtest GTest::gtest_main)
    set_target_properties(${name}_checked PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
    # The libraries of components that the tests load, and the programs that they start.
    add_dependencies(${name}_checked ${name})
    add_test(NAME ${name}_checked COMMAND ${name}_checked)
    set_tests_properties(${name}_checked PROPERTIES TIMEOUT 240
      ENVIRONMENT "${environment};${plim_address_environment}")
  endif()
  if(arg_TOGETHER)
    add_test(NAME ${name} COMMAND ${name})
    set_tests_properties(${name} PROPERTIES ENVIRONMENT "${environment}")
    plim_limit(120 ${name})
    return()
  endif()
  math(EXPR limit "120 * ${plim_patience}")
  gtest_discover_tests(${name} TEST_PREFIX ${name}. DISCOVERY_TIMEOUT 60 DISCOVERY_MODE PRE_TEST
    PROPERTIES TIMEOUT ${limit})
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
