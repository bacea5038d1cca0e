#!/usr/bin/env bash
# House rules that a machine can see.
set -euo pipefail
failed=0
rule() { # rule MESSAGE GREP-ARGS...
  local message=$1 hits
  shift
  if hits=$(git grep -nE "$@"); then
    printf '%s:\n%s\n' "$message" "$hits"
    failed=1
  fi
}

rule 'the module knows the border alone' '#include "(reference_host|aaf_library|text)/' -- source host_interfaces public_include
rule 'host and border know the border alone' '#include "(source|aaf_library)/' -- reference_host host_interfaces public_include
rule 'the AAF library knows border and encodings alone' '#include "(source|reference_host)/' -- aaf_library
rule 'encodings know nothing else' '#include "(source|reference_host|aaf_library|host_interfaces)/' -- text
scripts/check_rooms.sh || failed=1
rule 'system headers belong in source/plugin/os/' \
  '#include <(windows|unistd|fcntl|dlfcn|pthread|sys/[a-z]+)\.h>' -- source public_include ':!source/plugin/os'
rule 'system headers belong in reference_host/system/' \
  '#include <(windows|bcrypt|unistd|fcntl|dlfcn|dirent|pthread|sys/[a-z]+)\.h>' -- reference_host ':!reference_host/system'
rule 'the text of a path is PathText() or u8string(): elsewhere it is in the code page' \
  '\.(generic_)?string\(\)' -- reference_host aaf_library
rule "the system's errors have numbers and words of its own: ask for default_error_condition() first" \
  '\b(error|failure|problem)\.(value|message)\(\)' -- reference_host aaf_library ':!reference_host/system'
rule 'attributes of compilers belong in host_interfaces/framework/Compiler.h' '__attribute__|__declspec' \
  -- source host_interfaces public_include text aaf_library reference_host \
     ':!host_interfaces/framework/Compiler.h' ':!reference_host/quicktime/pixels'
rule 'tr1 belongs in source/plugin/Tr1Memory.h' '#include <tr1/' -- source tests ':!source/plugin/Tr1Memory.h'
rule 'throw typed codes, never literals or raw results' 'throw (0x|-?[0-9]|hr\b|\(?HRESULT)' -- source
rule 'a long text has no fixed width here' '\b(unsigned )?long [a-z_A-Z]+ *(=|;|,|\))' -- source

rule 'a path in a command needs Quoted()' \
  '(RunCommand|RunCliphost|popen|system)\(.*\.(u8)?string\(\)' -- tests
while read -r file; do
  if [ "$(grep -c 'add_custom_command(' "$file")" != "$(grep -cw VERBATIM "$file")" ]; then
    echo "$file: add_custom_command needs VERBATIM, or a parenthesis in a path breaks the build"
    failed=1
  fi
done < <(git grep -l 'add_custom_command(' -- '*CMakeLists.txt' '*.cmake')

mapfile -t files < <(git ls-files '*.h' '*.cpp')
if ! bad=$(clang-format --dry-run -Werror "${files[@]}" 2>&1); then
  printf '%s\n' "$bad" | grep -E 'error:' | cut -d: -f1 | sort | uniq -c | sort -rn | head -20
  echo 'run clang-format -i on these files'
  failed=1
fi
log=$(mktemp)
cmake --preset debug >"$log" || { cat "$log"; exit 1; }
# Each file has to compile alone; other builds take several at once.
if ! cmake --build --preset debug --target cliphost QuickTimePlugin >"$log" 2>&1; then
  grep -E 'error:|warning:' "$log" | sort -u
  failed=1
fi
# The module alone: of the rest, the compilers' own warnings are enough.
if ! git ls-files 'source/*.cpp' | grep -v _windows \
  | xargs -P "$(nproc)" -n 4 clang-tidy -p build/debug --quiet >"$log" 2>/dev/null; then
  grep -E 'error:' "$log" | sort -u
  failed=1
fi
rm -f "$log"
# For hosts that Microsoft's compiler makes.
scripts/check_border_places.sh || failed=1
scripts/check_clang_cl.sh || failed=1
((failed == 0)) && echo 'lint: nothing to say'
exit $failed
