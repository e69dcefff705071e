# What every target of the project shares: warnings, include roots; sanitizers come from the preset.

set(KVR_SRC ${PROJECT_SOURCE_DIR}/src)
find_program(KVR_CCACHE ccache)
if(KVR_CCACHE)
  set(CMAKE_CXX_COMPILER_LAUNCHER ${KVR_CCACHE})
endif()

# Lets whoever links the target include the headers of a room, a folder under src, as "room/header.h" - and, as each
# room has a root of its own, nothing else: an include of a room that is not linked does not compile.
function(kvr_room target room)
  string(REPLACE "/" "_" name ${room})
  set(root ${CMAKE_BINARY_DIR}/rooms/${name})
  cmake_path(GET room PARENT_PATH above)
  file(MAKE_DIRECTORY ${root}/${above})
  file(CREATE_LINK ${PROJECT_SOURCE_DIR}/src/${room} ${root}/${room} SYMBOLIC)
  get_target_property(type ${target} TYPE)
  if(type STREQUAL INTERFACE_LIBRARY)
    target_include_directories(${target} INTERFACE ${root})
  else()
    target_include_directories(${target} PUBLIC ${root})
  endif()
endfunction()

function(kvr_defaults target)
  cmake_path(IS_PREFIX KVR_SRC ${CMAKE_CURRENT_SOURCE_DIR} isRoom)
  if(isRoom)
    file(RELATIVE_PATH room ${KVR_SRC} ${CMAKE_CURRENT_SOURCE_DIR})
    kvr_room(${target} ${room})
  endif()
  target_compile_options(${target} PRIVATE -Wall -Wextra -Wshadow -Wnon-virtual-dtor -Woverloaded-virtual)
  if(KVR_WERROR)
    target_compile_options(${target} PRIVATE -Werror)
  endif()
endfunction()

# kvr_find_libraries(<target> [<folder>]): the shared libraries of the project that the target links stand in this folder, which
# is given from where the target's own file stands; without one they stand beside it.
function(kvr_find_libraries target)
  set(origin "$ORIGIN")
  if(APPLE)
    set(origin "@loader_path")
  endif()
  list(JOIN ARGN / folder)
  cmake_path(APPEND origin ${folder})
  set_target_properties(${target} PROPERTIES INSTALL_RPATH "${origin}")
endfunction()

# How the sources end that are for another platform.
set(KVR_FOREIGN windows)
if(WIN32)
  set(KVR_FOREIGN posix)
endif()

# A static library without Qt, of what stands in the room's folder; of what knows the platform that of the platform.
function(kvr_library name)
  file(GLOB sources CONFIGURE_DEPENDS *.cpp)
  list(FILTER sources EXCLUDE REGEX "_${KVR_FOREIGN}\\.cpp$|/main\\.cpp$") # main is a program's own
  add_library(${name} STATIC ${sources})
  kvr_defaults(${name})
endfunction()

# Qt's headers take longer to read than most sources to compile, so they are read once for every target: kvr_pch is for
# the product, kvr_test_pch for tests. A target that adds compile options of its own cannot share them.
function(kvr_shared_pch name)
  add_library(${name} OBJECT ${PROJECT_SOURCE_DIR}/cmake/pch.cpp)
  kvr_defaults(${name})
  target_link_libraries(${name} PRIVATE Qt6::Widgets)
  target_precompile_headers(${name} PRIVATE <QtWidgets> <memory> <string> <vector> ${ARGN})
endfunction()

