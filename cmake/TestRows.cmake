# Read by ctest for one test program: a row for each suite, or for each test of the suites that stay
# APART. The rows are listed anew whenever the program is newer than their list.
#   name, program, rows: the program's name and file, and where its list is kept
#   emulator: what runs the program where this system can't
#   apart: regular expressions of suites; filter: of the tests; properties: of each row
if(NOT EXISTS "${program}")
  add_test("${name}_NOT_BUILT" "${name}_NOT_BUILT")
  return()
endif()

function(list_rows)
  execute_process(COMMAND ${emulator} "${program}" --gtest_list_tests "--gtest_filter=${filter}"
                  TIMEOUT 60 OUTPUT_VARIABLE listed RESULT_VARIABLE result)
  if(NOT result STREQUAL 0)
    message(FATAL_ERROR "${name} can't list its tests: ${result}\n${listed}")
  endif()
  # The value of a parameter is behind its number or name, as a comment.
  string(REGEX REPLACE " *#[^\n]*" "" listed "${listed}")
  string(REGEX REPLACE "\r?\n" ";" listed "${listed}")

  set(script "")
  foreach(line IN LISTS listed)
    if(line MATCHES "^  (.+)")
      if(is_apart)
        add_row("${suite}${CMAKE_MATCH_1}" "${suite}${CMAKE_MATCH_1}")
      endif()
    elseif(line MATCHES "^(.+)\\.$")
      set(suite "${line}")
      is_one_of("${CMAKE_MATCH_1}" is_apart)
      if(NOT is_apart)
        add_row("${name}.${CMAKE_MATCH_1}" "${suite}*")
      endif()
    endif()
  endforeach()
  if(script STREQUAL "")
    message(FATAL_ERROR "${name} lists no tests")
  endif()
  # Whoever reads the list meanwhile reads the former one whole, and several may write it at a time.
  string(RANDOM LENGTH 12 suffix)
  file(WRITE "${rows}.${suffix}" "${script}")
  file(RENAME "${rows}.${suffix}" "${rows}")
endfunction()

# A suite's name may have an instance's before it and a type's number behind it.
function(is_one_of suite result)
  set(${result} OFF PARENT_SCOPE)
  foreach(pattern IN LISTS apart)
    if(suite MATCHES "(^|/)(${pattern})(/|$)")
      set(${result} ON PARENT_SCOPE)
    endif()
  endforeach()
endfunction()

# Text for `script`, in the caller's scope. What the filter leaves out is left out of a suite, too.
macro(add_row row tests)
  string(REGEX MATCH "-.*" left_out "${filter}")
  set(begin "")
  foreach(word IN LISTS emulator)
    string(APPEND begin " [==[${word}]==]")
  endforeach()
  string(APPEND script "add_test([==[${row}]==]${begin} [==[${program}]==] [==[--gtest_filter=${tests}${left_out}]==])\n"
                       "set_tests_properties([==[${row}]==] PROPERTIES SKIP_RETURN_CODE 77")
  foreach(property IN LISTS properties)
    string(APPEND script " [==[${property}]==]")
  endforeach()
  string(APPEND script ")\n")
endmacro()

if("${program}" IS_NEWER_THAN "${rows}" OR "${CMAKE_CURRENT_LIST_FILE}" IS_NEWER_THAN "${rows}"
   OR "${CMAKE_PARENT_LIST_FILE}" IS_NEWER_THAN "${rows}")
  list_rows()
endif()
include("${rows}")
