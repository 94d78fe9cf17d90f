# SPDX-License-Identifier: MIT
# What cmake --install installs. Each installed library is made of parts, the folders that name it in
# qz_library(… IN LIBRARY): qz has the engine and the memory toolkit, and qz-NAME has the toolkit NAME.
include(GNUInstallDirs)
include(CMakePackageConfigHelpers)

set(qz_cmake_dir ${CMAKE_INSTALL_LIBDIR}/cmake/qz)
set(qz_kinds shared static)
if(WIN32)
  set(qz_kinds static)  # include/qz/api.hpp exports nothing there
endif()

# Sets `result` to the libraries of others that the parts use.
function(qz_foreign_links result parts)
  set(links)
  foreach(part ${parts})
    get_target_property(part_links qz_${part} INTERFACE_LINK_LIBRARIES)
    list(APPEND links ${part_links})
  endforeach()
  list(FILTER links EXCLUDE REGEX "qz::|qz_private|NOTFOUND$")
  list(REMOVE_DUPLICATES links)
  set(${result} ${links} PARENT_SCOPE)
endfunction()

# Links the internal parts into another library than qz, which hides its own copy of them. They come after
# qz, so that only what qz hides is taken from them.
function(qz_link_internal_parts target)
  get_property(parts GLOBAL PROPERTY QZ_INTERNAL_PARTS)
  list(REVERSE parts)  # a library before those that it uses
  foreach(part ${parts})
    target_link_libraries(${target} PRIVATE $<BUILD_INTERFACE:$<TARGET_FILE:qz_${part}>>)
    add_dependencies(${target} qz_${part})
  endforeach()
endfunction()

# Adds and installs a library of the kind (shared or static) from the object files of its parts.
function(qz_install_kind library kind parts)
  string(TOUPPER ${kind} type)
  set(target ${library}_${kind})
  list(TRANSFORM parts REPLACE "(.+)" "$<TARGET_OBJECTS:qz_\\1>" OUTPUT_VARIABLE objects)
  qz_foreign_links(links "${parts}")
  add_library(${target} ${type} ${objects})
  set_target_properties(${target} PROPERTIES
    OUTPUT_NAME ${library} EXPORT_NAME ${library} LINKER_LANGUAGE CXX INSTALL_RPATH $ORIGIN
    VERSION ${PROJECT_VERSION} SOVERSION ${PROJECT_VERSION_MAJOR})
  target_compile_features(${target} INTERFACE cxx_std_20)
  target_include_directories(${target} INTERFACE $<INSTALL_INTERFACE:${CMAKE_INSTALL_INCLUDEDIR}>)
  target_link_libraries(${target} PUBLIC ${links} PRIVATE $<BUILD_INTERFACE:qz_private>)
  if(NOT library STREQUAL "qz")
    target_link_libraries(${target} PUBLIC qz_${kind})
  endif()
  if(kind STREQUAL "shared")
    set(exports ${PROJECT_SOURCE_DIR}/cmake/exports.map)
    target_link_options(${target} PRIVATE
      LINKER:--no-undefined LINKER:--exclude-libs,ALL LINKER:--version-script=${exports})
    set_target_properties(${target} PROPERTIES LINK_DEPENDS ${exports})
    if(NOT library STREQUAL "qz")
      qz_link_internal_parts(${target})
    endif()
  endif()
  install(TARGETS ${target} EXPORT ${library}-${kind})
  install(EXPORT ${library}-${kind} NAMESPACE qz:: DESTINATION ${qz_cmake_dir})
endfunction()

# Sets `result` to the directory as pkg-config files spell it.
function(qz_pkgconfig_dir result dir)
  cmake_path(IS_ABSOLUTE dir is_absolute)
  if(NOT is_absolute)
    set(dir "\${prefix}/${dir}")
  endif()
  set(${result} ${dir} PARENT_SCOPE)
endfunction()

# Installs LIBRARY.pc. The file finds its prefix from its own place, unless the library directory is absolute.
# `others` are the options that link libraries without a .pc file of their own.
function(qz_install_pkgconfig library description requires others)
  set(prefix ${CMAKE_INSTALL_PREFIX})
  cmake_path(IS_ABSOLUTE CMAKE_INSTALL_LIBDIR is_absolute)
  if(NOT is_absolute)
    file(RELATIVE_PATH up /prefix/${CMAKE_INSTALL_LIBDIR}/pkgconfig /prefix)
    string(REGEX REPLACE "/$" "" up ${up})
    set(prefix "\${pcfiledir}/${up}")
  endif()
  qz_pkgconfig_dir(libdir ${CMAKE_INSTALL_LIBDIR})
  qz_pkgconfig_dir(includedir ${CMAKE_INSTALL_INCLUDEDIR})
  configure_file(cmake/library.pc.in ${library}.pc @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/${library}.pc DESTINATION ${CMAKE_INSTALL_LIBDIR}/pkgconfig)
endfunction()

# Installs the headers of the toolkit NAME, which are in the folders NAME.
function(qz_install_toolkit_headers name)
  foreach(folder toolkit hosts drivers)
    set(headers ${PROJECT_SOURCE_DIR}/include/qz/${folder}/${name})
    if(EXISTS ${headers})
      install(DIRECTORY ${headers} DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}/qz/${folder})
    endif()
  endforeach()
  if(name STREQUAL "appkit")
    install(FILES include/QZ_Plist_State_Parser.h DESTINATION ${CMAKE_INSTALL_INCLUDEDIR})
  endif()
