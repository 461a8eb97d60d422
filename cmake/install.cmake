# What `cmake --install` puts under a prefix. The prefix can be moved afterwards: run paths, pkg-config file
# and CMake package find everything from where they are themselves.
include(CMakePackageConfigHelpers)
file(RELATIVE_PATH lib_from_bin "/${CMAKE_INSTALL_BINDIR}" "/${CMAKE_INSTALL_LIBDIR}")
file(RELATIVE_PATH prefix_from_pc "/${CMAKE_INSTALL_LIBDIR}/pkgconfig" "/")
string(REGEX REPLACE "/$" "" prefix_from_pc "${prefix_from_pc}")

set(zel_platform_target zel-platform-${ZEL_PLATFORM})
set_target_properties(zel-svc ${zel_platform_target} PROPERTIES INSTALL_RPATH "$ORIGIN")
install(TARGETS zel-svc ${zel_platform_target} EXPORT zel-svc-targets LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR})
install(FILES include/zel-svc.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})

if(ZEL_PLATFORM STREQUAL host)
  install(FILES platform/host/zel-host.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
  set_target_properties(zel PROPERTIES INSTALL_RPATH "$ORIGIN/${lib_from_bin}")
  install(TARGETS zel RUNTIME DESTINATION ${CMAKE_INSTALL_BINDIR})
  install(DIRECTORY examples/package DESTINATION ${CMAKE_INSTALL_DATADIR}/zel-svc/examples)
  file(GLOB manuals CONFIGURE_DEPENDS docs/man/*.[1-8])
  foreach(manual IN LISTS manuals)
    string(REGEX MATCH "[1-8]$" section "${manual}")
    install(FILES ${manual} DESTINATION ${CMAKE_INSTALL_MANDIR}/man${section})
  endforeach()
endif()

set(package_folder ${CMAKE_INSTALL_LIBDIR}/cmake/zel-svc)
install(EXPORT zel-svc-targets NAMESPACE zel-svc:: DESTINATION ${package_folder})
configure_package_config_file(cmake/zel-svc-config.cmake.in ${PROJECT_BINARY_DIR}/zel-svc-config.cmake
                              INSTALL_DESTINATION ${package_folder})
write_basic_package_version_file(${PROJECT_BINARY_DIR}/zel-svc-config-version.cmake COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/zel-svc-config.cmake ${PROJECT_BINARY_DIR}/zel-svc-config-version.cmake
        DESTINATION ${package_folder})

# The bench phone has a file of its own: only programs that call zel-host.h link it themselves.
function(zel_install_pkg_config name description)
  configure_file(cmake/pkg-config.pc.in ${PROJECT_BINARY_DIR}/${name}.pc @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/${name}.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endfunction()
zel_install_pkg_config(zel-svc "${PROJECT_DESCRIPTION}")
if(ZEL_PLATFORM STREQUAL host)
  zel_install_pkg_config(zel-platform-host "A whole phone in a folder, for zel-svc on a workstation")
endif()
