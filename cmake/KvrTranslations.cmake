# The texts in the sources are American English. A module has a Japanese file with all of them, and a British one with
# those that differ, if any do; what a file lacks stays as it is in the sources.
set(KVR_TRANSLATIONS_DIR ${CMAKE_BINARY_DIR}/bin/translations)
# TQL_TEXT marks texts where Qt is not known.
set(KVR_LUPDATE_OPTIONS -silent -locations none -extensions cpp,h,inc,ui -tr-function-alias QT_TRANSLATE_NOOP+=TQL_TEXT
                        -I ${KVR_SRC})

# kvr_translations(<target> <module> <file>.ts...): builds the *.qm files of a module with its target, named
# <module>_<language>.qm as the language library looks for them, into the translations folder beside the programs.
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
    set_property(TARGET ${target} APPEND PROPERTY KVR_TRANSLATIONS ${ts})
  endforeach()
  add_custom_target(${target}_translations DEPENDS ${files})
  add_dependencies(${target} ${target}_translations)
  set_property(GLOBAL APPEND PROPERTY KVR_TRANSLATED ${target})
endfunction()

# The folders whose sources make a target, those of its static libraries included that have no translations themselves.
# The texts of a library that several modules link are one module's, which the library names as KVR_TRANSLATED_BY.
function(kvr_source_folders target result)
  set(folders)
  get_target_property(base ${target} SOURCE_DIR)
  get_target_property(sources ${target} SOURCES)
  get_target_property(libraries ${target} LINK_LIBRARIES)
  foreach(source IN LISTS sources)
    cmake_path(ABSOLUTE_PATH source BASE_DIRECTORY ${base} NORMALIZE)
    cmake_path(GET source PARENT_PATH folder)
    cmake_path(IS_PREFIX KVR_SRC ${folder} isRoom)
    if(isRoom)
      list(APPEND folders ${folder})
    endif()
  endforeach()
  foreach(library IN LISTS libraries)
    if(TARGET ${library})
      get_target_property(type ${library} TYPE)
      get_target_property(own ${library} KVR_TRANSLATIONS)
      get_target_property(elsewhere ${library} KVR_TRANSLATED_BY)
      if(elsewhere STREQUAL module)
        set(elsewhere FALSE)
      endif()
      if(type STREQUAL STATIC_LIBRARY AND NOT own AND NOT elsewhere)
        kvr_source_folders(${library} more)
        list(APPEND folders ${more})
      elseif(type STREQUAL INTERFACE_LIBRARY)
        get_target_property(folder ${library} SOURCE_DIR)
        list(APPEND folders ${folder})
      endif()
    endif()
  endforeach()
  list(REMOVE_DUPLICATES folders)
  set(${result} ${folders} PARENT_SCOPE)
endfunction()

# `update_translations` refreshes the Japanese files: new texts come in as unfinished, texts that are gone go. The list
# of what belongs together, a line a module, is for the test that they are complete.
function(kvr_update_translations)
  get_property(targets GLOBAL PROPERTY KVR_TRANSLATED)
  foreach(target IN LISTS targets)
    set(module ${target})
    kvr_source_folders(${target} folders)
    get_target_property(files ${target} KVR_TRANSLATIONS)
    string(APPEND modules "${target}|${files}|${folders}\n")
    list(FILTER files INCLUDE REGEX "_ja\\.ts$")
    list(APPEND commands COMMAND Qt6::lupdate ${KVR_LUPDATE_OPTIONS} -no-obsolete
      ${folders} -ts ${files})
  endforeach()
  add_custom_target(update_translations ${commands} VERBATIM)
  file(CONFIGURE OUTPUT ${CMAKE_BINARY_DIR}/translations.txt CONTENT "${modules}" @ONLY)
endfunction()
cmake_language(DEFER DIRECTORY ${PROJECT_SOURCE_DIR} CALL kvr_update_translations)
