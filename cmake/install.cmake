# Installs the application, the command-line tools, an example medium and the documents. cpack puts
# these files into a Debian package and into the media kit, a tarball whose programs run without
# installation.
#
# LIBDIR/onramp holds the scripts from tools/, and the example medium with the application on it. Each
# command in BINDIR is a program or a link to one of these scripts.

set(ONRAMP_ZSH_COMPLETIONS ${CMAKE_INSTALL_DATADIR}/zsh/site-functions CACHE STRING
  "Where zsh looks for completions; on Debian it is share/zsh/vendor-completions for packages")
set(ONRAMP_PACKAGER "The Onramp developers <developers@onramp.example>" CACHE STRING
  "The Debian package's maintainer: a name, and an address that receives mail")
find_program(ONRAMP_GZIP gzip REQUIRED)

set(home ${CMAKE_INSTALL_LIBDIR}/onramp)
set(documents ${CMAKE_INSTALL_DATAROOTDIR}/doc/onramp)
set(packaging ${PROJECT_SOURCE_DIR}/packaging)
set(generated ${PROJECT_BINARY_DIR}/packaging)
file(MAKE_DIRECTORY ${generated})

# install_compressed(FILE FOLDER) compresses FILE and installs the result, whose name ends in ".gz",
# in FOLDER. The result depends only on the contents of FILE.
function(install_compressed file folder)
  get_filename_component(name ${file} NAME)
  set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${file})
  execute_process(COMMAND ${ONRAMP_GZIP} -9nc ${file} OUTPUT_FILE ${generated}/${name}.gz
    COMMAND_ERROR_IS_FATAL ANY)
  install(FILES ${generated}/${name}.gz DESTINATION ${folder})
endfunction()

install(TARGETS onramp-check onramp-devices DESTINATION ${CMAKE_INSTALL_BINDIR})
foreach(command IN ITEMS onramp-preview practice-network)
  file(RELATIVE_PATH target /prefix/${CMAKE_INSTALL_BINDIR} /prefix/${home}/tools/${command})
  file(CREATE_LINK ${target} ${generated}/${command} SYMBOLIC)
  install(FILES ${generated}/${command} DESTINATION ${CMAKE_INSTALL_BINDIR})
  install(PROGRAMS ${PROJECT_SOURCE_DIR}/tools/${command} DESTINATION ${home}/tools)
  install_compressed(${packaging}/${command}.1 ${CMAKE_INSTALL_MANDIR}/man1)
endforeach()
install(PROGRAMS ${PROJECT_SOURCE_DIR}/tools/tour DESTINATION ${home}/tools)
foreach(modules IN ITEMS onscreen practice_network tours)
  install(DIRECTORY ${PROJECT_SOURCE_DIR}/tools/${modules} DESTINATION ${home}/tools
    FILES_MATCHING PATTERN "*.py" PATTERN __pycache__ EXCLUDE)
endforeach()
install(DIRECTORY ${PROJECT_SOURCE_DIR}/examples/medium DESTINATION ${home} USE_SOURCE_PERMISSIONS)
install(FILES ${PROJECT_SOURCE_DIR}/examples/practice-network.toml DESTINATION ${home}/examples)
# The practice network reads the maker's settings, so that its devices answer as the maker's devices do.
install(FILES ${ONRAMP_MAKER} RENAME maker.json DESTINATION ${home})

foreach(tool IN ITEMS check devices)
  install_compressed(${PROJECT_SOURCE_DIR}/tools/${tool}/onramp-${tool}.1 ${CMAKE_INSTALL_MANDIR}/man1)
endforeach()
foreach(tool IN ITEMS check devices preview)
  install(FILES ${PROJECT_SOURCE_DIR}/tools/completions/onramp-${tool}.bash RENAME onramp-${tool}
    DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
  install(FILES ${PROJECT_SOURCE_DIR}/tools/completions/_onramp-${tool} DESTINATION ${ONRAMP_ZSH_COMPLETIONS})
endforeach()

install(FILES ${packaging}/onramp.desktop DESTINATION ${CMAKE_INSTALL_DATADIR}/applications)
install(FILES ${PROJECT_SOURCE_DIR}/resources/Onramp.png RENAME onramp.png
  DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/128x128/apps)
install(FILES ${PROJECT_SOURCE_DIR}/resources/art/icon.svg RENAME onramp.svg
  DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps)

# string(TIMESTAMP) uses the time in the environment variable SOURCE_DATE_EPOCH if it is set.
string(TIMESTAMP day "%Y-%m-%d" UTC)
string(TIMESTAMP moment "%a, %d %b %Y %H:%M:%S +0000" UTC)
configure_file(${packaging}/onramp.metainfo.xml.in ${generated}/example.onramp.preview.metainfo.xml @ONLY)
configure_file(${packaging}/changelog.in ${generated}/changelog @ONLY)
install(FILES ${generated}/example.onramp.preview.metainfo.xml DESTINATION ${CMAKE_INSTALL_DATADIR}/metainfo)
install_compressed(${generated}/changelog ${documents})
install(FILES ${packaging}/copyright DESTINATION ${documents})
# The documents keep their relative paths, because they link to each other.
foreach(document IN ITEMS README.md ARCHITECTURE.md CONTRIBUTING.md RELIABILITY.md SECURITY.md docs/first-mac.md
    docs/mastering-a-medium.md docs/texts-and-languages.md docs/support.md docs/wizard.png packaging/media-kit.md)
  cmake_path(GET document PARENT_PATH folder)
  install(FILES ${PROJECT_SOURCE_DIR}/${document} DESTINATION ${documents}/${folder})
endforeach()

set(CPACK_GENERATOR DEB TGZ)
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
set(CPACK_PACKAGE_NAME onramp)
set(CPACK_PACKAGE_VENDOR "The Onramp developers")
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "set-up wizard for a maker's installation medium")
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR}/packages)
set(CPACK_PACKAGE_CHECKSUM SHA256)
set(CPACK_PROJECT_CONFIG_FILE ${PROJECT_SOURCE_DIR}/cmake/cpack.cmake)
set(CPACK_ONRAMP_KIT onramp-media-kit-${PROJECT_VERSION}-linux-${CMAKE_SYSTEM_PROCESSOR})
set(CPACK_ONRAMP_KIT_README ${generated}/kit)
configure_file(${packaging}/media-kit.md ${CPACK_ONRAMP_KIT_README}/README.md COPYONLY)

set(CPACK_PACKAGING_INSTALL_PREFIX /usr)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION utils)
set(CPACK_DEBIAN_PACKAGE_MAINTAINER ${ONRAMP_PACKAGER})
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_PACKAGE_DEPENDS "python3:any (>= 3.11), xdg-utils")
set(CPACK_DEBIAN_PACKAGE_RECOMMENDS avahi-daemon)
# Only the practice network and the tour need these packages.
set(CPACK_DEBIAN_PACKAGE_SUGGESTS "at-spi2-core, dbus, gir1.2-atspi-2.0, imagemagick, iproute2, openbox, python3-dbus, python3-gi, snmpd, x11-utils, xdotool, xvfb")
set(CPACK_PACKAGE_DESCRIPTION "A maker of printers and scanners puts the wizard Onramp on its installation
medium. The wizard lets a user choose the model, the connection and, on a
wireless network, the device. Then it opens the maker's package.

This package holds the wizard for Linux, which shows a medium as its users will
see it, an example medium, and commands that check a medium (onramp-check),
preview it (onramp-preview) and explain why the wizard does or does not list a
device (onramp-devices).")
include(CPack)
