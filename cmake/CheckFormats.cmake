# Refuses a translation that would not be safe as a printf format: cmake -D TEXTS=<file.po> -D MSGFMT=<msgfmt> -P.
# A message id is a name here, so msgfmt has no format to compare a translation with. Such a message carries the comment
# "#. Format: <an example of the format>"; the example takes the id's place in a copy, and msgfmt checks that.
file(READ "${TEXTS}" texts)
string(REGEX REPLACE "#\\. Format: ([^\n]*)\nmsgid \"[^\n]*\"" "#, c-format\nmsgid \"\\1\"" checked "${texts}")
if(checked STREQUAL texts)
  return()
endif()
string(RANDOM LENGTH 12 name)
set(copy "${CMAKE_CURRENT_BINARY_DIR}/${name}.po")
file(WRITE "${copy}" "${checked}")
execute_process(COMMAND "${MSGFMT}" --check-format -o /dev/null "${copy}" RESULT_VARIABLE status ERROR_VARIABLE errors)
file(REMOVE "${copy}")
if(NOT status EQUAL 0)
  string(REPLACE "${copy}" "${TEXTS}" errors "${errors}")
  message(NOTICE "${errors}")
  message(FATAL_ERROR "A translation is no safe format.")
endif()
