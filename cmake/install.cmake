# What `cmake --install` lays down: the library, its header, and what find_package and pkg-config
# need. Nothing of it holds an absolute path, so that an installed tree can be moved.

include(CMakePackageConfigHelpers)

set(package_dir ${CMAKE_INSTALL_LIBDIR}/cmake/Vantrel)
install(FILES LICENSE TYPE DOC)
install(EXPORT Vantrel NAMESPACE Vantrel:: FILE VantrelConfig.cmake DESTINATION ${package_dir})
write_basic_package_version_file(VantrelConfigVersion.cmake COMPATIBILITY SameMajorVersion)
install(FILES ${CMAKE_CURRENT_BINARY_DIR}/VantrelConfigVersion.cmake DESTINATION ${package_dir})

# A library, its header and a file NAME.pc that names what else is to be linked and defined.
function(install_library library header name description libraries definitions)
  install(TARGETS ${library} EXPORT Vantrel)
  install(FILES ${header} TYPE INCLUDE)
  set(pc_dir ${CMAKE_INSTALL_FULL_LIBDIR}/pkgconfig)
  file(RELATIVE_PATH prefix ${pc_dir} ${CMAKE_INSTALL_PREFIX})
  file(RELATIVE_PATH includedir ${pc_dir} ${CMAKE_INSTALL_FULL_INCLUDEDIR})
  configure_file(${PROJECT_SOURCE_DIR}/cmake/library.pc.in ${name}.pc @ONLY)
  install(FILES ${CMAKE_CURRENT_BINARY_DIR}/${name}.pc
          DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endfunction()

get_target_property(libraries Vantrel INTERFACE_LINK_LIBRARIES)
if(libraries)
  list(TRANSFORM libraries PREPEND " -l")
  list(JOIN libraries "" libraries)
else()
  set(libraries "")
endif()
set(definitions)
if(NOT type STREQUAL SHARED_LIBRARY)
  set(definitions " -DVANTREL_STATIC")
endif()
install_library(Vantrel include/vantrel.h vantrel "${PROJECT_DESCRIPTION}" "${libraries}"
                "${definitions}")
