# What `cmake --install` puts where. The tree can be moved: what is in it finds the rest from its own place.
include(CMakePackageConfigHelpers)

set(configDir ${CMAKE_INSTALL_LIBDIR}/cmake/pyxcc)
set(pkgConfigDir ${CMAKE_INSTALL_LIBDIR}/pkgconfig)

install(TARGETS pyxcore EXPORT pyxcc-targets
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT core NAMELINK_COMPONENT development)
install(TARGETS pyxcc EXPORT pyxcc-targets
        LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT library NAMELINK_COMPONENT development)
install(DIRECTORY ${PROJECT_SOURCE_DIR}/include/pyxcc DESTINATION ${CMAKE_INSTALL_INCLUDEDIR} COMPONENT development
        FILES_MATCHING PATTERN "*.h")

install(EXPORT pyxcc-targets NAMESPACE pyxcc:: DESTINATION ${configDir} COMPONENT development)
configure_package_config_file(${CMAKE_CURRENT_LIST_DIR}/pyxcc-config.cmake.in ${PROJECT_BINARY_DIR}/pyxcc-config.cmake
                              INSTALL_DESTINATION ${configDir} NO_SET_AND_CHECK_MACRO)
write_basic_package_version_file(${PROJECT_BINARY_DIR}/pyxcc-config-version.cmake COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/pyxcc-config.cmake ${PROJECT_BINARY_DIR}/pyxcc-config-version.cmake
        DESTINATION ${configDir} COMPONENT development)

file(RELATIVE_PATH prefixFromPkgConfig /${pkgConfigDir} /)
string(REGEX REPLACE "/$" "" prefixFromPkgConfig ${prefixFromPkgConfig})
configure_file(${CMAKE_CURRENT_LIST_DIR}/pyxcc.pc.in ${PROJECT_BINARY_DIR}/pyxcc.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/pyxcc.pc DESTINATION ${pkgConfigDir} COMPONENT development)

install(FILES ${PROJECT_SOURCE_DIR}/LICENSE DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/pyxcc RENAME copyright
        COMPONENT development)

if(TARGET pyxcc_tool)
  file(RELATIVE_PATH librariesFromTools /${CMAKE_INSTALL_BINDIR} /${CMAKE_INSTALL_LIBDIR})
  set_target_properties(pyxcc_tool PROPERTIES INSTALL_RPATH "$ORIGIN/${librariesFromTools}")
  install(TARGETS pyxcc_tool RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR} COMPONENT tool)
  configure_file(${PROJECT_SOURCE_DIR}/tools/pyxcc.1.in ${PROJECT_BINARY_DIR}/pyxcc.1 @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/pyxcc.1 DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 COMPONENT tool)
endif()
