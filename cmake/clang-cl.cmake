# 64-bit Windows as Microsoft's compiler sees it, to compile and never to link: Clang takes that
# compiler's options, macros, layouts and names of symbols, and MinGW's headers stand in for Microsoft's.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)
find_program(CLANG_CL NAMES clang-cl clang-cl-14 REQUIRED)
find_program(MINGW_CXX x86_64-w64-mingw32-g++-posix REQUIRED)
set(CMAKE_CXX_COMPILER ${CLANG_CL})
set(CMAKE_CXX_COMPILER_TARGET x86_64-pc-windows-msvc)
set(CMAKE_CXX_COMPILER_WORKS ON)
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)
# No tool that makes a library is asked for one.
set(CMAKE_AR /bin/true)
set(CMAKE_LINKER /bin/true)
set(CMAKE_MT /bin/true)
set(CMAKE_RC_COMPILER /bin/true)

execute_process(COMMAND ${MINGW_CXX} -print-file-name=include/c++
                OUTPUT_VARIABLE mingw_cxx_headers OUTPUT_STRIP_TRAILING_WHITESPACE)
set(flags "")
foreach(folder ${mingw_cxx_headers} ${mingw_cxx_headers}/x86_64-w64-mingw32
               /usr/x86_64-w64-mingw32/include)
  string(APPEND flags " -imsvc ${folder}")
endforeach()
cmake_path(SET prelude NORMALIZE
           "${CMAKE_CURRENT_LIST_DIR}/../tests/support/windows_headers/MinGWForClangCl.h")
set(CMAKE_CXX_FLAGS_INIT "-Wno-#warnings${flags} \"/FI${prelude}\"")
