# Compiler options for all targets, and functions that add libraries, backends and tests.

add_library(onramp_options INTERFACE)
target_include_directories(onramp_options INTERFACE ${PROJECT_SOURCE_DIR})
target_compile_options(onramp_options INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror
  # GCC 12 wrongly warns that string concatenation in the standard library copies overlapping
  # memory.
  $<$<COMPILE_LANG_AND_ID:CXX,GNU>:-Wno-restrict>
  # macOS deprecates its C functions for network services and for the system's version, but offers
  # no others in C.
  $<$<PLATFORM_ID:Darwin>:-Wno-deprecated-declarations>)

# These options are global, so that all code is instrumented, including third-party headers.
if(ONRAMP_SANITIZE)
  add_compile_options(-fsanitize=${ONRAMP_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer)
  add_link_options(-fsanitize=${ONRAMP_SANITIZE})
endif()
if(ONRAMP_FUZZ)
  add_compile_options(-fsanitize=fuzzer-no-link)
  add_custom_target(fuzzers)
endif()

# onramp_library(NAME SOURCES… [LINK libraries…]) adds a static library for a room. A room is a source
# folder with one task. Only the linter's unity build joins the library's files. If other builds joined
# them, a program would need backends for files that it does not use.
function(onramp_library name)
  cmake_parse_arguments(ARG "" "" "LINK" ${ARGN})
  add_library(${name} STATIC ${ARG_UNPARSED_ARGUMENTS})
  if(NOT ONRAMP_LINT)
    set_target_properties(${name} PROPERTIES UNITY_BUILD OFF)
  endif()
  target_link_libraries(${name} PUBLIC onramp_options ${ARG_LINK})
endfunction()

# onramp_backend(NAME SOURCES… [LINK libraries…]) adds a backend, which implements headers of
# platform/. On the linker's command line, a backend comes before the libraries that use it. The linker
# would skip the files of a static library there, because nothing needs them yet. So a backend is an
# object library.
function(onramp_backend name)
  cmake_parse_arguments(ARG "" "" "LINK" ${ARGN})
  add_library(${name} OBJECT ${ARG_UNPARSED_ARGUMENTS})
  target_link_libraries(${name} PUBLIC onramp_options ${ARG_LINK})
endfunction()

# onramp_test(NAME SOURCES… [LINK libraries…]) adds a GoogleTest program. ctest runs it as one test.
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

# onramp_namespace_test(NAME …) is like onramp_test, but the test runs as root in a new network
# namespace. If no namespace can be created, the test is skipped. The emulator property makes ctest
# start the test with tests/in_namespace.
function(onramp_namespace_test name)
  onramp_test(${name} ${ARGN})
  if(TARGET ${name})
    set_target_properties(${name} PROPERTIES
      CROSSCOMPILING_EMULATOR ${PROJECT_SOURCE_DIR}/tests/in_namespace)
    set_tests_properties(${name} PROPERTIES SKIP_RETURN_CODE 77 LABELS network)
  endif()
endfunction()

# onramp_fuzz(NAME SOURCES… [CORPUS folder] [LINK libraries…]) adds a libFuzzer program. ctest runs
# the program briefly. Its seeds are in the folder corpus/CORPUS beside its source. CORPUS is NAME by
# default. New inputs are stored in the build folder.
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
  add_dependencies(fuzzers ${name})
  file(MAKE_DIRECTORY ${CMAKE_CURRENT_BINARY_DIR}/${name}-found)
  add_test(NAME ${name}
    COMMAND ${name} -runs=100000 -max_total_time=20 -timeout=5 -print_final_stats=1
      -artifact_prefix=${CMAKE_CURRENT_BINARY_DIR}/${name}-found/
      ${CMAKE_CURRENT_BINARY_DIR}/${name}-found ${CMAKE_CURRENT_SOURCE_DIR}/corpus/${ARG_CORPUS})
  set_tests_properties(${name} PROPERTIES TIMEOUT 120)
endfunction()
