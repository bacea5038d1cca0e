# Small libraries that every run of the program needs are linked in where the system has their
# archives: each shared one costs a start a fifth of a millisecond to be found, mapped and bound.

# prefer_archive(VARIABLE name): before the module that looks for the library and respects VARIABLE.
# The archive where there is one; else VARIABLE stays unset, and the module finds the shared library.
function(prefer_archive variable name)
  if(NOT WIN32)
    find_library(${variable} NAMES lib${name}.a)
    if(NOT ${variable})
      unset(${variable} CACHE)
    endif()
  endif()
endfunction()

# Its package offers both.
set(PUGIXML $<IF:$<TARGET_EXISTS:pugixml::static>,pugixml::static,pugixml::pugixml>)

# hide_archives(TARGET): what a shared library links in is its own. The same functions in shared
# libraries that are loaded later, with FFmpeg for example, stay theirs.
function(hide_archives target)
  if(NOT WIN32)
    target_link_options(${target} PRIVATE -Wl,--exclude-libs,ALL)
  endif()
endfunction()
