# kvr_translations(<target> <module> <file>.ts...): builds the *.qm files of a module with its target, named
# <module>_<language>.qm as the language library looks for them, into the translations folder beside the programs.
set(KVR_TRANSLATIONS_DIR ${CMAKE_BINARY_DIR}/bin/translations)

function(kvr_translations target module)
  foreach(ts IN LISTS ARGN)
    get_filename_component(ts ${ts} ABSOLUTE)
    get_filename_component(name ${ts} NAME_WE)
    if(NOT name MATCHES "^${module}_")
      message(FATAL_ERROR "${ts}: the translations of ${module} are named ${module}_<language>.ts")
    endif()
    set(qm ${KVR_TRANSLATIONS_DIR}/${name}.qm)
    add_custom_command(OUTPUT ${qm}
      COMMAND ${CMAKE_COMMAND} -E make_directory ${KVR_TRANSLATIONS_DIR}
      COMMAND Qt6::lrelease -silent ${ts} -qm ${qm}
      DEPENDS ${ts} VERBATIM)
    list(APPEND files ${qm})
  endforeach()
  add_custom_target(${target}_translations DEPENDS ${files})
  add_dependencies(${target} ${target}_translations)
endfunction()
