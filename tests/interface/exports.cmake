# The library exports the names of the list, no more and no fewer.

execute_process(COMMAND ${NM} -D --defined-only -j ${LIBRARY}
                OUTPUT_VARIABLE exported COMMAND_ERROR_IS_FATAL ANY)
string(REGEX MATCHALL "[^\n]+" exported "${exported}")
file(STRINGS ${LIST} listed)

set(missing ${listed})
list(REMOVE_ITEM missing ${exported})
set(unlisted ${exported})
list(REMOVE_ITEM unlisted ${listed})
if(missing OR unlisted)
  list(JOIN missing " " missing)
  list(JOIN unlisted " " unlisted)
  message(FATAL_ERROR "listed, not exported: ${missing}\nexported, not listed: ${unlisted}")
endif()

set(sorted ${listed})
list(SORT sorted)
list(REMOVE_DUPLICATES sorted)
if(NOT sorted STREQUAL listed)
  message(FATAL_ERROR "${LIST} is not sorted, or names something twice")
endif()
