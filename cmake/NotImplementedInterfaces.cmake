# not_implemented_interfaces(NAME)
# A library of headers alone. Writes into the build folder, for each header that AAF.h
# includes, a header of the same name in not_implemented/ with one specialisation of
# aaf::NotImplemented for each of its interfaces, and not_implemented/AAF.h, which includes
# all of them. not_implemented/Operations.h tells the names of all interfaces and of their operations,
# in order. They are written again whenever a header changes. An operation has the form
# `virtual HRESULT Name(arguments) = 0;` and a name for every argument.
function(not_implemented_interfaces name)
  set(folder ${PROJECT_BINARY_DIR}/generated)
  set(all "#pragma once\n")
  set(names "")
  set(list "")
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
        string(APPEND names "template <>\nstruct Published<${CMAKE_MATCH_1}> {\n    static constexpr "
                            "const char* kNames[] = {\"${CMAKE_MATCH_1}\"};\n};\n")
        string(APPEND list ", ${CMAKE_MATCH_1}")
      else()
        string(REGEX MATCH "HRESULT .*[)]" operation "${part}")
        string(REGEX REPLACE " [A-Za-z0-9_]+([,)])" "\\1" operation "${operation}")
        string(APPEND code "    ${operation} override { return AAFRESULT_NOT_IMPLEMENTED; }\n")
        string(REGEX MATCH "HRESULT ([A-Za-z0-9]+)" operation "${operation}")
        string(REGEX REPLACE "};\n};\n$" ", \"${CMAKE_MATCH_1}\"};\n};\n" names "${names}")
      endif()
    endforeach()
    get_filename_component(family ${header} NAME)
    file(CONFIGURE OUTPUT ${folder}/not_implemented/${family} @ONLY
         CONTENT "${code}${end}}  // namespace aaf\n")
    string(APPEND all "#include \"not_implemented/${family}\"\n")
  endforeach()
  file(CONFIGURE OUTPUT ${folder}/not_implemented/AAF.h CONTENT "${all}" @ONLY)
  string(SUBSTRING "${list}" 2 -1 list)
  file(CONFIGURE OUTPUT ${folder}/not_implemented/Operations.h @ONLY CONTENT "#pragma once
#include \"host_interfaces/aaf/AAF.h\"
namespace aaf {
// The names of an interface and of its operations behind those of IUnknown.
template <class Interface>
struct Published;
${names}
template <class... Interfaces>
struct ListOf {};
using PublishedInterfaces = ListOf<${list}>;
}  // namespace aaf
")
endfunction()
