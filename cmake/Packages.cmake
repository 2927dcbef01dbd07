# SPDX-License-Identifier: MIT
# Debian packages: `cpack --config build/release/CPackConfig.cmake`, or scripts/packages, which builds them as the
# system installs them (prefix /usr, libraries in the folder of the architecture).
set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME statreport)
set(CPACK_PACKAGE_VENDOR "${STATREPORT_VENDOR}")
set(CPACK_PACKAGE_CONTACT "The StatReport developers <developers@statreport.invalid>")
# Each package has a first line of its own; this one would stand above it.
set(CPACK_PACKAGE_DESCRIPTION_SUMMARY "")
set(CPACK_RESOURCE_FILE_LICENSE ${PROJECT_SOURCE_DIR}/LICENSE)
set(CPACK_STRIP_FILES ON)
set(CPACK_INSTALL_DEFAULT_DIRECTORY_PERMISSIONS
  OWNER_READ OWNER_WRITE OWNER_EXECUTE GROUP_READ GROUP_EXECUTE WORLD_READ WORLD_EXECUTE)
set(CPACK_COMPONENTS_GROUPING IGNORE)
set(CPACK_COMPONENTS_ALL host desk plugin sdk)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS ON)
set(CPACK_DEBIAN_PACKAGE_SHLIBDEPS_PRIVATE_DIRS ${CMAKE_BINARY_DIR}/lib)
set(CPACK_DEBIAN_PACKAGE_GENERATE_SHLIBS ON)
set(CPACK_DEBIAN_PACKAGE_CONTROL_STRICT_PERMISSION ON)
set(CPACK_DEBIAN_ENABLE_COMPONENT_DEPENDS OFF)
set(exact "(= ${PROJECT_VERSION})")

set(CPACK_DEBIAN_HOST_PACKAGE_NAME libstatreporthost${PROJECT_VERSION_MAJOR})
set(CPACK_DEBIAN_HOST_PACKAGE_SECTION libs)
# The system's trigger brings the linker's cache up to date. CPack would add scripts that do so, too, unless there are
# others of their names; files that do not exist keep it from that and are left out.
set(CPACK_DEBIAN_HOST_PACKAGE_CONTROL_EXTRA ${PROJECT_SOURCE_DIR}/packaging/linux/triggers
  ${PROJECT_BINARY_DIR}/none/postinst ${PROJECT_BINARY_DIR}/none/postrm)
set(CPACK_COMPONENT_HOST_DESCRIPTION "libraries that measuring applications and report plug-ins share
The contract between an image-measurement application and its report plug-ins:
object types and measured objects, frames, signals, settings, tools, themes.")

set(CPACK_DEBIAN_DESK_PACKAGE_NAME measuringdesk)
set(CPACK_DEBIAN_DESK_PACKAGE_SECTION science)
set(CPACK_DEBIAN_DESK_PACKAGE_DEPENDS "libstatreporthost${PROJECT_VERSION_MAJOR} ${exact}, libqt5svg5, qt5-image-formats-plugins")
# Letters of every language that the programs have, on the screen and in reports.
set(fonts "fonts-open-sans, fonts-noto-core, fonts-noto-cjk")
# What makes its files and its entry in the menu known to the desktop, and opens folders and reports.
set(desktop "desktop-file-utils, hicolor-icon-theme, shared-mime-info, xdg-utils")
set(CPACK_DEBIAN_DESK_PACKAGE_RECOMMENDS
  "statreport-plugin ${exact}, ${fonts}, qttranslations5-l10n, ${desktop}")
set(CPACK_COMPONENT_DESK_DESCRIPTION "measure objects on microscope and camera images
Opens an image or a camera, is calibrated, and measures lengths, angles,
areas, diameters and counts. With the report plug-in its values go into PDF
reports.
The command-line program statreport makes the same reports without a display.")

set(CPACK_DEBIAN_PLUGIN_PACKAGE_NAME statreport-plugin)
set(CPACK_DEBIAN_PLUGIN_PACKAGE_SECTION science)
set(CPACK_DEBIAN_PLUGIN_PACKAGE_DEPENDS "libstatreporthost${PROJECT_VERSION_MAJOR} ${exact}")
set(CPACK_DEBIAN_PLUGIN_PACKAGE_RECOMMENDS "${fonts}")
set(CPACK_DEBIAN_PLUGIN_PACKAGE_ENHANCES measuringdesk)
set(CPACK_COMPONENT_PLUGIN_DESCRIPTION "statistics reports for image-measurement applications
A plug-in with a templates editor, live statistics and PDF reports of what was
measured, and templates to start from.")

set(CPACK_DEBIAN_SDK_PACKAGE_NAME libstatreporthost-dev)
set(CPACK_DEBIAN_SDK_PACKAGE_SECTION libdevel)
set(CPACK_DEBIAN_SDK_PACKAGE_DEPENDS "libstatreporthost${PROJECT_VERSION_MAJOR} ${exact}, qtbase5-dev")
set(CPACK_COMPONENT_SDK_DESCRIPTION "headers for applications that load report plug-ins
Headers, a CMake package (StatReportHost) and a minimal application.")

include(CPack)
