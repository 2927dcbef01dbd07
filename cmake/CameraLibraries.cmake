# SPDX-License-Identifier: MIT
# Libraries of frame sources that a build can do without: sets Qt5Multimedia_FOUND and ARAVIS_FOUND, and makes
# the targets Qt5::Multimedia and PkgConfig::ARAVIS.
option(STATREPORT_MULTIMEDIA "Videos and UVC cameras through Qt Multimedia, where it is installed" ON)
option(STATREPORT_ARAVIS "GenICam cameras through Aravis, where it is installed" ON)

set(ARAVIS_FOUND FALSE)
if(STATREPORT_MULTIMEDIA)
  find_package(Qt5Multimedia 5.15 QUIET)
endif()
if(STATREPORT_ARAVIS)
  find_package(PkgConfig QUIET)
  if(PKG_CONFIG_FOUND)
    pkg_check_modules(ARAVIS QUIET IMPORTED_TARGET aravis-0.8>=0.8.20)
  endif()
endif()
