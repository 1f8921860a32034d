# Installs, moves what was installed, and looks at what is there: all of it, nothing else, and without a trace of the
# folders that it was built in or installed to.
cmake_minimum_required(VERSION 3.25)
include(${SETTINGS})

set(first ${work}/tree-before-it-was-moved)
file(REMOVE_RECURSE ${tree} ${first})
run(${CMAKE_COMMAND} --install ${build} --prefix ${first})
file(RENAME ${first} ${tree})

file(GLOB headers RELATIVE ${source}/include ${source}/include/pyxcc/*.h)
string(TOLOWER "${buildType}" configuration)
list(TRANSFORM headers PREPEND ${includeDir}/)
set(expected
  ${headers}
  ${libraryDir}/cmake/pyxcc/pyxcc-config-version.cmake
  ${libraryDir}/cmake/pyxcc/pyxcc-config.cmake
  ${libraryDir}/cmake/pyxcc/pyxcc-targets-${configuration}.cmake
  ${libraryDir}/cmake/pyxcc/pyxcc-targets.cmake
  ${libraryDir}/pkgconfig/pyxcc.pc
  share/doc/pyxcc/copyright)
foreach(library IN ITEMS pyxccq7 pyxcore)
  list(APPEND expected ${libraryDir}/lib${library}.so ${libraryDir}/lib${library}.so.${major}
       ${libraryDir}/lib${library}.so.${version})
endforeach()
if(HAS_TOOL)
  list(APPEND expected bin/pyxcc share/man/man1/pyxcc.1)
endif()
file(GLOB_RECURSE found RELATIVE ${tree} ${tree}/*)
set(missing ${expected})
list(REMOVE_ITEM missing ${found})
set(more ${found})
list(REMOVE_ITEM more ${expected})
if(missing OR more)
  message(SEND_ERROR "missing: ${missing}\nmore than expected: ${more}")
endif()

foreach(file IN LISTS found)
  file(STRINGS ${tree}/${file} lines REGEX "${source}|${build}|${first}")
  if(lines AND NOT buildType MATCHES "Deb")
    message(SEND_ERROR "${file} names a folder of this machine: ${lines}")
  endif()
endforeach()

if(HAS_TOOL)
  run(${tree}/bin/pyxcc --version)
  if(NOT output MATCHES "^pyxcc ${version} ")
    message(SEND_ERROR "the installed tool says: ${output}")
  endif()
endif()
