# The build tree stages what it makes as a device has it, and runs from there.
#   stage/opt/usr/apps/<id>/   the packages that every device has
#   stage/data/                the platform's own data: its theme and its texts
#   stage/examples/<id>/       packages to install by hand
set(STAGE_DIR "${CMAKE_BINARY_DIR}/stage")
set(STAGE_APPS_DIR "${STAGE_DIR}/opt/usr/apps")
set(STAGE_DATA_DIR "${STAGE_DIR}/data")
set(STAGE_EXAMPLES_DIR "${STAGE_DIR}/examples")

find_program(MSGFMT msgfmt REQUIRED)

# stage_tree(<target> FROM <dir> TO <dir> [EXCLUDE <regex>])
# Keeps TO a copy of the files in FROM; a file that is added, changed or removed is followed by the next build.
function(stage_tree target)
  cmake_parse_arguments(ARG "" "FROM;TO;EXCLUDE" "" ${ARGN})
  file(GLOB_RECURSE files CONFIGURE_DEPENDS RELATIVE "${ARG_FROM}" "${ARG_FROM}/*")
  if(ARG_EXCLUDE)
    list(FILTER files EXCLUDE REGEX "${ARG_EXCLUDE}")
  endif()
  set(outputs)
  foreach(file IN LISTS files)
    add_custom_command(
      OUTPUT "${ARG_TO}/${file}"
      COMMAND "${CMAKE_COMMAND}" -E copy "${ARG_FROM}/${file}" "${ARG_TO}/${file}"
      DEPENDS "${ARG_FROM}/${file}" VERBATIM)
    list(APPEND outputs "${ARG_TO}/${file}")
  endforeach()
  add_custom_target(${target} ALL DEPENDS ${outputs})
endfunction()

# stage_texts(<target> FROM <dir> TO <dir>)
# Compiles FROM/<language>/LC_MESSAGES/<domain>.po to TO/<language>/LC_MESSAGES/<domain>.mo. An unsafe format fails.
function(stage_texts target)
  cmake_parse_arguments(ARG "" "FROM;TO" "" ${ARGN})
  file(GLOB_RECURSE files CONFIGURE_DEPENDS RELATIVE "${ARG_FROM}" "${ARG_FROM}/*.po")
  set(outputs)
  foreach(file IN LISTS files)
    string(REGEX REPLACE "\\.po$" ".mo" compiled "${file}")
    get_filename_component(directory "${ARG_TO}/${compiled}" DIRECTORY)
    add_custom_command(
      OUTPUT "${ARG_TO}/${compiled}"
      COMMAND "${CMAKE_COMMAND}" -E make_directory "${directory}"
      COMMAND "${CMAKE_COMMAND}" -D "TEXTS=${ARG_FROM}/${file}" -D "MSGFMT=${MSGFMT}"
              -P "${CMAKE_CURRENT_FUNCTION_LIST_DIR}/CheckFormats.cmake"
      COMMAND "${MSGFMT}" --check -o "${ARG_TO}/${compiled}" "${ARG_FROM}/${file}"
      DEPENDS "${ARG_FROM}/${file}" VERBATIM)
    list(APPEND outputs "${ARG_TO}/${compiled}")
  endforeach()
  add_custom_target(${target} ALL DEPENDS ${outputs})
endfunction()
