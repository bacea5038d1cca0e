# 64-bit Windows, cross-built. One libstdc++ and one libgcc DLL for module,
# libraries and host, so that exceptions may cross between them.
set(CMAKE_SYSTEM_NAME Windows)
set(CMAKE_SYSTEM_PROCESSOR x86_64)
set(CMAKE_C_COMPILER x86_64-w64-mingw32-gcc-posix)
set(CMAKE_CXX_COMPILER x86_64-w64-mingw32-g++-posix)
set(CMAKE_RC_COMPILER x86_64-w64-mingw32-windres)
set(CMAKE_FIND_ROOT_PATH_MODE_PROGRAM NEVER)
set(CMAKE_FIND_ROOT_PATH_MODE_LIBRARY ONLY)
set(CMAKE_FIND_ROOT_PATH_MODE_INCLUDE ONLY)
add_compile_definitions(__USE_MINGW_ANSI_STDIO=1)
add_link_options(-shared-libgcc)

# With -DCMAKE_FIND_ROOT_PATH=FOLDER, libraries out of cmake/windows_libraries.sh and no others.
if(CMAKE_FIND_ROOT_PATH)
  set(ENV{PKG_CONFIG_LIBDIR} "${CMAKE_FIND_ROOT_PATH}/lib/pkgconfig")
endif()
