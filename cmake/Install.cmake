# SPDX-License-Identifier: MIT
# What `cmake --install` puts where, in four components:
#
#   host    the host's shared libraries, which application and plug-in meet in
#   desk    Measuring Desk, statreport and what a desktop shows of them
#   plugin  the report plug-in with the templates to start from
#   sdk     headers and the CMake package StatReportHost
#
# Every path in the tree is relative to another one in it, so that the prefix can be moved. The programs are in
# lib/statreport/bin with links in bin: what stands "beside the program" (the folder Templates) is then not in a folder
# that all programs share.
include(CMakePackageConfigHelpers)

set(STATREPORT_HOST_LIBRARIES ztcommon ztimage ztkernel ztgui ztmeasuring)
set(STATREPORT_PROGRAMS measuringdesk statreport)
set(STATREPORT_PRIVATE_DIR lib/statreport)
set(STATREPORT_PROGRAM_DIR ${STATREPORT_PRIVATE_DIR}/bin)
set(STATREPORT_PLUGIN_DIR ${STATREPORT_PRIVATE_DIR}/plugins)
set(STATREPORT_EXAMPLES_DIR ${CMAKE_INSTALL_DATADIR}/statreport/examples)
set(STATREPORT_SDK_INCLUDE_DIR ${CMAKE_INSTALL_INCLUDEDIR}/statreport-host)
set(STATREPORT_SDK_CMAKE_DIR ${CMAKE_INSTALL_LIBDIR}/cmake/StatReportHost)

# Paths between the folders of the tree, whatever CMAKE_INSTALL_LIBDIR and CMAKE_INSTALL_DATADIR are.
file(RELATIVE_PATH libraries_from_programs /${STATREPORT_PROGRAM_DIR} /${CMAKE_INSTALL_LIBDIR})
file(RELATIVE_PATH libraries_from_plugins /${STATREPORT_PLUGIN_DIR} /${CMAKE_INSTALL_LIBDIR})
file(RELATIVE_PATH programs_from_bin /${CMAKE_INSTALL_BINDIR} /${STATREPORT_PROGRAM_DIR})
file(RELATIVE_PATH templates_from_programs /${STATREPORT_PROGRAM_DIR} /${STATREPORT_EXAMPLES_DIR}/templates)

set_target_properties(${STATREPORT_HOST_LIBRARIES} PROPERTIES INSTALL_RPATH "$ORIGIN")
set_target_properties(${STATREPORT_PROGRAMS} PROPERTIES INSTALL_RPATH "$ORIGIN/${libraries_from_programs}")
set_target_properties(StatReportingPlugin PROPERTIES INSTALL_RPATH "$ORIGIN/${libraries_from_plugins}")

# Makes a relative symbolic link at install time.
function(statreport_install_link component link target)
  get_filename_component(folder ${link} DIRECTORY)
  get_filename_component(name ${link} NAME)
  set(made ${PROJECT_BINARY_DIR}/links/${component}-${name}/${name})
  get_filename_component(made_folder ${made} DIRECTORY)
  file(MAKE_DIRECTORY ${made_folder})
  file(CREATE_LINK ${target} ${made} SYMBOLIC)
  install(FILES ${made} DESTINATION ${folder} COMPONENT ${component})
endfunction()

# Installs a file as Debian wants changelogs and manuals: compressed, and alike in every build.
function(statreport_install_compressed component source folder name)
  set(packed ${PROJECT_BINARY_DIR}/compressed/${component}/${name}.gz)
  get_filename_component(packed_folder ${packed} DIRECTORY)
  file(MAKE_DIRECTORY ${packed_folder})
  set_property(DIRECTORY ${PROJECT_SOURCE_DIR} APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS ${source})
  execute_process(COMMAND gzip -9nc ${PROJECT_SOURCE_DIR}/${source} OUTPUT_FILE ${packed} COMMAND_ERROR_IS_FATAL ANY)
  install(FILES ${packed} DESTINATION ${folder} COMPONENT ${component})
endfunction()

# --- Component host
install(TARGETS ${STATREPORT_HOST_LIBRARIES} EXPORT StatReportHostTargets
  LIBRARY DESTINATION ${CMAKE_INSTALL_LIBDIR} COMPONENT host NAMELINK_COMPONENT sdk
  INCLUDES DESTINATION ${STATREPORT_SDK_INCLUDE_DIR})

# Where Debian's packages have their licence, their history, and what its checker need not report.
foreach(package libstatreporthost${PROJECT_VERSION_MAJOR}:host measuringdesk:desk statreport-plugin:plugin libstatreporthost-dev:sdk)
  string(REPLACE ":" ";" package ${package})
  list(GET package 0 package_name)
  list(GET package 1 component)
  install(FILES LICENSE RENAME copyright DESTINATION ${CMAKE_INSTALL_DATADIR}/doc/${package_name} COMPONENT ${component})
  statreport_install_compressed(${component} packaging/linux/changelog ${CMAKE_INSTALL_DATADIR}/doc/${package_name} changelog)