# kvr_qt_library(<name> <kind> [<folder>...]): a library on Qt Widgets with meta-object code, dialog files and a
# precompiled header. What stands in its folders - by default in the room's own - is the library: no list names it again.
function(kvr_qt_library name kind)
  set(folders ${ARGN})
  if(NOT folders)
    set(folders .)
  endif()
  foreach(folder IN LISTS folders)
    if(NOT IS_DIRECTORY ${CMAKE_CURRENT_SOURCE_DIR}/${folder})
      message(FATAL_ERROR "${name}: ${folder} is no folder")
    endif()
  endforeach()
  list(TRANSFORM folders APPEND /*.cpp OUTPUT_VARIABLE sources)
  list(TRANSFORM folders APPEND /*.qrc OUTPUT_VARIABLE resources)
  file(GLOB sources CONFIGURE_DEPENDS ${sources} ${resources})
  list(FILTER sources EXCLUDE REGEX "_${KVR_FOREIGN}\\.cpp$|/main\\.cpp$") # main is a program's own
  add_library(${name} ${kind} ${sources})
  kvr_qt(${name})
endfunction()

# kvr_editor(<plugin> <core> LINK <library>... TRANSLATIONS <module> <file>.ts... [WITHOUT <source>...]): an editor in the
# room's folder. All but the exported functions (*exports.cpp) and the pictures is a library, so that tests can link it;
# the plug-in is these on top.
function(kvr_editor plugin core)
  cmake_parse_arguments(E "" "" "LINK;TRANSLATIONS;WITHOUT" ${ARGN})
  file(GLOB sources CONFIGURE_DEPENDS *.cpp)
  file(GLOB exported CONFIGURE_DEPENDS *exports.cpp *.qrc)
  list(TRANSFORM E_WITHOUT PREPEND ${CMAKE_CURRENT_SOURCE_DIR}/)
  list(REMOVE_ITEM sources ${exported} ${E_WITHOUT})
  add_library(${core} STATIC ${sources})
  kvr_qt(${core})
  target_link_libraries(${core} PUBLIC ${E_LINK})

  add_library(${plugin} MODULE ${exported})
  kvr_defaults(${plugin})
  target_link_libraries(${plugin} PRIVATE ${core})
  if(UNIX AND NOT APPLE)
    target_link_options(${plugin} PRIVATE -Wl,--exclude-libs,ALL -Wl,-z,defs)
  endif()
  set_target_properties(${plugin} PROPERTIES AUTORCC ON PREFIX ""
                        LIBRARY_OUTPUT_DIRECTORY ${CMAKE_RUNTIME_OUTPUT_DIRECTORY}/plugins)
  kvr_find_libraries(${plugin} ..)
  kvr_translations(${plugin} ${E_TRANSLATIONS})
endfunction()

# kvr_qt(<target> [<precompiled header>])
function(kvr_qt name)
  set(pch ${ARGN} kvr_pch)
  list(GET pch 0 pch)
  kvr_defaults(${name})
  kvr_find_libraries(${name})
  set_target_properties(${name} PROPERTIES AUTOMOC ON AUTOUIC ON AUTORCC ON)
  target_link_libraries(${name} PUBLIC Qt6::Widgets)
  target_precompile_headers(${name} REUSE_FROM ${pch})
endfunction()

# One test program per room, its cases found by CTest. LABEL separates the rooms for ctest -L.
include(GoogleTest)
function(kvr_test name)
  cmake_parse_arguments(T "QT" "LABEL" "SOURCES;LIBS" ${ARGN})
  add_executable(${name} ${T_SOURCES})
  if(T_QT)
    find_package(Qt6 REQUIRED COMPONENTS Test)
    kvr_qt(${name} kvr_test_pch)
    target_sources(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests/qt_main.cpp)
    target_link_libraries(${name} PRIVATE ${T_LIBS} GTest::gtest GTest::gmock Qt6::Test)
  else()
    kvr_defaults(${name})
    target_link_libraries(${name} PRIVATE ${T_LIBS} GTest::gtest GTest::gmock GTest::gtest_main)
  endif()
  target_include_directories(${name} PRIVATE ${PROJECT_SOURCE_DIR}/tests)
  target_compile_definitions(${name} PRIVATE KVR_SOURCE_DIR="${PROJECT_SOURCE_DIR}" KVR_BUILD_DIR="${CMAKE_BINARY_DIR}")
  gtest_discover_tests(${name} DISCOVERY_MODE PRE_TEST DISCOVERY_TIMEOUT 60
                       PROPERTIES LABELS "${T_LABEL}" ENVIRONMENT "QT_QPA_PLATFORM=offscreen")
endfunction()
