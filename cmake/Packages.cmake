# `cpack -G DEB` makes a package each of the two libraries, of what one needs to build with them, and of the tool. Not of
# 32-bit libraries on a 64-bit machine: they would need what that machine's packages of 32-bit libraries are called.
if(CMAKE_SIZEOF_VOID_P EQUAL 4 AND CMAKE_SYSTEM_PROCESSOR STREQUAL "x86_64")
  return()
endif()

set(CPACK_PACKAGE_NAME pyxcc)
set(CPACK_PACKAGE_VERSION ${PROJECT_VERSION})
set(CPACK_PACKAGE_VENDOR pyxcc)
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(CPACK_PACKAGE_CONTACT "pyxcc maintainers <maintainers@pyxcc.invalid>")
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR}/packages)
set(CPACK_RESOURCE_FILE_LICENSE ${PROJECT_SOURCE_DIR}/LICENSE)
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_PRE_BUILD_SCRIPTS ${CMAKE_CURRENT_LIST_DIR}/debian/Finish.cmake)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_RELEASE 1)
set(CPACK_DEBIAN_CHANGELOG ${PROJECT_BINARY_DIR}/changelog)
configure_file(${CMAKE_CURRENT_LIST_DIR}/debian/changelog.in ${CPACK_DEBIAN_CHANGELOG} @ONLY)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_PRIORITY optional)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS_POLICY ">=")
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ
                                                WORLD_EXECUTE)

# pyxcc_package(<component> <package> <section> <packages that it needs> <summary> <text>)
macro(pyxcc_package component package section needs summary text)
  string(TOUPPER ${component} key)
  list(APPEND CPACK_COMPONENTS_ALL ${component})
  set(CPACK_DEBIAN_${key}_PACKAGE_NAME ${package})
  set(CPACK_DEBIAN_${key}_PACKAGE_SECTION ${section})
  set(CPACK_DEBIAN_${key}_PACKAGE_DEPENDS "${needs}")
  set(CPACK_DEBIAN_${key}_DESCRIPTION "${summary}\n${about}\n${text}")
endmacro()

set(same "(= ${PROJECT_VERSION}-${CPACK_DEBIAN_PACKAGE_RELEASE})")
set(major ${PROJECT_VERSION_MAJOR})
set(about "The library converts rectangles of pixels between colour models, sample
depths and memory layouts, exact to the bit.
.")

set(CPACK_COMPONENTS_ALL)
pyxcc_package(core libpyxcore${major} libs ""
  "memory and processor services of pyxcc"
  "This package holds what it asks of the platform.")
pyxcc_package(library libpyxccq7-${major} libs "libpyxcore${major} ${same}"
  "colour conversion primitives for processors with AVX2"
  "This package holds the library for processors with AVX2 and FMA.")
pyxcc_package(development libpyxcc-dev libdevel "libpyxccq7-${major} ${same}, libpyxcore${major} ${same}"
  "colour conversion primitives (development files)"
  "This package holds the headers, and files for CMake and pkg-config.")
foreach(key IN ITEMS CORE LIBRARY)
  set(CPACK_DEBIAN_${key}_PACKAGE_SHLIBDEPS ON)
  set(CPACK_DEBIAN_${key}_PACKAGE_CONTROL_EXTRA ${CMAKE_CURRENT_LIST_DIR}/debian/triggers)
endforeach()
if(TARGET pyxcc_tool)
  pyxcc_package(tool pyxcc graphics "libpyxccq7-${major} ${same}"
    "tries colour conversions on pictures"
    "This package holds a command that takes pictures through its conversions.")
  set(CPACK_DEBIAN_TOOL_PACKAGE_SHLIBDEPS ON)
endif()
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${PROJECT_BINARY_DIR}/src)

include(CPack)
