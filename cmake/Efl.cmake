# EFL by pkg-config, and its theme compiler as a build step.
pkg_check_modules(ELEMENTARY REQUIRED IMPORTED_TARGET elementary)
pkg_check_modules(ELDBUS REQUIRED IMPORTED_TARGET eldbus)
pkg_check_modules(ECORE REQUIRED IMPORTED_TARGET ecore)
pkg_check_modules(EFREET REQUIRED IMPORTED_TARGET efreet)
find_program(EDJE_CC edje_cc REQUIRED)

# add_edje(<target> OUTPUT <file.edj> SOURCE <main.edc> [IMAGES <dir>] [DEPENDS <file>...])
# Compiles a theme file as part of the default build.
function(add_edje target)
  cmake_parse_arguments(ARG "" "OUTPUT;SOURCE;IMAGES" "DEPENDS" ${ARGN})
  get_filename_component(directory "${ARG_OUTPUT}" DIRECTORY)
  get_filename_component(include "${ARG_SOURCE}" DIRECTORY)
  set(images)
  if(ARG_IMAGES)
    set(images -id "${ARG_IMAGES}")
  endif()
  add_custom_command(
    OUTPUT "${ARG_OUTPUT}"
    COMMAND "${CMAKE_COMMAND}" -E make_directory "${directory}"
    COMMAND "${EDJE_CC}" ${images} -id "${include}" "${ARG_SOURCE}" "${ARG_OUTPUT}"
    DEPENDS "${ARG_SOURCE}" ${ARG_DEPENDS}
    COMMENT "Compiling theme ${target}" VERBATIM)
  add_custom_target(${target} ALL DEPENDS "${ARG_OUTPUT}")
endfunction()
