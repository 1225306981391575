# Sourced by the wrappers ./haldencli and ./haldensim: runs the named program
# from ./build, building it first when a source changed since the last build.
# The check is one find over the sources, kept in this shell for speed;
# scripts that call the tool thousands of times can run build/bin/* directly.

top=${BASH_SOURCE[0]%/*}/..
program=$1
shift

built() {
  [ -e "$1" ] &&
  [ -z "$(find "$top/CMakeLists.txt" "$top/lib" "$top/plugins" "$top/tools" "$top/tests" "$top/data" \
            -newer "$1" -print -quit 2>/dev/null)" ]
}

if ! built "$top/build/.built-tools" && ! built "$top/build/.built-all"; then
  "$top/scripts/build.sh" tools || exit 2
fi
exec "$top/build/bin/$program" "$@"
