# Run by CPack when each component is installed in a folder of its own, before these become packages: adds what every
# package of Debian has, the licence and the changelog, and compresses the manual pages.

find_program(GZIP gzip REQUIRED)
set(VERSION ${CPACK_PACKAGE_VERSION}-${CPACK_DEBIAN_PACKAGE_RELEASE})

# Without the time of packaging, so that the same files make the same package.
function(compress file)
  execute_process(COMMAND ${GZIP} -9 -n -f ${file} COMMAND_ERROR_IS_FATAL ANY)
endfunction()

# The changelog is as old as the newest source.
set(seconds $ENV{SOURCE_DATE_EPOCH})
if(NOT seconds)
  execute_process(COMMAND git log -1 --format=%ct WORKING_DIRECTORY ${CMAKE_CURRENT_LIST_DIR}
    OUTPUT_VARIABLE seconds OUTPUT_STRIP_TRAILING_WHITESPACE ERROR_QUIET)
endif()
if(NOT seconds)
  string(TIMESTAMP seconds "%s" UTC)
endif()
set(ENV{SOURCE_DATE_EPOCH} ${seconds})
string(TIMESTAMP DATE "%a, %d %b %Y %H:%M:%S +0000" UTC)

# The licence, as Debian's tools read it.
file(READ ${CMAKE_CURRENT_LIST_DIR}/../../LICENSE text)
if(NOT text MATCHES "Copyright \\(c\\) ([^\n]+)\n\n(.*[^\n])\n*$")
  message(FATAL_ERROR "LICENSE does not begin with whose it is")
endif()
set(HOLDER ${CMAKE_MATCH_1})
string(REPLACE "\n" "\n " LICENSE " ${CMAKE_MATCH_2}")
string(REPLACE "\n \n" "\n .\n" LICENSE "${LICENSE}")

foreach(component IN LISTS CPACK_COMPONENTS_ALL)
  string(TOUPPER ${component} upper)
  set(package ${CPACK_DEBIAN_${upper}_PACKAGE_NAME})
  set(root ${CPACK_TEMPORARY_INSTALL_DIRECTORY}/${component}${CPACK_PACKAGING_INSTALL_PREFIX})
  set(doc ${root}/share/doc/${package})

  configure_file(${CMAKE_CURRENT_LIST_DIR}/copyright.in ${doc}/copyright @ONLY)
  configure_file(${CMAKE_CURRENT_LIST_DIR}/changelog.in ${doc}/changelog.Debian @ONLY)
  file(CHMOD ${doc}/copyright ${doc}/changelog.Debian PERMISSIONS OWNER_READ OWNER_WRITE GROUP_READ WORLD_READ)
  compress(${doc}/changelog.Debian)

  file(GLOB pages ${root}/share/man/man*/*.[1-9])
  foreach(page IN LISTS pages)
    compress(${page})
  endforeach()
endforeach()
