# Settings that every target shares, and the few functions that make targets.

include(CheckCXXCompilerFlag)

set(CMAKE_CXX_STANDARD 17)
set(CMAKE_CXX_STANDARD_REQUIRED ON)
set(CMAKE_CXX_EXTENSIONS OFF)
set(CMAKE_POSITION_INDEPENDENT_CODE ON)
set(CMAKE_CXX_VISIBILITY_PRESET hidden)
set(CMAKE_VISIBILITY_INLINES_HIDDEN ON)
set(CMAKE_EXPORT_COMPILE_COMMANDS ON)

# What a user runs lies flat in the build folder; the module has a folder of
# its own with its data files beside it.
set(CMAKE_RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR})
set(CMAKE_LIBRARY_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR})
set(CLIPHOST_PLUGIN_DIR ${PROJECT_BINARY_DIR}/plugins)
set(CMAKE_BUILD_RPATH_USE_ORIGIN ON)

find_program(CCACHE ccache)
if(CCACHE)
  set(CMAKE_CXX_COMPILER_LAUNCHER ${CCACHE})
endif()

# A linker that takes a tenth of the time, where there is one.
find_program(LLD ld.lld)
if(LLD AND NOT WIN32)
  add_link_options(-fuse-ld=lld)
endif()

# The files are small and read the same headers. In batches, the first build of all
# takes a third of the time; file by file, the next build after an edit is the shorter.
option(CLIPHOST_BATCHES "Compile the files of a library in batches" OFF)
set(CMAKE_UNITY_BUILD_BATCH_SIZE 8)
# It spends a seventh of its time on collecting garbage, unless it may have so many kilobytes of it.
if(CLIPHOST_BATCHES AND CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
  add_compile_options(--param=ggc-min-heapsize=524288)
endif()

add_library(project_options INTERFACE)
target_include_directories(project_options INTERFACE ${PROJECT_SOURCE_DIR})
if(MSVC)
  target_compile_options(project_options INTERFACE /W4 /EHsc /permissive- /utf-8)
else()
  target_compile_options(project_options INTERFACE -Wall -Wextra -Wpedantic -Wshadow -Wvla
    -Wnon-virtual-dtor -Werror=format -Werror=return-type)
endif()
if(CLIPHOST_SANITIZE)
  target_compile_options(project_options INTERFACE -fsanitize=${CLIPHOST_SANITIZE}
    -fno-sanitize-recover=all -fno-omit-frame-pointer)
  target_link_options(project_options INTERFACE -fsanitize=${CLIPHOST_SANITIZE})
endif()
if(CLIPHOST_FUZZ)
  target_compile_options(project_options INTERFACE -fsanitize=fuzzer-no-link)
endif()

# need_flags(FLAG ...): ends the configuration where the compiler doesn't know one of them. For flags that
# decide about results; one that is silently left out would change them.
function(need_flags)
  foreach(flag IN LISTS ARGN)
    string(MAKE_C_IDENTIFIER "KNOWS${flag}" known)
    check_cxx_compiler_flag(${flag} ${known})
    if(NOT ${known})
      message(FATAL_ERROR "${CMAKE_CXX_COMPILER} doesn't know ${flag}, which this project needs. "
                          "A newer compiler and assembler may.")
    endif()
  endforeach()
endfunction()

# define_paths(SOURCE NAME=PATH ...): texts for one source file alone. All other
# files compile alike wherever the project lies, so a cache of compilations
# serves every copy of it.
function(define_paths source)
  list(TRANSFORM ARGN REPLACE "^([^=]+)=(.*)$" "\\1=\"\\2\"")
  set_property(SOURCE ${source} APPEND PROPERTY COMPILE_DEFINITIONS ${ARGN})
endfunction()

# project_library(NAME [SINGLE] SOURCES file... [PUBLIC target...] [PRIVATE target...])
# One static library for one folder, linked into the module, the host or tests. SINGLE: never
# compiled in batches, because a test has doubles of some of its files.
function(project_library name)
  cmake_parse_arguments(ARG "SINGLE" "" "SOURCES;PUBLIC;PRIVATE" ${ARGN})
  add_library(${name} STATIC ${ARG_SOURCES})
  if(CLIPHOST_BATCHES AND NOT ARG_SINGLE)
    set_target_properties(${name} PROPERTIES UNITY_BUILD ON)
  endif()
  target_link_libraries(${name} PUBLIC project_options host_interfaces ${ARG_PUBLIC}
                                PRIVATE ${ARG_PRIVATE})
endfunction()

# The headers of the test framework take longer to read than most tests: where files are compiled in
# batches, they are read once for all tests. The tests' own code is compiled without optimisation
# there, which halves its time, and with it what stands in the headers that it includes.
function(test_code name)
  target_link_libraries(${name} PRIVATE project_options GTest::gtest GTest::gmock)
  if(NOT CLIPHOST_BATCHES)
    return()
  endif()
  # A batch includes its files, so the compiler takes what is theirs alone for a header's.
  target_compile_options(${name} PRIVATE -O0 -fpch-preprocess -Wno-subobject-linkage)
  if(name STREQUAL test_headers)
    target_precompile_headers(${name} PRIVATE <gmock/gmock.h> <gtest/gtest.h> <algorithm>
      <filesystem> <fstream> <functional> <map> <memory> <string> <vector>)
  else()
    target_precompile_headers(${name} REUSE_FROM test_headers)
  endif()
endfunction()

# test_program(NAME [SINGLE] SOURCES file... LIBS target... [APART suite...] [FILTER pattern]
#              [PROPERTIES name value ...])
# A GoogleTest program, each of whose suites is one of ctest's rows. Of suites that fit one of the
# regular expressions of APART each test is a row, and so a process, of its own: what they change
# in their process would be there for their neighbours. It is compiled in batches as the libraries
# are, so no two of its files give one name to two things; SINGLE: never in batches. What
# tests/wine/left_out.txt names is left out on Windows. Under an emulator, which takes longer to start
# than most suites do to run, all suites that aren't apart are one row.
function(test_program name)
  cmake_parse_arguments(ARG "SINGLE" "FILTER" "SOURCES;LIBS;APART;PROPERTIES" ${ARGN})
  leave_out(${name} ARG_SOURCES left_out is_left_out)
  add_executable(${name} ${ARG_SOURCES})
  if(CLIPHOST_BATCHES AND NOT ARG_SINGLE)
    set_target_properties(${name} PROPERTIES UNITY_BUILD ON)
  endif()
  test_code(${name})
  target_link_libraries(${name} PRIVATE ${ARG_LIBS} test_main)
  set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${PROJECT_BINARY_DIR}/tests)
  if(is_left_out)
    set_target_properties(${name} PROPERTIES EXCLUDE_FROM_ALL ON)
    return()
  endif()

  if(NOT ARG_FILTER)
    set(ARG_FILTER "*")
  endif()
  if(left_out)
    list(JOIN left_out ":" without)
    string(APPEND ARG_FILTER "-${without}")
  endif()
  set(base ${CMAKE_CURRENT_BINARY_DIR}/${name})
  list(APPEND ARG_PROPERTIES TIMEOUT 300 WORKING_DIRECTORY ${CMAKE_CURRENT_BINARY_DIR})
  file(GENERATE OUTPUT ${base}_program.cmake CONTENT "set(name ${name})
set(program [==[$<TARGET_FILE:${name}>]==])
set(rows [==[${base}_rows.cmake]==])
set(apart [==[${ARG_APART}]==])
set(emulator [==[${CMAKE_CROSSCOMPILING_EMULATOR}]==])
set(left_out [==[${left_out}]==])
set(filter [==[${ARG_FILTER}]==])
set(properties [==[${ARG_PROPERTIES}]==])
include([==[${PROJECT_SOURCE_DIR}/cmake/TestRows.cmake]==])
")
  set_property(DIRECTORY APPEND PROPERTY TEST_INCLUDE_FILES ${base}_program.cmake)
endfunction()

# project_test(NAME [SINGLE] SOURCES file... LIBS target... [APART suite...] [LABEL label])
# A program of unit tests.
function(project_test name)
  cmake_parse_arguments(ARG "" "LABEL" "" ${ARGN})
  if(ARG_LABEL)
    set(labels PROPERTIES LABELS ${ARG_LABEL})
  endif()
  test_program(${name} ${ARG_UNPARSED_ARGUMENTS} ${labels})
endfunction()
