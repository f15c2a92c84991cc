# Reads the maker's settings from the JSON file ONRAMP_MAKER, checks their form, and generates
# base/maker.h and Info.plist from them.

set(ONRAMP_MAKER ${PROJECT_SOURCE_DIR}/maker.json CACHE FILEPATH "The file with the maker's settings")
if(NOT EXISTS ${ONRAMP_MAKER})
  message(FATAL_ERROR "${ONRAMP_MAKER} does not exist. Set ONRAMP_MAKER to the absolute path of a copy "
    "of ${PROJECT_SOURCE_DIR}/maker.json with your settings.")
endif()
set_property(DIRECTORY APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${ONRAMP_MAKER})
file(READ ${ONRAMP_MAKER} onramp_maker)

# onramp_maker_check(KEY VALUE FORM EXAMPLE) stops the configuration with a message if VALUE, the
# value of KEY, does not match the regular expression FORM. The message shows EXAMPLE.
function(onramp_maker_check key value form example)
  if(NOT value MATCHES "${form}")
    message(FATAL_ERROR "${ONRAMP_MAKER}: \"${key}\" is missing or malformed. It must look like ${example}.")
  endif()
endfunction()

# onramp_maker_setting(VARIABLE KEY FORM EXAMPLE) sets VARIABLE to the value of KEY, and checks the
# value with onramp_maker_check().
function(onramp_maker_setting variable key form example)
  string(JSON value ERROR_VARIABLE problem GET "${onramp_maker}" ${key})
  if(problem)
    set(value "")
  endif()
  onramp_maker_check(${key} "${value}" "${form}" "${example}")
  set(${variable} "${value}" PARENT_SCOPE)
endfunction()

string(JSON onramp_kind ERROR_VARIABLE problem TYPE "${onramp_maker}")
if(NOT onramp_kind STREQUAL "OBJECT")
  message(FATAL_ERROR "${ONRAMP_MAKER} is not a JSON object (${problem}). Correct it; "
    "${PROJECT_SOURCE_DIR}/maker.json shows the form.")
endif()

# The settings are inserted into C++ string literals and XML. So no string may contain quotation
# marks, backslashes, angle brackets or line breaks.
set(plain "^[^\"\\<>\n\r]+$")
onramp_maker_setting(ONRAMP_MAKER_NAME name "${plain}" "\"Kestrel Imaging\"")
onramp_maker_setting(ONRAMP_BUNDLE_NAME bundleName "${plain}" "\"Onramp OSX\"")
onramp_maker_setting(ONRAMP_BUNDLE_IDENTIFIER bundleIdentifier "^[A-Za-z0-9-]+(\\.[A-Za-z0-9-]+)+$"
  "\"com.kestrelimaging.onramp\"")
onramp_maker_setting(ONRAMP_SUPPORT_SITE supportSite "^https?://[A-Za-z0-9.:-]+(/[A-Za-z0-9._~/-]*[A-Za-z0-9._~-])?$"
  "\"http://support.kestrel.example\", without a trailing slash")
onramp_maker_setting(ONRAMP_SNMP_COMMUNITY snmpCommunity "^[A-Za-z0-9._-]+$" "\"corridor\"")
onramp_maker_setting(ONRAMP_ACTIVE_IF_OBJECT activeIFObject "^[012](\\.(0|[1-9][0-9]?[0-9]?[0-9]?[0-9]?))+$"
  "\"1.3.6.1.4.1.4242.2.4.4.1240.1.2.0\", with numbers up to 65535")
onramp_maker_setting(ONRAMP_ACTIVE_IF_WIRELESS activeIFWireless "^-?(0|[1-9][0-9]?[0-9]?[0-9]?)$" "2, a number of up to 4 digits")
string(REPLACE "." ";" numbers ${ONRAMP_ACTIVE_IF_OBJECT})
foreach(number IN LISTS numbers)
  if(number GREATER 65535)
    message(FATAL_ERROR "${ONRAMP_MAKER}: \"activeIFObject\" has the number ${number}; the greatest is 65535.")
  endif()
endforeach()
list(LENGTH numbers length)
if(length LESS 3 OR length GREATER 64)
  message(FATAL_ERROR "${ONRAMP_MAKER}: \"activeIFObject\" has ${length} numbers; it may have 3 to 64.")
endif()
string(REPLACE "." ", " ONRAMP_ACTIVE_IF_NUMBERS ${ONRAMP_ACTIVE_IF_OBJECT})

onramp_maker_setting(ONRAMP_SERVICE_TYPES serviceTypes "^\\[" "[\"_ipp._tcp\", \"_scanner._tcp\"]")
string(JSON count LENGTH "${onramp_maker}" serviceTypes)
set(ONRAMP_SERVICE_TYPES)
set(ONRAMP_SERVICE_TYPES_XML)
if(count GREATER 0)
  math(EXPR last "${count} - 1")
  foreach(index RANGE ${last})
    string(JSON type GET "${onramp_maker}" serviceTypes ${index})
    onramp_maker_check(serviceTypes "${type}" "^_[A-Za-z0-9-]+\\._(tcp|udp)$" "[\"_ipp._tcp\", \"_scanner._tcp\"]")
    string(APPEND ONRAMP_SERVICE_TYPES " ${type}")
    string(APPEND ONRAMP_SERVICE_TYPES_XML "\n    <string>${type}</string>")
  endforeach()
endif()

configure_file(${PROJECT_SOURCE_DIR}/base/maker.h.in ${PROJECT_BINARY_DIR}/generated/base/maker.h @ONLY)
target_include_directories(onramp_options INTERFACE ${PROJECT_BINARY_DIR}/generated)

foreach(text IN ITEMS ONRAMP_MAKER_NAME ONRAMP_BUNDLE_NAME)
  string(REPLACE "&" "&amp;" ${text} "${${text}}")
endforeach()
configure_file(${PROJECT_SOURCE_DIR}/resources/Info.plist.in ${PROJECT_BINARY_DIR}/Info.plist @ONLY)
