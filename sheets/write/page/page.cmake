# Gives vantrel_sheets the page of --format html, bundled from npm's packages by build.mjs. Where these
# cannot be had it is built without the page.

option(VANTREL_PAGE "Build the page of --format html (needs npm)" ON)
set(page_dir ${CMAKE_CURRENT_SOURCE_DIR}/write/page)
set(page_build ${CMAKE_CURRENT_BINARY_DIR}/page)
set(page_lock ${page_build}/package-lock.json)
set(page_modules ${page_build}/node_modules/.package-lock.json)
set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${page_dir}/package-lock.json)

find_program(VANTREL_NODE NAMES node nodejs)
find_program(VANTREL_NPM npm)
set(page_missing)
if(NOT VANTREL_PAGE)
  set(page_missing "VANTREL_PAGE is off")
elseif(NOT VANTREL_NODE OR NOT VANTREL_NPM)
  set(page_missing "npm is missing (Debian: npm)")
elseif(NOT EXISTS ${page_modules} OR ${page_dir}/package-lock.json IS_NEWER_THAN ${page_modules})
  file(COPY ${page_dir}/package.json ${page_dir}/package-lock.json ${page_dir}/.npmrc
       DESTINATION ${page_build})
  message(STATUS "Fetching the packages of the page, those of ${page_lock}, by npm into ${page_build}")
  execute_process(COMMAND ${VANTREL_NPM} ci --loglevel=error WORKING_DIRECTORY ${page_build}
                  OUTPUT_QUIET RESULT_VARIABLE page_failed TIMEOUT 300)
  if(page_failed)
    file(REMOVE ${page_modules})
    set(page_missing "npm could not fetch its packages")
  endif()
endif()

if(page_missing)
  message(STATUS "The program is built without --format html: ${page_missing}")
  target_sources(vantrel_sheets PRIVATE write/page/no_page.cpp)
  return()
endif()

file(GLOB page_sources CONFIGURE_DEPENDS
     ${page_dir}/*.js ${page_dir}/*.css ${page_dir}/*.html ${page_dir}/*.mjs)
add_custom_command(OUTPUT ${page_build}/page.cpp
  COMMAND ${VANTREL_NODE} ${page_dir}/build.mjs ${page_build}/node_modules ${page_build}/page.cpp
  DEPENDS ${page_sources} ${page_modules}
  COMMENT "Bundling the page" VERBATIM)
target_sources(vantrel_sheets PRIVATE ${page_build}/page.cpp)
