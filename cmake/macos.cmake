# Builds the application for macOS. The target `medium` assembles a medium, with the application on it,
# in the folder ONRAMP_MEDIUM. The target `dmg` makes a disc image of that medium.

set(ONRAMP_MEDIUM ${PROJECT_BINARY_DIR}/medium CACHE PATH "Where the runnable medium is assembled")
set(onramp_application "${ONRAMP_MEDIUM}/Onramp OSX.app")

set_target_properties(onramp PROPERTIES
  OUTPUT_NAME "Onramp OSX"
  MACOSX_BUNDLE ON
  MACOSX_BUNDLE_INFO_PLIST ${PROJECT_BINARY_DIR}/Info.plist
  RUNTIME_OUTPUT_DIRECTORY ${ONRAMP_MEDIUM})

# onramp_resource(FILE [FOLDER]) puts FILE into the folder Resources of the application's bundle, or
# into Resources/FOLDER.
function(onramp_resource file)
  target_sources(onramp PRIVATE ${file})
  set_source_files_properties(${file} PROPERTIES MACOSX_PACKAGE_LOCATION "Resources/${ARGV1}")
endfunction()

onramp_resource(${PROJECT_SOURCE_DIR}/resources/Background.png)
onramp_resource(${PROJECT_SOURCE_DIR}/resources/Background@2x.png)
onramp_resource(${PROJECT_SOURCE_DIR}/resources/Onramp.icns)
onramp_resource(${PROJECT_SOURCE_DIR}/resources/SupportedKOL.plist)
file(GLOB tables CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/*.lproj/*.strings)
foreach(table IN LISTS tables)
  get_filename_component(folder ${table} DIRECTORY)
  get_filename_component(language ${folder} NAME)
  onramp_resource(${table} ${language})
endforeach()

file(GLOB interfaces CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/resources/cocoa/*.xib)
foreach(interface IN LISTS interfaces)
  get_filename_component(name ${interface} NAME_WE)
  set(compiled ${PROJECT_BINARY_DIR}/interfaces/${name}.nib)
  add_custom_command(OUTPUT ${compiled}
    COMMAND ${CMAKE_COMMAND} -E make_directory ${PROJECT_BINARY_DIR}/interfaces
    COMMAND xcrun ibtool --errors --warnings --notices --output-format human-readable-text
      --minimum-deployment-target ${CMAKE_OSX_DEPLOYMENT_TARGET} --compile ${compiled} ${interface}
    DEPENDS ${interface}
    COMMENT "Compiling ${name}.xib"
    VERBATIM)
  onramp_resource(${compiled})
endforeach()

# The old folders are removed first, because they may have files that the example medium no longer
# has. The bundle is signed last, because a later change would make the signature invalid.
add_custom_target(medium ALL
  COMMAND ${CMAKE_COMMAND} -E rm -rf ${ONRAMP_MEDIUM}/MacResources ${ONRAMP_MEDIUM}/Packages
    ${ONRAMP_MEDIUM}/Utilities
  COMMAND ${CMAKE_COMMAND} -E copy_directory ${PROJECT_SOURCE_DIR}/examples/medium ${ONRAMP_MEDIUM}
  COMMAND codesign --force --sign - --timestamp=none ${onramp_application}
  DEPENDS onramp
  COMMENT "Assembling the medium"
  VERBATIM)

add_custom_target(dmg
  COMMAND hdiutil create -ov -volname Onramp -fs HFS+ -format UDZO -srcfolder ${ONRAMP_MEDIUM}
    ${PROJECT_BINARY_DIR}/Onramp.dmg
  DEPENDS medium
  COMMENT "Making the disc image"
  VERBATIM)
