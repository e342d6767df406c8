# What the ABI audits share, sourced by them: compiling a probe of the
# module's and the framework's headers (the text in $probe) as clang lays it
# out for one C++ ABI, and printing what -Xclang DUMP-FLAG dumps of it.
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
compiler=${CLANGXX:-clang++}
mingw=${MINGW_INCLUDE:-/usr/x86_64-w64-mingw32/include}
resource=$("$compiler" -print-resource-dir)

# compileProbe itanium|microsoft DUMP-FLAG
compileProbe() {
  local target=x86_64-linux-gnu
  local flags=()
  if [ "$1" = microsoft ]; then
    target=x86_64-pc-windows-msvc
    flags=(-fgnuc-version=12 -nostdinc -isystem "$here/../msabi/include" -isystem "$resource/include"
      -isystem "$mingw" -D_UCRT)
  fi
  printf '%s\n' "$probe" | "$compiler" -target "$target" -std=c++17 -fno-rtti "${flags[@]}" \
    -I "$here/../module" -I "$here/../tavixcore/include" -x c++ -S -o /dev/null -Xclang "$2" -
}
