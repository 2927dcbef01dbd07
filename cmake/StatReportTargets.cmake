# SPDX-License-Identifier: MIT
# One function per kind of target, so that every target gets the same flags.

function(statreport_common_flags name)
  target_compile_definitions(${name} PRIVATE
    QT_DEPRECATED_WARNINGS QT_NO_CAST_TO_ASCII QT_NO_URL_CAST_FROM_STRING)
  target_compile_options(${name} PRIVATE
    -Wall -Wextra -Wpedantic -Wshadow -Wconversion
    $<$<BOOL:${STATREPORT_WARNINGS_AS_ERRORS}>:-Werror>
    $<$<CONFIG:Debug>:-fno-omit-frame-pointer>)
  if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    target_compile_options(${name} PRIVATE $<$<BOOL:${CCACHE_PROGRAM}>:-fpch-preprocess>)
  endif()
  if(STATREPORT_SANITIZE)
    target_compile_options(${name} PRIVATE -fsanitize=${STATREPORT_SANITIZE} -fno-sanitize-recover=all)
    target_link_options(${name} PRIVATE -fsanitize=${STATREPORT_SANITIZE})
  endif()
  if(STATREPORT_COVERAGE)
    target_compile_options(${name} PRIVATE --coverage)
    target_link_options(${name} PRIVATE --coverage)
  endif()
endfunction()

# A shared library of the host SDK. EXPORT names the macro prefix: <EXPORT>_LIBRARY is defined while building it.
function(statreport_host_library name)
  cmake_parse_arguments(ARG "" "EXPORT" "SOURCES;PUBLIC;PRIVATE" ${ARGN})
  add_library(${name} SHARED ${ARG_SOURCES})
  target_compile_definitions(${name} PRIVATE ${ARG_EXPORT}_LIBRARY)
  target_include_directories(${name} PUBLIC $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/host>)
  target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
  set_target_properties(${name} PROPERTIES VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})
  # The name that the installed package gives it, for examples that are built here and there.
  add_library(StatReport::${name} ALIAS ${name})
  statreport_common_flags(${name})
endfunction()

# A static library of the plug-in: one per layer.
function(statreport_layer name)
  cmake_parse_arguments(ARG "" "" "SOURCES;PUBLIC;PRIVATE;PCH" ${ARGN})
  add_library(${name} STATIC ${ARG_SOURCES})
  target_include_directories(${name} PUBLIC ${PROJECT_SOURCE_DIR}/src)
  target_link_libraries(${name} PUBLIC ${ARG_PUBLIC} PRIVATE ${ARG_PRIVATE})
  if(ARG_PCH)
    target_precompile_headers(${name} PRIVATE ${ARG_PCH})
  endif()
  statreport_common_flags(${name})
endfunction()

