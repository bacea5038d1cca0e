# not_implemented_interfaces(NAME)
# A library of headers alone. Writes into the build folder, for each header that AAF.h
# includes, a header of the same name in not_implemented/ with one specialisation of
# aaf::NotImplemented for each of its interfaces, and not_implemented/AAF.h, which includes
# all of them. They are written again whenever a header changes. An operation has the form
# `virtual HRESULT Name(arguments) = 0;` and a name for every argument.
function(not_implemented_interfaces name)
  set(folder ${PROJECT_BINARY_DIR}/generated)
  set(all "#pragma once\n")
  add_library(${name} INTERFACE)
  target_include_directories(${name} INTERFACE ${folder})
  file(READ ${PROJECT_SOURCE_DIR}/host_interfaces/aaf/AAF.h index)
  string(REGEX MATCHALL "host_interfaces/aaf/[A-Za-z]+.h" headers "${index}")
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS
               ${PROJECT_SOURCE_DIR}/host_interfaces/aaf/AAF.h)
  foreach(header IN LISTS headers)
    set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/${header})
    file(READ ${PROJECT_SOURCE_DIR}/${header} text)
    string(REGEX REPLACE "//[^\n]*" "" text "${text}")
    string(REGEX REPLACE "[ \n]+" " " text "${text}")
    string(REGEX MATCHALL "struct [A-Za-z0-9]+ :|virtual HRESULT [^=]+= 0" parts "${text}")
    set(code "#pragma once\n#include \"${header}\"\n#include \"host_interfaces/aaf/AAFResultCodes.h\"
#include \"aaf_library/model/NotImplemented.h\"\nnamespace aaf {\n")
    set(end "")
    foreach(part IN LISTS parts)
      if(part MATCHES "^struct (.*) :")
        string(APPEND code "${end}template <>\nclass NotImplemented<${CMAKE_MATCH_1}> : "
                           "public ${CMAKE_MATCH_1} {\npublic:\n")
        set(end "\nprotected:\n    ~NotImplemented() = default;\n};\n")
      else()
        string(REGEX MATCH "HRESULT .*[)]" operation "${part}")
        string(REGEX REPLACE " [A-Za-z0-9_]+([,)])" "\\1" operation "${operation}")
        string(APPEND code "    ${operation} override { return AAFRESULT_NOT_IMPLEMENTED; }\n")
      endif()
    endforeach()
    get_filename_component(family ${header} NAME)
    file(CONFIGURE OUTPUT ${folder}/not_implemented/${family} @ONLY
         CONTENT "${code}${end}}  // namespace aaf\n")
    string(APPEND all "#include \"not_implemented/${family}\"\n")
  endforeach()
  file(CONFIGURE OUTPUT ${folder}/not_implemented/AAF.h CONTENT "${all}" @ONLY)
endfunction()
