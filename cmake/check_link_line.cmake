# Fails when the link command in LINK_FILE names Qt Xml or Core5Compat: a
# program that uses only the core library must not be linked with them.
if(NOT EXISTS "${LINK_FILE}")
  message(FATAL_ERROR "no link command at ${LINK_FILE}")
endif()
file(READ "${LINK_FILE}" line)
if(NOT line MATCHES "libzel\\.so")
  message(FATAL_ERROR "the link command does not link libzel: ${line}")
endif()
if(line MATCHES "Qt[56]?Xml|Qt6Core5Compat")
  message(FATAL_ERROR "the link command names Qt Xml or Core5Compat: ${line}")
endif()
message(STATUS "link line names libzel and Qt Core only")
