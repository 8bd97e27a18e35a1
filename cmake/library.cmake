# How the library is compiled and linked.

include(GNUInstallDirs)
target_include_directories(Vantrel
  PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include>
         $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>
  PRIVATE ${PROJECT_SOURCE_DIR}/src)

# The same bits from every compiler: no fused multiply-adds. Nothing reads errno after a call of the
# mathematics library, so that a square root is one instruction.
target_compile_options(Vantrel PRIVATE -ffp-contract=off -fno-math-errno
  -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wno-sign-conversion
  "-fmacro-prefix-map=${PROJECT_SOURCE_DIR}/=")
if(VANTREL_CHECKED)
  target_compile_definitions(Vantrel PRIVATE VANTREL_CHECKED)
endif()

# The major version, and SOVERSION with it, rises whenever an exported name goes away or the type or
# layout behind one changes; new names leave it as it is.
set_target_properties(Vantrel PROPERTIES
  VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR}
  CXX_VISIBILITY_PRESET hidden VISIBILITY_INLINES_HIDDEN ON POSITION_INDEPENDENT_CODE ON)

# src/exports.txt lists the names that the library exports; no other symbol leaves it.
set(exports ${PROJECT_SOURCE_DIR}/src/exports.txt)
set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${exports})
file(STRINGS ${exports} names)
list(JOIN names ";\n    " names)
file(CONFIGURE OUTPUT exports.map CONTENT "{\n  global:\n    @names@;\n  local: *;\n};\n" @ONLY)
get_target_property(type Vantrel TYPE)
if(type STREQUAL SHARED_LIBRARY)
  target_link_options(Vantrel PRIVATE "-Wl,--version-script=${CMAKE_CURRENT_BINARY_DIR}/exports.map")
  set_target_properties(Vantrel PROPERTIES LINK_DEPENDS ${CMAKE_CURRENT_BINARY_DIR}/exports.map)
else()
  # Who links the static library, from C perhaps, needs the C++ runtime too.
  set(runtime ${CMAKE_CXX_IMPLICIT_LINK_LIBRARIES})
  list(FILTER runtime INCLUDE REGEX "^(stdc\\+\\+|c\\+\\+|m)$")
  target_link_libraries(Vantrel INTERFACE ${runtime})
endif()
