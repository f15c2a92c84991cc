# Finds GNUstep, which replaces Cocoa on Linux, and defines the target GNUstep::AppKit. Compiles
# Objective-C++ with clang, because Debian's g++ 12 rejects `for (x in y)`.

find_program(ONRAMP_GNUSTEP_CONFIG gnustep-config REQUIRED)
find_program(CMAKE_OBJCXX_COMPILER NAMES clang++ clang++-14 REQUIRED)
enable_language(OBJCXX)
set(CMAKE_OBJCXX_STANDARD 20)
set(CMAKE_OBJCXX_STANDARD_REQUIRED ON)
set(CMAKE_OBJCXX_EXTENSIONS OFF)

# gnustep_flags(VARIABLE KIND) sets VARIABLE to the list of flags that gnustep-config prints for the
# option KIND, adapted to this build.
function(gnustep_flags variable kind)
  execute_process(COMMAND ${ONRAMP_GNUSTEP_CONFIG} ${kind} OUTPUT_VARIABLE flags
    OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
  separate_arguments(flags NATIVE_COMMAND "${flags}")
  # Remove flags that the build sets itself or does not want. With -isystem, the compiler does not
  # warn about GNUstep's headers.
  list(FILTER flags EXCLUDE REGEX "^(-M.*|-Wall|-Wno-import|-g|-O2|-shared-libgcc|-I\\.)$")
  list(TRANSFORM flags REPLACE "^-I" "-isystem")
  set(${variable} ${flags} PARENT_SCOPE)
endfunction()

gnustep_flags(compile_flags --objc-flags)
gnustep_flags(link_flags --gui-libs)
# The headers of the Objective-C runtime are in gcc's private folder.
execute_process(COMMAND gcc -print-file-name=include OUTPUT_VARIABLE gcc_include
  OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)

add_library(GNUstep::AppKit INTERFACE IMPORTED)
target_compile_options(GNUstep::AppKit INTERFACE
  $<$<COMPILE_LANGUAGE:OBJCXX>:${compile_flags} -fobjc-runtime=gcc -idirafter${gcc_include}>
  # This header declares methods that GNUstep's headers lack.
  "$<$<COMPILE_LANGUAGE:OBJCXX>:SHELL:-include ${PROJECT_SOURCE_DIR}/platform/cocoa/gnustep/appkit_additions.h>")
target_link_libraries(GNUstep::AppKit INTERFACE ${link_flags})
