# Sourced by the scripts at the root. CMake refuses a build folder that another source tree made, as in a
# copied or moved tree.

# Removes the build folder of a preset if another source tree made it.
forget_build_of_another_tree() {
  local cache=build/$1/CMakeCache.txt made_in
  [ -f "$cache" ] || return 0
  made_in=$(sed -n 's/^CMAKE_HOME_DIRECTORY:INTERNAL=//p' "$cache")
  [ "$(realpath -m "$made_in")" = "$(pwd -P)" ] || rm -rf "build/$1"
}
