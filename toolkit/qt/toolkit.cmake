# SPDX-License-Identifier: MIT
# Finds Qt, which a build can do without. Afterwards QZ_QT is true or false.
set(QZ_QT AUTO CACHE STRING "Build the Qt toolkit: ON, OFF, or AUTO (ON if Qt 6.4 Widgets is found)")
if("${QZ_QT}" STREQUAL "AUTO")
  find_package(Qt6 6.4 QUIET COMPONENTS Widgets)
  set(QZ_QT "${Qt6_FOUND}")
  if(NOT QZ_QT)
    message(STATUS "No Qt toolkit in this build: Qt 6.4 Widgets was not found (scripts/setup qt)")
  endif()
elseif(QZ_QT)
  find_package(Qt6 6.4 REQUIRED COMPONENTS Widgets)
endif()
if(QZ_QT)
  find_package(Qt6 6.4 QUIET OPTIONAL_COMPONENTS UiTools)  # the tools read forms with it
  list(APPEND QZ_TOOLKITS qt)
  set(QZ_TITLE_qt "windows of Qt 6 Widgets")
  set(QZ_PACKAGES_qt "Qt6 6.4 COMPONENTS Widgets")
  set(QZ_PKGCONFIG_qt "Qt6Widgets >= 6.4")
endif()
