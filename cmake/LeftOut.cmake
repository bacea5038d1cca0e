# What of the tests is left out on Windows: the lines of tests/wine/left_out.txt, `PROGRAM WHAT REASON`.
# WHAT is `*` for all of a program, `thorough` for one that only CLIPHOST_THOROUGH builds, the name of one of
# its files, or `SUITE.TEST` with the wildcard *. A line that fits nothing is an error: of programs and
# files here, of tests in TestRows.cmake.
set(CLIPHOST_LEFT_OUT ${PROJECT_SOURCE_DIR}/tests/wine/left_out.txt)

if(WIN32)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${CLIPHOST_LEFT_OUT})
  file(STRINGS ${CLIPHOST_LEFT_OUT} lines REGEX "^[^#]")
  foreach(line IN LISTS lines)
    if(NOT line MATCHES "^([^ ]+) +([^ ]+) +[^ ]")
      message(FATAL_ERROR "${CLIPHOST_LEFT_OUT}: this line lacks a program, what of it is left out, or why: ${line}")
    endif()
    set_property(GLOBAL APPEND PROPERTY LEFT_OUT_PROGRAMS ${CMAKE_MATCH_1})
    set_property(GLOBAL APPEND PROPERTY LEFT_OUT_${CMAKE_MATCH_1} ${CMAKE_MATCH_2})
  endforeach()
endif()

# leave_out(PROGRAM SOURCES TESTS ALL): takes files that are left out from the list SOURCES, and sets TESTS
# to the patterns of tests and ALL to whether it is the whole program.
function(leave_out program sources tests all)
  get_property(left GLOBAL PROPERTY LEFT_OUT_${program})
  set_property(GLOBAL APPEND PROPERTY LEFT_OUT_SEEN ${program})
  set(whole OFF)
  if("*" IN_LIST left OR ("thorough" IN_LIST left AND NOT CLIPHOST_THOROUGH))
    set(whole ON)
  endif()
  list(REMOVE_ITEM left "*" thorough)
  set(files ${left})
  list(FILTER files INCLUDE REGEX "\\.cpp$")
  list(FILTER left EXCLUDE REGEX "\\.cpp$")
  foreach(file IN LISTS files)
    if(NOT file IN_LIST ${sources})
      message(FATAL_ERROR "${CLIPHOST_LEFT_OUT}: ${program} has no file ${file}")
    endif()
  endforeach()
  list(REMOVE_ITEM ${sources} ${files})
  set(${sources} ${${sources}} PARENT_SCOPE)
  set(${tests} ${left} PARENT_SCOPE)
  set(${all} ${whole} PARENT_SCOPE)
endfunction()

# check_left_out(): ends the configuration where a line names a program that there isn't.
function(check_left_out)
  get_property(programs GLOBAL PROPERTY LEFT_OUT_PROGRAMS)
  get_property(seen GLOBAL PROPERTY LEFT_OUT_SEEN)
  list(REMOVE_ITEM programs ${seen} "")
  if(programs)
    message(FATAL_ERROR "${CLIPHOST_LEFT_OUT}: there is no test program called ${programs}")
  endif()
endfunction()
