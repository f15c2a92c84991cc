# The target `medium` assembles a medium in the folder ONRAMP_MEDIUM: the files of the example medium and
# the application's bundle. An installation has a copy of the example medium, and the last lines of this
# file install the bundle on that copy.

set(ONRAMP_MEDIUM ${PROJECT_BINARY_DIR}/medium CACHE PATH "Where the runnable medium is assembled")
set(onramp_contents "${ONRAMP_MEDIUM}/Onramp OSX.app/Contents")

set_target_properties(onramp PROPERTIES
  OUTPUT_NAME "Onramp OSX"
  RUNTIME_OUTPUT_DIRECTORY "${onramp_contents}/Linux")
file(GLOB onramp_languages CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/*.lproj)
file(GLOB onramp_pictures CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/*.png)
file(GLOB onramp_interfaces CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/${ONRAMP_UI}/*.*)

set(copy_languages)
foreach(folder IN LISTS onramp_languages)
  get_filename_component(language ${folder} NAME)
  list(APPEND copy_languages COMMAND ${CMAKE_COMMAND} -E copy_directory ${folder}
    ${onramp_contents}/Resources/${language})
endforeach()

# The old folders are removed first, because they may have files that the example medium no longer
# has.
add_custom_target(medium ALL
  COMMAND ${CMAKE_COMMAND} -E rm -rf ${ONRAMP_MEDIUM}/MacResources ${ONRAMP_MEDIUM}/Packages
    ${ONRAMP_MEDIUM}/Utilities ${onramp_contents}/Resources
  COMMAND ${CMAKE_COMMAND} -E copy_directory ${PROJECT_SOURCE_DIR}/examples/medium ${ONRAMP_MEDIUM}
  COMMAND ${CMAKE_COMMAND} -E make_directory ${onramp_contents}/Resources
  COMMAND ${CMAKE_COMMAND} -E copy ${PROJECT_BINARY_DIR}/Info.plist ${onramp_contents}/Info.plist
  COMMAND ${CMAKE_COMMAND} -E copy ${onramp_interfaces}
    ${onramp_pictures}
    ${PROJECT_SOURCE_DIR}/resources/SupportedKOL.plist ${onramp_contents}/Resources
  ${copy_languages}
  DEPENDS onramp
  COMMENT "Assembling the medium"
  VERBATIM)

set(onramp_installed "${CMAKE_INSTALL_LIBDIR}/onramp/medium/Onramp OSX.app/Contents")
install(TARGETS onramp DESTINATION "${onramp_installed}/Linux")
install(FILES ${PROJECT_BINARY_DIR}/Info.plist DESTINATION "${onramp_installed}")
install(FILES ${onramp_interfaces} ${onramp_pictures} ${PROJECT_SOURCE_DIR}/resources/SupportedKOL.plist
  DESTINATION "${onramp_installed}/Resources")
install(DIRECTORY ${onramp_languages} DESTINATION "${onramp_installed}/Resources")