# The plug-in module that a host loads at run time, in the folder "plugins" of the build.
function(statreport_plugin name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS" ${ARGN})
  add_library(${name} MODULE ${ARG_SOURCES})
  target_include_directories(${name} PRIVATE ${PROJECT_SOURCE_DIR}/src)
  target_link_libraries(${name} PRIVATE ${ARG_LIBS})
  set_target_properties(${name} PROPERTIES
    PREFIX ""
    LIBRARY_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/plugins)
  if(UNIX AND NOT APPLE)
    # Visibility alone leaves out the inline code of Qt and of the standard library.
    set(exports ${PROJECT_SOURCE_DIR}/cmake/plugin-exports.map)
    target_link_options(${name} PRIVATE LINKER:--version-script=${exports})
    set_target_properties(${name} PROPERTIES LINK_DEPENDS ${exports})
  endif()
  statreport_common_flags(${name})
endfunction()

# The languages of the user interface, by the names that the setting "GEN_Language" takes.
set(STATREPORT_LANGUAGES English German French Spanish Italian Russian Japanese Korean Arabic ChineseSimple
    ChineseTraditional Slovakian)

# Compiles a target's translations into its resources: FOLDER/<language>.ts is found as ":/PREFIX/<language>.qm".
# A program that uses the target's code but not the target links <target>_translations.
function(statreport_translations name)
  cmake_parse_arguments(ARG "" "PREFIX;FOLDER" "" ${ARGN})
  set(output ${CMAKE_CURRENT_BINARY_DIR}/translations/${ARG_PREFIX})
  set(ts_files "")
  set(entries "")
  foreach(language ${STATREPORT_LANGUAGES})
    list(APPEND ts_files ${CMAKE_CURRENT_SOURCE_DIR}/${ARG_FOLDER}/${language}.ts)
    string(APPEND entries "    <file>${language}.qm</file>\n")
  endforeach()
  set_source_files_properties(${ts_files} PROPERTIES OUTPUT_LOCATION ${output})
  qt5_add_translation(qm_files ${ts_files} OPTIONS -silent)
  file(CONFIGURE OUTPUT ${output}/${ARG_PREFIX}_translations.qrc @ONLY
    CONTENT "<RCC>\n  <qresource prefix=\"/${ARG_PREFIX}\">\n${entries}  </qresource>\n</RCC>\n")
  # Not left to AUTORCC, which knows nothing of files that the build makes. The file names the function that
  # registers its content, so it must not be named like other resources of the program.
  qt5_add_resources(resources ${output}/${ARG_PREFIX}_translations.qrc)
  add_library(${name}_translations OBJECT ${resources})
  target_link_libraries(${name}_translations PRIVATE Qt5::Core)
  set_target_properties(${name}_translations PROPERTIES AUTOMOC OFF AUTOUIC OFF AUTORCC OFF)
  target_link_libraries(${name} PRIVATE ${name}_translations)
endfunction()

function(statreport_executable name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS;PCH" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE ${ARG_LIBS})
  if(ARG_PCH)
    target_precompile_headers(${name} PRIVATE ${ARG_PCH})
  endif()
  statreport_common_flags(${name})
endfunction()

# The meta-object code and resources of a test, made by one call of moc or rcc for each file that needs it: CMake's
# own automatic step costs more per program than compiling it.
function(statreport_test_generated result name)
  set(generated)
  foreach(source ${ARGN})
    get_filename_component(base ${source} NAME_WE)
    if(source MATCHES "\\.qrc$")
      qt5_add_resources(generated ${source})
      continue()
    endif()
    file(STRINGS ${source} objects REGEX "Q_OBJECT")
    if(objects AND source MATCHES "\\.cpp$")
      qt5_generate_moc(${source} ${CMAKE_CURRENT_BINARY_DIR}/${name}/${base}.moc TARGET ${name})
      list(APPEND generated ${CMAKE_CURRENT_BINARY_DIR}/${name}/${base}.moc)
    elseif(objects)
      qt5_generate_moc(${source} ${CMAKE_CURRENT_BINARY_DIR}/${name}/moc_${base}.cpp TARGET ${name})
      list(APPEND generated ${CMAKE_CURRENT_BINARY_DIR}/${name}/moc_${base}.cpp)
    endif()
  endforeach()
  set(${result} ${generated} PARENT_SCOPE)
endfunction()

# Hundreds of test programs hold the same libraries: the faster linker and leaving the debugging information out make most of
# a build's time and nine tenths of its size. With STATREPORT_TEST_DEBUG_INFO debuggers see the lines of the code.
option(STATREPORT_TEST_DEBUG_INFO "Keep debugging information in the test programs" OFF)
find_program(GOLD_LINKER ld.gold)
function(statreport_link_quickly name)
  if(GOLD_LINKER)
    target_link_options(${name} PRIVATE -fuse-ld=gold)
  endif()
  # The sanitizers tell the lines of what they find.
  if(NOT STATREPORT_TEST_DEBUG_INFO AND NOT STATREPORT_SANITIZE)
    target_link_options(${name} PRIVATE LINKER:--strip-debug)
  endif()
endfunction()

# A test program named after the class it tests; runs off-screen, from a folder of its own, in any order.
function(statreport_test name)
  cmake_parse_arguments(ARG "" "TIMEOUT" "SOURCES;LIBS" ${ARGN})
  if(NOT ARG_SOURCES)
    set(ARG_SOURCES ${name}.cpp)
  endif()
  if(NOT ARG_TIMEOUT)
    set(ARG_TIMEOUT 120)
  endif()
  statreport_test_generated(generated ${name} ${ARG_SOURCES})
  list(FILTER ARG_SOURCES EXCLUDE REGEX "\\.qrc$")
  add_executable(${name} ${ARG_SOURCES} ${generated})
  target_include_directories(${name} PRIVATE ${CMAKE_CURRENT_BINARY_DIR}/${name})
  target_link_libraries(${name} PRIVATE statreport_testsupport ${ARG_LIBS})
  set_target_properties(${name} PROPERTIES
    RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests AUTOMOC OFF AUTOUIC OFF AUTORCC OFF)
  target_precompile_headers(${name} REUSE_FROM statreport_testpch)
  statreport_common_flags(${name})
  statreport_link_quickly(${name})
  add_test(NAME ${name} COMMAND ${name})
  set_tests_properties(${name} PROPERTIES
    TIMEOUT ${ARG_TIMEOUT}
    ENVIRONMENT "QT_QPA_PLATFORM=offscreen;LC_ALL=C.UTF-8;UBSAN_OPTIONS=print_stacktrace=1;ASAN_OPTIONS=detect_leaks=0:strict_string_checks=1")
endfunction()
