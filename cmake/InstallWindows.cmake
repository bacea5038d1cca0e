# `cmake --install` of a folder that runs as it is, wherever it lies: the program, the libraries that it
# needs, the module with its data files, and the licences of all. CMAKE_FIND_ROOT_PATH is the folder of
# cmake/windows_libraries.sh.
install(TARGETS cliphost NMAUtilLib20 aaf_library movie_library RUNTIME DESTINATION .)
install(TARGETS QuickTimePlugin LIBRARY DESTINATION plugins)
install(DIRECTORY data/ DESTINATION plugins FILES_MATCHING PATTERN "*.xml")
install(DIRECTORY ${CMAKE_FIND_ROOT_PATH}/bin/ DESTINATION . FILES_MATCHING PATTERN "*.dll")
foreach(library libgcc_s_seh-1 libstdc++-6 libwinpthread-1)
  execute_process(COMMAND ${CMAKE_CXX_COMPILER} -print-file-name=${library}.dll
                  OUTPUT_VARIABLE file OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
  install(FILES ${file} DESTINATION .)
endforeach()

install(FILES cmake/windows_folder/README.txt DESTINATION .)
install(FILES docs/cliphost.toml DESTINATION .)
install(FILES LICENSE DESTINATION licences RENAME cliphost)
install(DIRECTORY ${CMAKE_FIND_ROOT_PATH}/licences DESTINATION . PATTERN googletest EXCLUDE)
foreach(package gcc-mingw-w64-x86-64-posix-runtime mingw-w64-x86-64-dev)
  install(FILES /usr/share/doc/${package}/copyright DESTINATION licences RENAME ${package})
endforeach()
