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

function(statreport_executable name)
  cmake_parse_arguments(ARG "" "" "SOURCES;LIBS;PCH" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE ${ARG_LIBS})
  if(ARG_PCH)
    target_precompile_headers(${name} PRIVATE ${ARG_PCH})
  endif()
  statreport_common_flags(${name})
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
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE statreport_testsupport ${ARG_LIBS})
  set_target_properties(${name} PROPERTIES RUNTIME_OUTPUT_DIRECTORY ${CMAKE_BINARY_DIR}/tests)
  target_precompile_headers(${name} REUSE_FROM statreport_testpch)
  statreport_common_flags(${name})
  add_test(NAME ${name} COMMAND ${name})
  set_tests_properties(${name} PROPERTIES
    TIMEOUT ${ARG_TIMEOUT}
    ENVIRONMENT "QT_QPA_PLATFORM=offscreen;LC_ALL=C.UTF-8;UBSAN_OPTIONS=print_stacktrace=1;ASAN_OPTIONS=detect_leaks=0:strict_string_checks=1")
endfunction()
