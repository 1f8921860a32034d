# Run by cpack before it makes packages of the installed components: what Debian wants to be otherwise than in a tree
# that can be moved. The places of headers and libraries are known, pages and change logs are compressed, and each package
# says who may copy it.
function(compress file)
  execute_process(COMMAND gzip -9nf ${file} COMMAND_ERROR_IS_FATAL ANY)
endfunction()

foreach(component IN LISTS CPACK_COMPONENTS_ALL)
  string(TOUPPER ${component} key)
  set(root ${CPACK_TEMPORARY_DIRECTORY}/${component}${CPACK_PACKAGING_INSTALL_PREFIX})
  set(documents ${root}/share/doc/${CPACK_DEBIAN_${key}_PACKAGE_NAME})

  file(REMOVE_RECURSE ${root}/share/doc)
  configure_file(${CMAKE_CURRENT_LIST_DIR}/copyright ${documents}/copyright COPYONLY)
  configure_file(${CPACK_DEBIAN_CHANGELOG} ${documents}/changelog.Debian COPYONLY)
  compress(${documents}/changelog.Debian)
  file(CHMOD ${documents}/changelog.Debian.gz ${documents}/copyright PERMISSIONS OWNER_READ OWNER_WRITE GROUP_READ
       WORLD_READ)

  file(GLOB pages ${root}/share/man/man*/*)
  foreach(page IN LISTS pages)
    compress(${page})
  endforeach()

  file(GLOB_RECURSE descriptions ${root}/lib/*.pc)
  foreach(description IN LISTS descriptions)
    file(READ ${description} text)
    string(REGEX REPLACE "^prefix=[^\n]*" "prefix=${CPACK_PACKAGING_INSTALL_PREFIX}" text "${text}")
    file(WRITE ${description} "${text}")
  endforeach()

  file(GLOB_RECURSE binaries ${root}/bin/* ${root}/lib/*.so.*)
  foreach(binary IN LISTS binaries)
    if(NOT IS_SYMLINK ${binary})
      file(RPATH_REMOVE FILE ${binary})
    endif()
  endforeach()
endforeach()
