include_guard(GLOBAL)
# Where a build is for another system than this one: the packages of sheets/ and tools/ as headers, since
# what this system has compiled of them is not for that one. Of pugixml VANTREL_PUGIXML has the source.
set(headers ${CMAKE_BINARY_DIR}/headers)
file(MAKE_DIRECTORY ${headers})
find_path(VANTREL_HEADERS NAMES fmt/core.h PATHS /usr/include NO_DEFAULT_PATH NO_CMAKE_FIND_ROOT_PATH REQUIRED)
foreach(header ${VANTREL_HEADERS}/fmt ${VANTREL_HEADERS}/nlohmann ${VANTREL_HEADERS}/CLI
        ${VANTREL_HEADERS}/eigen3/Eigen ${VANTREL_HEADERS}/toml++ ${VANTREL_PUGIXML}/pugixml.hpp
        ${VANTREL_PUGIXML}/pugixml.cpp ${VANTREL_PUGIXML}/pugiconfig.hpp)
  get_filename_component(name ${header} NAME)
  file(CREATE_LINK ${header} ${headers}/${name} SYMBOLIC)
endforeach()
foreach(target fmt::fmt nlohmann_json::nlohmann_json CLI11::CLI11 Eigen3::Eigen pugixml::pugixml
        tomlplusplus::tomlplusplus)
  string(REGEX REPLACE "::.*" "" package ${target})
  add_library(${target} INTERFACE IMPORTED GLOBAL)
  target_include_directories(${target} SYSTEM INTERFACE ${headers})
  file(WRITE ${CMAKE_BINARY_DIR}/packages/${package}Config.cmake "")
  set(${package}_DIR ${CMAKE_BINARY_DIR}/packages)
endforeach()
target_compile_definitions(fmt::fmt INTERFACE FMT_HEADER_ONLY)
target_compile_definitions(pugixml::pugixml INTERFACE PUGIXML_HEADER_ONLY)

# GoogleTest is compiled along where VANTREL_GOOGLETEST has its source, and otherwise not found.
set(GTest_DIR ${CMAKE_BINARY_DIR}/packages)
if(VANTREL_GOOGLETEST)
  file(WRITE ${CMAKE_BINARY_DIR}/packages/GTestConfig.cmake "")
  function(add_googletest)
    set(BUILD_SHARED_LIBS OFF)
    set(INSTALL_GTEST OFF)
    add_subdirectory(${VANTREL_GOOGLETEST} googletest EXCLUDE_FROM_ALL)
  endfunction()
  add_googletest()
endif()
