# What `cmake --install` leaves on a machine: the library, its public headers, a CMake package and a
# pkg-config file. Nothing else is installed; a test compares the files one by one.
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(penwick_package ${CMAKE_INSTALL_LIBDIR}/cmake/Penwick)

install(
  TARGETS penwick
  EXPORT PenwickTargets
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR}
  RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR}
  ARCHIVE DESTINATION ${CMAKE_INSTALL_LIBDIR}
  FRAMEWORK DESTINATION ${CMAKE_INSTALL_LIBDIR}
  FILE_SET HEADERS DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}
  INCLUDES
  DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}) # for a host's CMake that knows no file sets
install(
  EXPORT PenwickTargets
  NAMESPACE Penwick::
  DESTINATION ${penwick_package})

configure_package_config_file(
  ${PROJECT_SOURCE_DIR}/cmake/PenwickConfig.cmake.in ${PROJECT_BINARY_DIR}/PenwickConfig.cmake
  INSTALL_DESTINATION ${penwick_package})
# Until 1.0 a new minor version may change the interface; the library's file name says the same.
write_basic_package_version_file(${PROJECT_BINARY_DIR}/PenwickConfigVersion.cmake
                                 COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/PenwickConfig.cmake
              ${PROJECT_BINARY_DIR}/PenwickConfigVersion.cmake DESTINATION ${penwick_package})

# A pkg-config file finds its folders from where it lies, so that the prefix can be chosen, or
# changed, after the build. Only a folder that was given as an absolute path stays one.
if(IS_ABSOLUTE ${CMAKE_INSTALL_LIBDIR})
  set(PENWICK_PC_PREFIX ${CMAKE_INSTALL_PREFIX})
else()
  file(RELATIVE_PATH up /${CMAKE_INSTALL_LIBDIR}/pkgconfig /)
  string(REGEX REPLACE "/$" "" up ${up})
  set(PENWICK_PC_PREFIX "\${pcfiledir}/${up}")
endif()
foreach(folder INCLUDEDIR LIBDIR)
  set(PENWICK_PC_${folder} ${CMAKE_INSTALL_${folder}})
  if(NOT IS_ABSOLUTE ${CMAKE_INSTALL_${folder}})
    set(PENWICK_PC_${folder} "\${prefix}/${CMAKE_INSTALL_${folder}}")
  endif()
endforeach()
configure_file(${PROJECT_SOURCE_DIR}/cmake/penwick.pc.in ${PROJECT_BINARY_DIR}/penwick.pc @ONLY)
install(FILES ${PROJECT_BINARY_DIR}/penwick.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
