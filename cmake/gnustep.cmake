# GNUstep, which stands in for Cocoa where there is none: the target GNUstep::AppKit, and
# Objective-C++ by clang (Debian's g++ 12 does not know `for (x in y)` there).

find_program(ONRAMP_GNUSTEP_CONFIG gnustep-config REQUIRED)
find_program(CMAKE_OBJCXX_COMPILER NAMES clang++ clang++-14 REQUIRED)
enable_language(OBJCXX)
set(CMAKE_OBJCXX_STANDARD 20)
set(CMAKE_OBJCXX_STANDARD_REQUIRED ON)
set(CMAKE_OBJCXX_EXTENSIONS OFF)

function(gnustep_flags variable kind)
  execute_process(COMMAND ${ONRAMP_GNUSTEP_CONFIG} ${kind} OUTPUT_VARIABLE flags
    OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
  separate_arguments(flags NATIVE_COMMAND "${flags}")
  # What CMake decides itself, and headers that are not this project's to warn about.
  list(FILTER flags EXCLUDE REGEX "^(-M.*|-Wall|-Wno-import|-g|-O2|-shared-libgcc|-I\\.)$")
  list(TRANSFORM flags REPLACE "^-I" "-isystem")
  set(${variable} ${flags} PARENT_SCOPE)
endfunction()

gnustep_flags(compile_flags --objc-flags)
gnustep_flags(link_flags --gui-libs)
# gcc keeps the runtime's headers in a folder of its own.
execute_process(COMMAND gcc -print-file-name=include OUTPUT_VARIABLE gcc_include
  OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)

add_library(GNUstep::AppKit INTERFACE IMPORTED)
target_compile_options(GNUstep::AppKit INTERFACE
  $<$<COMPILE_LANGUAGE:OBJCXX>:${compile_flags} -fobjc-runtime=gcc -idirafter${gcc_include}>
  # Declares what GNUstep's own headers do not.
  "$<$<COMPILE_LANGUAGE:OBJCXX>:SHELL:-include ${PROJECT_SOURCE_DIR}/platform/cocoa/gnustep/appkit_additions.h>")
target_link_libraries(GNUstep::AppKit INTERFACE ${link_flags})
