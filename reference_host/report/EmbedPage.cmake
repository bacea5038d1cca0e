# Writes SOURCE, which holds the page's FILES as texts: the HTML, the style, and all scripts as one.
function(as_texts name text)
  # A literal has a length that compilers bound, so a text is put together from several.
  set(pieces "")
  string(LENGTH "${text}" length)
  set(at 0)
  while(at LESS length)
    string(SUBSTRING "${text}" ${at} 8000 piece)
    string(APPEND pieces "\n    R\"page(${piece})page\"")
    math(EXPR at "${at} + 8000")
  endwhile()
  set(${name} "${pieces}" PARENT_SCOPE)
endfunction()

set(script "'use strict';\n(() => {\n")
foreach(file IN LISTS FILES)
  file(READ "${file}" text)
  string(FIND "${text}" ")page\"" clash)
  if(NOT clash EQUAL -1)
    message(FATAL_ERROR "${file}: it holds )page\", which ends a text of the program")
  endif()
  # None of these is of use within the program.
  string(REGEX REPLACE "^(//|/\\*|<!--) Copyright[^\n]*\n[^\n]*\n" "" text "${text}")
  if(file MATCHES "\\.html$")
    as_texts(html "${text}")
  elseif(file MATCHES "\\.css$")
    as_texts(style "${text}")
    string(SHA256 style_digest "${text}")
  else()
    string(APPEND script "${text}")
  endif()
endforeach()
string(APPEND script "})();\n")
string(SHA256 script_digest "${script}")
as_texts(script "${script}")

file(WRITE "${SOURCE}" "#include \"reference_host/report/PageFiles.h\"

namespace report {

const char* const kPageHtml =${html};
const char* const kPageStyle =${style};
const char* const kPageScript =${script};
const char* const kPageStyleDigest = \"${style_digest}\";
const char* const kPageScriptDigest = \"${script_digest}\";

}  // namespace report
")
