# Sets ONRAMP_BACKENDS to the wizard's backends: the libraries that implement the headers of platform/.

if(APPLE)
  set(ONRAMP_UI cocoa)
  enable_language(OBJCXX)
  set(CMAKE_OBJCXX_STANDARD 20)
  set(CMAKE_OBJCXX_STANDARD_REQUIRED ON)
  set(CMAKE_OBJCXX_EXTENSIONS OFF)
  set(ONRAMP_BACKENDS onramp_cocoa onramp_cfnetwork onramp_coreservices onramp_systemconfiguration
    onramp_posix onramp_sockets)
else()
  set(ONRAMP_UI qt CACHE STRING "The front end: qt, or cocoa to try the front end for macOS on GNUstep")
  set_property(CACHE ONRAMP_UI PROPERTY STRINGS qt cocoa)
  if(ONRAMP_UI STREQUAL "qt")
    set(ONRAMP_BACKENDS onramp_qt onramp_avahi onramp_freedesktop onramp_xdg_open onramp_libplist onramp_standin
      onramp_posix onramp_sockets)
  elseif(ONRAMP_UI STREQUAL "cocoa")
    include(gnustep)
    set(ONRAMP_BACKENDS onramp_cocoa onramp_gnustep onramp_avahi onramp_standin onramp_posix onramp_sockets)
  else()
    message(FATAL_ERROR "ONRAMP_UI is \"${ONRAMP_UI}\"; set it to qt or cocoa")
  endif()
endif()
