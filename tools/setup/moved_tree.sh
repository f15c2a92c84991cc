# The scripts `run` and `test` source this file. CMake refuses a build folder that was made for
# another source tree. A copied or moved tree may contain such folders.

# Removes build/PRESET if it was made for another source tree. The argument is the preset's name.
forget_build_of_another_tree() {
  local cache=build/$1/CMakeCache.txt made_in
  [ -f "$cache" ] || return 0
  made_in=$(sed -n 's/^CMAKE_HOME_DIRECTORY:INTERNAL=//p' "$cache")
  [ "$(realpath -m "$made_in")" = "$(pwd -P)" ] || rm -rf "build/$1"
}
