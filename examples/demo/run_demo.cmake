# Runs the demo and checks its exit status and output (a test of ctest).
#   DEMO           the demo program
#   ARGS           its arguments, separated by '|'
#   EXPECT_STATUS  the exit status it must end with
#   EXPECT_STDOUT  a regular expression its standard output must match
#   EXPECT_STDERR  a regular expression its standard error must match
string(REPLACE "|" ";" args "${ARGS}")
execute_process(COMMAND "${DEMO}" ${args}
  RESULT_VARIABLE status OUTPUT_VARIABLE stdout ERROR_VARIABLE stderr)
set(problems "")
if(NOT "${status}" STREQUAL "${EXPECT_STATUS}")
  string(APPEND problems "exit status ${status}, expected ${EXPECT_STATUS}\n")
endif()
if(NOT "${stdout}" MATCHES "${EXPECT_STDOUT}")
  string(APPEND problems "standard output does not match: ${EXPECT_STDOUT}\n")
endif()
if(NOT "${stderr}" MATCHES "${EXPECT_STDERR}")
  string(APPEND problems "standard error does not match: ${EXPECT_STDERR}\n")
endif()
if(problems)
  message(FATAL_ERROR "zel-demo ${ARGS}\n${problems}--- stdout:\n${stdout}--- stderr:\n${stderr}")
endif()
