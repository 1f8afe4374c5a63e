# EFL by pkg-config, and its theme compiler as a build step.
# Debian's files name include folders that no package ships; CMake refuses a target with such a folder.
function(find_efl_module prefix module)
  pkg_check_modules(${prefix} REQUIRED IMPORTED_TARGET GLOBAL ${module})
  get_target_property(folders PkgConfig::${prefix} INTERFACE_INCLUDE_DIRECTORIES)
  if(folders)
    set(existing)
    foreach(folder IN LISTS folders)
      if(EXISTS "${folder}")
        list(APPEND existing "${folder}")
      endif()
    endforeach()
    set_target_properties(PkgConfig::${prefix} PROPERTIES INTERFACE_INCLUDE_DIRECTORIES "${existing}")
  endif()
endfunction()

find_efl_module(ELEMENTARY elementary)
find_efl_module(ELDBUS eldbus)
find_efl_module(ECORE ecore)
find_efl_module(EFREET efreet)
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
