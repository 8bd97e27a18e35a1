# How the library is compiled and linked.

include(GNUInstallDirs)
target_include_directories(Vantrel
  PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include>
         $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>
  PRIVATE ${PROJECT_SOURCE_DIR}/src)

# The header tells the version to those who compile.
file(STRINGS include/vantrel.h version REGEX "#define VANTREL_VERSION_(MAJOR|MINOR|PATCH) ")
list(TRANSFORM version REPLACE "^[^0-9]*([0-9]+).*" "\\1")
list(JOIN version "." version)
if(NOT version STREQUAL PROJECT_VERSION)
  message(FATAL_ERROR "include/vantrel.h is of version ${version}, not ${PROJECT_VERSION}")
endif()

# Every operation is rounded to a double by itself. The old floating-point unit of i386 keeps more.
set(CMAKE_TRY_COMPILE_TARGET_TYPE_BEFORE ${CMAKE_TRY_COMPILE_TARGET_TYPE})
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)
include(CheckCXXSourceCompiles)
check_cxx_source_compiles("#include <float.h>
#if FLT_EVAL_METHOD != 0 && FLT_EVAL_METHOD != 1
#error
#endif
" VANTREL_ROUNDS_TO_DOUBLE)
set(CMAKE_TRY_COMPILE_TARGET_TYPE ${CMAKE_TRY_COMPILE_TARGET_TYPE_BEFORE})
if(NOT VANTREL_ROUNDS_TO_DOUBLE)
  message(FATAL_ERROR "This compiler computes doubles with more places than they have (the x87 unit "
                      "of i386), so that results would differ from those of every other machine. "
                      "With -msse2 -mfpmath=sse it does not.")
endif()

# The same bits from every compiler: no fused multiply-adds. Nothing reads errno after a square root,
# so that it is one instruction; nothing throws.
if(MSVC)
  target_compile_options(Vantrel PRIVATE /fp:precise /utf-8 /W3)
else()
  target_compile_options(Vantrel PRIVATE -ffp-contract=off -fno-math-errno -fno-exceptions
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion -Wno-sign-conversion
    "-fmacro-prefix-map=${PROJECT_SOURCE_DIR}/=")
endif()
# Where clang 14 joins operations into vectors of WebAssembly by itself, Metamerism comes out wrong.
if(CMAKE_CXX_FLAGS MATCHES "-msimd128")
  target_compile_options(Vantrel PRIVATE -fno-slp-vectorize)
endif()
if(VANTREL_CHECKED)
  target_compile_definitions(Vantrel PRIVATE VANTREL_CHECKED)
endif()
# The analyzer of clang-tidy follows the functions of the file that it is given, not of those included.
if(CMAKE_CXX_CLANG_TIDY)
  set_target_properties(Vantrel PROPERTIES UNITY_BUILD OFF)
endif()

# The major version, and SOVERSION with it, rises whenever an exported name goes away or the type or
# layout behind one changes; new names leave it as it is.
set_target_properties(Vantrel PROPERTIES
  VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR}
  CXX_VISIBILITY_PRESET hidden VISIBILITY_INLINES_HIDDEN ON POSITION_INDEPENDENT_CODE ON
  DEFINE_SYMBOL VANTREL_BUILD)

# A shared library exports the names of the list; no other symbol leaves it, those of the C++ library
# neither. Where there is no such script the marks in the header decide.
function(export_names library list)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${list})
  file(STRINGS ${list} names)
  if(CMAKE_EXECUTABLE_FORMAT STREQUAL "ELF")
    list(JOIN names ";\n    " names)
    set(script ${CMAKE_CURRENT_BINARY_DIR}/${library}.map)
    file(CONFIGURE OUTPUT ${script} CONTENT "{\n  global:\n    @names@;\n  local: *;\n};\n" @ONLY)
    target_link_options(${library} PRIVATE "-Wl,--version-script=${script}")
  elseif(APPLE)
    list(TRANSFORM names PREPEND _)
    list(JOIN names "\n" names)
    set(script ${CMAKE_CURRENT_BINARY_DIR}/${library}.exports)
    file(CONFIGURE OUTPUT ${script} CONTENT "@names@\n" @ONLY)
    target_link_options(${library} PRIVATE "-Wl,-exported_symbols_list,${script}")
  else()
    if(MINGW) # as others there are called; other compilers make their import library of the .def
      set(script ${CMAKE_CURRENT_BINARY_DIR}/${library}.def)
      set_target_properties(${library} PROPERTIES PREFIX "")
      target_link_options(${library} PRIVATE "-Wl,--output-def,${script}")
      if(VANTREL_INSTALL)
        install(FILES ${script} TYPE LIB)
      endif()
    endif()
    return()
  endif()
  set_target_properties(${library} PROPERTIES LINK_DEPENDS ${script})
endfunction()

get_target_property(type Vantrel TYPE)
if(NOT type STREQUAL SHARED_LIBRARY)
  target_compile_definitions(Vantrel PUBLIC VANTREL_STATIC)
  # Who links the static library, from C perhaps, needs the C++ runtime too.
  set(runtime ${CMAKE_CXX_IMPLICIT_LINK_LIBRARIES})
  list(FILTER runtime INCLUDE REGEX "^(stdc\\+\\+|c\\+\\+|m)$")
  target_link_libraries(Vantrel INTERFACE ${runtime})
else()
  export_names(Vantrel ${PROJECT_SOURCE_DIR}/src/exports.txt)
endif()
