# Builds the programs of tests/consumer/ in one way and runs them: -DWAY=find_package, pkg_config or add_subdirectory.
cmake_minimum_required(VERSION 3.25)
include(${SETTINGS})

set(consumer ${source}/tests/consumer)
set(folder ${work}/${WAY})
file(REMOVE_RECURSE ${folder})

# configure(<argument>...)
function(configure)
  run(${CMAKE_COMMAND} -S ${consumer} -B ${folder} ${ARGN} -DCMAKE_BUILD_TYPE=${buildType}
      -DCMAKE_C_COMPILER=${cCompiler} -DCMAKE_C_FLAGS=${cFlags}
      -DCMAKE_CXX_COMPILER=${cxxCompiler} -DCMAKE_CXX_FLAGS=${cxxFlags}
      -DCMAKE_LIBRARY_ARCHITECTURE=${architecture})
endfunction()

if(WAY STREQUAL "find_package")
  configure(-DCMAKE_PREFIX_PATH=${tree})
  run(${CMAKE_COMMAND} --build ${folder})
elseif(WAY STREQUAL "pkg_config")
  file(MAKE_DIRECTORY ${folder})
  set(ENV{PKG_CONFIG_PATH} ${tree}/${libraryDir}/pkgconfig)
  run(pkg-config --modversion pyxcc)
  if(NOT output STREQUAL "${version}\n")
    message(SEND_ERROR "pyxcc.pc is of version ${output}")
  endif()
  run(pkg-config --cflags --libs pyxcc)
  separate_arguments(flags UNIX_COMMAND "${output}")
  foreach(language IN ITEMS c cxx)
    separate_arguments(${language}Flags UNIX_COMMAND "${${language}Flags}")
  endforeach()
  run(${cCompiler} ${cFlags} ${consumer}/consumer.c -o ${folder}/consumer_c ${flags})
  run(${cxxCompiler} ${cxxFlags} ${consumer}/consumer.cpp -o ${folder}/consumer_cpp ${flags})
  set(ENV{LD_LIBRARY_PATH} ${tree}/${libraryDir})
elseif(WAY STREQUAL "add_subdirectory")
  # What is tested is the project within a project and not the compiler: it gets the objects that are there. make takes
  # them for its own, as they are newer than the sources.
  configure(-G "Unix Makefiles" -DPYXCC_SOURCE=${source})
  set(objects src/CMakeFiles/pyxcc_objects.dir)
  file(COPY ${build}/${objects}/ DESTINATION ${folder}/pyxcc/${objects} FILES_MATCHING PATTERN "*.o")
  file(GLOB_RECURSE copies ${folder}/pyxcc/${objects}/*.o)
  file(TOUCH ${copies})
  run(${CMAKE_COMMAND} --build ${folder})
  if(output MATCHES "Building CXX object pyxcc/src/CMakeFiles/pyxcc_objects")
    message(SEND_ERROR "the library was compiled once more:\n${output}")
  endif()
endif()

foreach(language IN ITEMS c cpp)
  run(${folder}/consumer_${language})
  if(NOT output MATCHES "with pyxcc ${version} ")
    message(SEND_ERROR "consumer_${language} says: ${output}")
  endif()
endforeach()
