# One variant of use: shared, static (installed, then moved) or subproject.

cmake_minimum_required(VERSION 3.21)

function(run)
  execute_process(COMMAND ${ARGV} COMMAND_ERROR_IS_FATAL ANY)
endfunction()

function(configure build source)
  run(${CMAKE_COMMAND} --no-warn-unused-cli -S ${source} -B ${build} -G ${GENERATOR}
      -D CMAKE_BUILD_TYPE=Release
      -D CMAKE_C_COMPILER=${C_COMPILER} -D CMAKE_CXX_COMPILER=${CXX_COMPILER} ${ARGN})
  run(${CMAKE_COMMAND} --build ${build})
endfunction()

# The first example of the README in this language, and what the README says that it prints.
function(take_example fence file)
  file(READ ${SOURCE}/README.md readme)
  if(NOT readme MATCHES "```${fence}\n([^`]*)```[^`]*```text\n([^`]*)```")
    message(FATAL_ERROR "README.md shows no ${fence} example with its output")
  endif()
  file(WRITE ${file} "${CMAKE_MATCH_1}")
  set(promised "${CMAKE_MATCH_2}" PARENT_SCOPE)
endfunction()

# The indented lines at the end of a file's opening comment: what it says that it prints.
function(take_opening_comment file)
  file(READ ${file} text)
  if(NOT text MATCHES "\n( \\*     +unfiltered[^/]*)\n \\*\n")
    message(FATAL_ERROR "${file} does not say what it prints")
  endif()
  string(REGEX REPLACE "(^|\n) \\*     " "\\1" printed "${CMAKE_MATCH_1}")
  set(promised "${printed}\n" PARENT_SCOPE)
endfunction()

function(check_output program)
  execute_process(COMMAND ${CMAKE_COMMAND} -E env LD_LIBRARY_PATH=${prefix}/lib ${program}
                  OUTPUT_VARIABLE output COMMAND_ERROR_IS_FATAL ANY)
  if(NOT output STREQUAL promised)
    message(FATAL_ERROR "${program} printed\n${output}and the text promises\n${promised}")
  endif()
endfunction()

file(REMOVE_RECURSE ${WORK}/prefix ${WORK}/staged ${WORK}/C ${WORK}/CXX)
set(prefix ${WORK}/prefix)
if(VARIANT STREQUAL "subproject")
  # The library is compiled anew for each language: without optimisation, the numbers are the same.
  set(use -D VANTREL_SOURCE=${SOURCE} -D CMAKE_BUILD_TYPE=Debug)
else()
  string(COMPARE EQUAL ${VARIANT} shared shared)
  configure(${WORK}/library ${SOURCE} -D BUILD_SHARED_LIBS=${shared}
            -D VANTREL_PROGRAM=OFF -D VANTREL_TESTS=OFF -D VANTREL_BENCHMARKS=OFF
            -D CMAKE_INSTALL_LIBDIR=lib)
  run(${CMAKE_COMMAND} --install ${WORK}/library --prefix ${WORK}/staged)
  file(RENAME ${WORK}/staged ${prefix})
  file(READ ${prefix}/share/doc/Vantrel/LICENSE unused)
  set(ENV{PKG_CONFIG_PATH} ${prefix}/lib/pkgconfig)
  set(use -D CMAKE_PREFIX_PATH=${prefix})
endif()

foreach(language C CXX)
  set(fence_C c)
  set(fence_CXX cpp)
  set(example ${WORK}/example.${fence_${language}})
  take_example(${fence_${language}} ${example})

  set(build ${WORK}/${language})
  configure(${build} ${CMAKE_CURRENT_LIST_DIR}/consumer -D LANGUAGE=${language}
            -D EXAMPLE=${example} ${use})
  check_output(${build}/example)

  if(VARIANT STREQUAL "subproject")
    run(${CMAKE_COMMAND} --install ${build} --prefix ${prefix})
    execute_process(COMMAND ${CMAKE_CTEST_COMMAND} --test-dir ${build} -N OUTPUT_VARIABLE tests)
    file(GLOB installed ${prefix}/*)
    if(installed OR NOT tests MATCHES "Total Tests: 0")
      message(FATAL_ERROR "a subproject brings install rules or tests along:\n${installed}${tests}")
    endif()
  else()
    execute_process(COMMAND ${PKG_CONFIG} --cflags --libs vantrel
                    OUTPUT_VARIABLE flags COMMAND_ERROR_IS_FATAL ANY)
    separate_arguments(flags UNIX_COMMAND "${flags}")
    run(${${language}_COMPILER} ${example} -o ${build}/by_pkg_config ${flags})
    check_output(${build}/by_pkg_config)
    if(language STREQUAL "C")
      take_opening_comment(${SOURCE}/examples/measure.c)
      run(${C_COMPILER} -std=c99 -pedantic -Wall -Wextra -Werror ${SOURCE}/examples/measure.c
          -o ${build}/measure ${flags})
      check_output(${build}/measure)
    endif()
  endif()
endforeach()
