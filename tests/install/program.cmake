# The installed program, with the licences of what is compiled into it and data that it can read.

function(run)
  execute_process(COMMAND ${ARGV} COMMAND_ERROR_IS_FATAL ANY OUTPUT_VARIABLE output)
  set(output "${output}" PARENT_SCOPE)
endfunction()

file(REMOVE_RECURSE ${WORK})
run(${CMAKE_COMMAND} --install ${BUILD} --prefix ${WORK})
set(doc ${WORK}/share/doc/Vantrel)

file(READ ${doc}/THIRD-PARTY.txt notices)
foreach(folder sheets tools/vantrel)
  file(STRINGS ${SOURCE}/${folder}/CMakeLists.txt packages REGEX "^find_package")
  foreach(package IN LISTS packages)
    string(REGEX REPLACE "find_package\\(([A-Za-z0-9]+).*" "\\1" name "${package}")
    if(NOT notices MATCHES "\n[^\n]*${name}[^\n]*\nCopyright \\(c\\)")
      message(FATAL_ERROR "THIRD-PARTY.txt has no notice of ${package}")
    endif()
  endforeach()
endforeach()

file(GLOB sheets ${doc}/examples/*.txt)
run(${WORK}/bin/vantrel report ${sheets} --format csv)
if(NOT output MATCHES "Magenta 10,")
  message(FATAL_ERROR "the installed program does not read the installed ${sheets}:\n${output}")
endif()

# A host in C finds libVantrelSheets by pkg-config; what it says is what the program says. C alone would
# leave out what the sanitizers need of C++.
if(NOT C_FLAGS MATCHES "sanitize")
  set(ENV{PKG_CONFIG_PATH} ${WORK}/lib/pkgconfig)
  run(${PKG_CONFIG} --cflags --libs vantrel_sheets)
  separate_arguments(flags UNIX_COMMAND "${output}")
  run(${C_COMPILER} ${SOURCE}/tests/program/host.c -o ${WORK}/host ${flags})
  run(${WORK}/bin/vantrel report ${sheets} --format json)
  set(printed "${output}")
  run(${CMAKE_COMMAND} -E env LD_LIBRARY_PATH=${WORK}/lib ${WORK}/host report {} ${sheets})
  if(NOT output STREQUAL printed)
    message(FATAL_ERROR "a host with libVantrelSheets says otherwise than the program:\n${output}")
  endif()
endif()

string(REPLACE .txt .LICENSE conditions ${sheets})
file(READ ${conditions} unused)
