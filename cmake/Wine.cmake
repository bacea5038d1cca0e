# Tests that are made for Windows run under Wine, with the libraries that they load.
set(folders ${PROJECT_BINARY_DIR} ${CMAKE_FIND_ROOT_PATH}/bin)
foreach(library libgcc_s_seh-1 libwinpthread-1)
  execute_process(COMMAND ${CMAKE_CXX_COMPILER} -print-file-name=${library}.dll
                  OUTPUT_VARIABLE file OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
  get_filename_component(folder ${file} REALPATH)
  get_filename_component(folder ${folder} DIRECTORY)
  list(APPEND folders ${folder})
endforeach()
list(JOIN folders : folders)
# What Wine keeps takes time and room: it lies where the tests of the whole folder keep theirs.
set(CMAKE_CROSSCOMPILING_EMULATOR
    ${PROJECT_SOURCE_DIR}/tests/wine/run.sh ${PROJECT_BINARY_DIR}-test/wine ${folders})
