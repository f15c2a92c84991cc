# What every room's library and every test is built with.

add_library(onramp_options INTERFACE)
target_include_directories(onramp_options INTERFACE ${PROJECT_SOURCE_DIR})
target_compile_options(onramp_options INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror
  # GCC 12 takes the libraries' own string concatenation for an overlapping copy.
  $<$<COMPILE_LANG_AND_ID:CXX,GNU>:-Wno-restrict>
  # The calls for network services and the system's version have no successors in C.
  $<$<PLATFORM_ID:Darwin>:-Wno-deprecated-declarations>)

# Every object file is instrumented, third-party headers' code included, so these are global.
if(ONRAMP_SANITIZE)
  add_compile_options(-fsanitize=address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer)
  add_link_options(-fsanitize=address,undefined)
endif()
if(ONRAMP_FUZZ)
  add_compile_options(-fsanitize=fuzzer-no-link)
endif()

# onramp_library(NAME SOURCES… [LINK libraries…]): a room's static library. Its files are compiled one
# by one in unity builds, too: a program needs backends only for those that it uses.
function(onramp_library name)
  cmake_parse_arguments(ARG "" "" "LINK" ${ARGN})
  add_library(${name} STATIC ${ARG_UNPARSED_ARGUMENTS})
  if(NOT ONRAMP_LINT)
    set_target_properties(${name} PROPERTIES UNITY_BUILD OFF)
  endif()
  target_link_libraries(${name} PUBLIC onramp_options ${ARG_LINK})
endfunction()

# onramp_backend(NAME SOURCES… [LINK libraries…]): what fulfils the seam, or a part of it. Its objects
# are linked as they are: the rooms' libraries refer to them and come after them on the linker's
# line, where it would no longer take them out of a static library.
function(onramp_backend name)
  cmake_parse_arguments(ARG "" "" "LINK" ${ARGN})
  add_library(${name} OBJECT ${ARG_UNPARSED_ARGUMENTS})
  target_link_libraries(${name} PUBLIC onramp_options ${ARG_LINK})
endfunction()

# onramp_test(NAME SOURCES… [LINK libraries…]): a GoogleTest program, run by ctest as one test.
function(onramp_test name)
  if(NOT ONRAMP_TESTS)
    return()
  endif()
  cmake_parse_arguments(ARG "" "" "LINK" ${ARGN})
  add_executable(${name} ${ARG_UNPARSED_ARGUMENTS})
  target_link_libraries(${name} PRIVATE onramp_options ${ARG_LINK} GTest::gmock GTest::gtest_main)
  add_test(NAME ${name} COMMAND ${name})
  set_tests_properties(${name} PROPERTIES TIMEOUT 300)
endfunction()

# onramp_namespace_test(NAME …): as onramp_test, but as root of a network namespace of its own; skipped
# where there can be none. What ctest runs a test through, CMake calls an emulator. The test finds
# its scripts in SOURCE_FOLDER.
function(onramp_namespace_test name)
  onramp_test(${name} ${ARGN})
  if(TARGET ${name})
    set_target_properties(${name} PROPERTIES
      CROSSCOMPILING_EMULATOR ${PROJECT_SOURCE_DIR}/tests/in_namespace)
    set_tests_properties(${name} PROPERTIES SKIP_RETURN_CODE 77)
    target_compile_definitions(${name} PRIVATE SOURCE_FOLDER="${CMAKE_CURRENT_SOURCE_DIR}")
  endif()
endfunction()

# onramp_fuzz(NAME SOURCES… [CORPUS folder] [LINK libraries…]): a libFuzzer program. ctest gives it a
# short run that starts from the folder corpus/NAME, or another one there, beside its source; finds go
# to the build folder.
function(onramp_fuzz name)
  if(NOT ONRAMP_FUZZ)
    return()
  endif()
  cmake_parse_arguments(ARG "" "CORPUS" "LINK" ${ARGN})
  if(NOT ARG_CORPUS)
    set(ARG_CORPUS ${name})
  endif()
  add_executable(${name} ${ARG_UNPARSED_ARGUMENTS})
  target_link_libraries(${name} PRIVATE onramp_options ${ARG_LINK})
  target_link_options(${name} PRIVATE -fsanitize=fuzzer)
  file(MAKE_DIRECTORY ${CMAKE_CURRENT_BINARY_DIR}/${name}-found)
  add_test(NAME ${name}
    COMMAND ${name} -runs=100000 -max_total_time=20 -timeout=5 -print_final_stats=1
      -artifact_prefix=${CMAKE_CURRENT_BINARY_DIR}/${name}-found/
      ${CMAKE_CURRENT_BINARY_DIR}/${name}-found ${CMAKE_CURRENT_SOURCE_DIR}/corpus/${ARG_CORPUS})
  set_tests_properties(${name} PROPERTIES TIMEOUT 120)
endfunction()