endforeach()
install(FILES packaging/linux/libstatreporthost.lintian-overrides RENAME libstatreporthost${PROJECT_VERSION_MAJOR}
  DESTINATION ${CMAKE_INSTALL_DATADIR}/lintian/overrides COMPONENT host)

# --- Component desk
install(TARGETS ${STATREPORT_PROGRAMS} RUNTIME DESTINATION ${STATREPORT_PROGRAM_DIR} COMPONENT desk)
foreach(program ${STATREPORT_PROGRAMS})
  statreport_install_link(desk ${CMAKE_INSTALL_BINDIR}/${program} ${programs_from_bin}/${program})
  statreport_install_compressed(desk docs/man/${program}.1 ${CMAKE_INSTALL_MANDIR}/man1 ${program}.1)
endforeach()
install(DIRECTORY examples/sessions examples/tables examples/pictures DESTINATION ${STATREPORT_EXAMPLES_DIR} COMPONENT desk)
# The guide that the Desk shows, in every language, what it links to, and the pictures that it names. Not below share/doc,
# which a system may leave out.
set_property(DIRECTORY ${PROJECT_SOURCE_DIR} APPEND PROPERTY CMAKE_CONFIGURE_DEPENDS docs/user-guide.md)
set(guide_dir ${CMAKE_INSTALL_DATADIR}/measuringdesk/guide)
file(GLOB guides CONFIGURE_DEPENDS ${PROJECT_SOURCE_DIR}/docs/user-guide*.md)
install(FILES ${guides} docs/tables.md docs/rtp-format.md DESTINATION ${guide_dir} COMPONENT desk)
file(STRINGS docs/user-guide.md guide_pictures REGEX "^!\\[")
list(TRANSFORM guide_pictures REPLACE "^!\\[.*\\]\\((.*)\\)$" "docs/\\1")
install(FILES ${guide_pictures} DESTINATION ${guide_dir}/pictures COMPONENT desk)
set(app_id org.statreport.measuringdesk)
install(FILES packaging/linux/${app_id}.desktop DESTINATION ${CMAKE_INSTALL_DATADIR}/applications COMPONENT desk)
install(FILES packaging/linux/${app_id}.metainfo.xml DESTINATION ${CMAKE_INSTALL_DATADIR}/metainfo COMPONENT desk)
install(FILES packaging/linux/statreport.xml DESTINATION ${CMAKE_INSTALL_DATADIR}/mime/packages COMPONENT desk)
install(FILES host/desk/Icons/measuringdesk.svg RENAME ${app_id}.svg
  DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/apps COMPONENT desk)
install(FILES packaging/linux/application-x-statreport-template.svg
  DESTINATION ${CMAKE_INSTALL_DATADIR}/icons/hicolor/scalable/mimetypes COMPONENT desk)
install(FILES packaging/completion/statreport.bash RENAME statreport
  DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions COMPONENT desk)
install(FILES packaging/completion/statreport.zsh RENAME _statreport
  DESTINATION ${CMAKE_INSTALL_DATADIR}/zsh/site-functions COMPONENT desk)
install(FILES packaging/completion/statreport.fish
  DESTINATION ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d COMPONENT desk)

# --- Component plugin
install(TARGETS StatReportingPlugin LIBRARY DESTINATION ${STATREPORT_PLUGIN_DIR} COMPONENT plugin)
install(DIRECTORY examples/templates DESTINATION ${STATREPORT_EXAMPLES_DIR} COMPONENT plugin)
statreport_install_link(plugin ${STATREPORT_PROGRAM_DIR}/Templates ${templates_from_programs})

# --- Component sdk
foreach(library ${STATREPORT_HOST_LIBRARIES})
  string(REGEX REPLACE "^zt" "" folder ${library})
  install(DIRECTORY host/${folder} DESTINATION ${STATREPORT_SDK_INCLUDE_DIR} COMPONENT sdk
    FILES_MATCHING PATTERN "*.h" PATTERN resources EXCLUDE)
endforeach()
install(DIRECTORY examples/minimalhost DESTINATION ${CMAKE_INSTALL_DATADIR}/statreport/examples COMPONENT sdk)
install(EXPORT StatReportHostTargets NAMESPACE StatReport:: DESTINATION ${STATREPORT_SDK_CMAKE_DIR} COMPONENT sdk)
configure_package_config_file(cmake/StatReportHostConfig.cmake.in
  ${PROJECT_BINARY_DIR}/StatReportHostConfig.cmake
  INSTALL_DESTINATION ${STATREPORT_SDK_CMAKE_DIR}
  PATH_VARS STATREPORT_PLUGIN_DIR)
write_basic_package_version_file(${PROJECT_BINARY_DIR}/StatReportHostConfigVersion.cmake COMPATIBILITY SameMinorVersion)
install(FILES ${PROJECT_BINARY_DIR}/StatReportHostConfig.cmake ${PROJECT_BINARY_DIR}/StatReportHostConfigVersion.cmake
  DESTINATION ${STATREPORT_SDK_CMAKE_DIR} COMPONENT sdk)