endfunction()

# Installs all headers except those of toolkits that have their own library.
function(qz_install_common_headers)
  file(GLOB folders RELATIVE ${PROJECT_SOURCE_DIR}/include LIST_DIRECTORIES true
    ${PROJECT_SOURCE_DIR}/include/qz/toolkit/* ${PROJECT_SOURCE_DIR}/include/qz/drivers/*)
  list(FILTER folders EXCLUDE REGEX "/memory$|\\.hpp$")
  list(TRANSFORM folders REPLACE "(.+)" "PATTERN;\\1;EXCLUDE")
  install(DIRECTORY include/ DESTINATION ${CMAKE_INSTALL_INCLUDEDIR}
    PATTERN qz/hosts EXCLUDE PATTERN QZ_Plist_State_Parser.h EXCLUDE ${folders})
endfunction()

# Installs a library with all that its users need.
function(qz_install_library library)
  get_property(parts GLOBAL PROPERTY QZ_PARTS_${library})
  foreach(kind ${qz_kinds})
    qz_install_kind(${library} ${kind} "${parts}")
  endforeach()

  string(REGEX REPLACE "^qz-" "" name ${library})
  if(library STREQUAL "qz")
    qz_install_common_headers()
    qz_install_pkgconfig(qz "The QZ walk-through engine and its memory toolkit" "" "")
  else()
    qz_install_toolkit_headers(${name})
    set(requires "qz = ${PROJECT_VERSION}" ${QZ_PKGCONFIG_${name}})
    list(JOIN requires ", " requires)
    qz_install_pkgconfig(${library} "Walk-throughs in ${QZ_TITLE_${name}}" "${requires}"
      "${QZ_PKGCONFIG_LIBS_${name}}")
  endif()

  get_property(internal GLOBAL PROPERTY QZ_INTERNAL_PARTS)
  list(REMOVE_ITEM parts ${internal})
  set(dependencies)
  foreach(package ${QZ_PACKAGES_${name}})
    string(APPEND dependencies "find_dependency(${package})\n")
  endforeach()
  string(APPEND dependencies "${QZ_CONDITION_${name}}")
  configure_file(cmake/component.cmake.in ${library}.cmake @ONLY)
  install(FILES ${PROJECT_BINARY_DIR}/${library}.cmake DESTINATION ${qz_cmake_dir})
endfunction()

get_property(qz_libraries GLOBAL PROPERTY QZ_LIBRARIES)
list(REMOVE_DUPLICATES qz_libraries)
foreach(library ${qz_libraries})
  qz_install_library(${library})
endforeach()

# The toolkits that can have a library of their own, for messages.
file(GLOB toolkit_rows RELATIVE ${PROJECT_SOURCE_DIR}/include/qz/drivers include/qz/drivers/*/toolkit_row.hpp)
list(TRANSFORM toolkit_rows REPLACE "/.*" "" OUTPUT_VARIABLE qz_toolkit_names)
list(REMOVE_ITEM qz_toolkit_names memory)
list(JOIN qz_toolkit_names " and " qz_toolkit_list)
list(JOIN qz_toolkit_names "|" qz_toolkit_names)
configure_package_config_file(cmake/qz-config.cmake.in qz-config.cmake INSTALL_DESTINATION ${qz_cmake_dir})
write_basic_package_version_file(qz-config-version.cmake COMPATIBILITY SameMajorVersion)
install(FILES ${PROJECT_BINARY_DIR}/qz-config.cmake ${PROJECT_BINARY_DIR}/qz-config-version.cmake
  DESTINATION ${qz_cmake_dir})

# The tool, and what scripts/tool-files makes of what the tool says of itself.
if(TARGET qz-walkthrough)
  install(TARGETS qz-walkthrough)
  set(files ${PROJECT_BINARY_DIR}/tool-files)
  add_custom_command(OUTPUT ${files}/qz-walkthrough.fish
    COMMAND ${PROJECT_SOURCE_DIR}/scripts/tool-files $<TARGET_FILE:qz-walkthrough> ${files}
    DEPENDS qz-walkthrough scripts/tool-files VERBATIM)
  add_custom_target(tool-files ALL DEPENDS ${files}/qz-walkthrough.fish)
  install(FILES ${files}/qz-walkthrough DESTINATION ${CMAKE_INSTALL_DATADIR}/bash-completion/completions)
  install(FILES ${files}/_qz-walkthrough DESTINATION ${CMAKE_INSTALL_DATADIR}/zsh/site-functions)
  install(FILES ${files}/qz-walkthrough.fish DESTINATION ${CMAKE_INSTALL_DATADIR}/fish/vendor_completions.d)
  install(DIRECTORY ${files}/ DESTINATION ${CMAKE_INSTALL_MANDIR}/man1 FILES_MATCHING PATTERN *.1)
endif()
install(FILES README.md CHANGELOG.md LICENSE DESTINATION ${CMAKE_INSTALL_DOCDIR})
install(DIRECTORY docs examples LICENSES DESTINATION ${CMAKE_INSTALL_DOCDIR})
