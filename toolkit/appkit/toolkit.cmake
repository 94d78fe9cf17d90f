# SPDX-License-Identifier: MIT
# Finds AppKit, which a build can do without: the system's on macOS, otherwise GNUstep's. Afterwards
# QZ_APPKIT is true or false. If it is true, the targets qz_foundation_platform and
# qz_appkit_platform have what Objective-C sources need to compile and link.
set(QZ_APPKIT AUTO CACHE STRING "Build the AppKit toolkit: ON, OFF, or AUTO (ON if Objective-C++ and AppKit are found)")

function(qz_find_appkit found)
  set(${found} FALSE PARENT_SCOPE)
  if(CMAKE_CXX_COMPILER_ID STREQUAL "GNU")
    # One compiler for all languages, because each has its own Objective-C runtime.
    find_program(CMAKE_OBJC_COMPILER NAMES gcc cc)
    set(CMAKE_OBJCXX_COMPILER ${CMAKE_CXX_COMPILER} CACHE FILEPATH "")
  elseif(NOT APPLE)
    return()  # GNUstep's libraries are built for GCC's runtime
  endif()
  include(CheckLanguage)
  check_language(OBJC)
  check_language(OBJCXX)
  if(NOT CMAKE_OBJC_COMPILER OR NOT CMAKE_OBJCXX_COMPILER)
    return()
  endif()
  add_library(qz_foundation_platform INTERFACE)
  add_library(qz_appkit_platform INTERFACE)
  target_link_libraries(qz_appkit_platform INTERFACE qz_foundation_platform)
  if(APPLE)
    target_link_libraries(qz_foundation_platform INTERFACE "-framework Foundation")
    target_link_libraries(qz_appkit_platform INTERFACE "-framework AppKit" "-framework QuartzCore")
    set(QZ_PKGCONFIG_LIBS_appkit "-framework AppKit -framework QuartzCore" PARENT_SCOPE)
    # GNUstep has only the older names of constants, which macOS keeps but has deprecated.
    target_compile_options(qz_private INTERFACE $<$<COMPILE_LANGUAGE:OBJC,OBJCXX>:-Wno-deprecated-declarations>)
  else()
    find_path(QZ_GNUSTEP_HEADERS AppKit/AppKit.h PATH_SUFFIXES GNUstep)
    find_library(QZ_GNUSTEP_BASE gnustep-base)
    find_library(QZ_GNUSTEP_GUI gnustep-gui)
    if(NOT QZ_GNUSTEP_HEADERS OR NOT QZ_GNUSTEP_BASE OR NOT QZ_GNUSTEP_GUI)
      return()
    endif()
    target_include_directories(qz_foundation_platform SYSTEM INTERFACE ${QZ_GNUSTEP_HEADERS})
    # What `gnustep-config --objc-flags` says, without warnings and optimisation.
    target_compile_options(qz_foundation_platform INTERFACE $<$<COMPILE_LANGUAGE:OBJC,OBJCXX>:
      -fexceptions -fobjc-exceptions -fconstant-string-class=NSConstantString -fno-strict-aliasing>)
    # CMake does not know the standards of GCC's Objective-C.
    target_compile_options(qz_foundation_platform INTERFACE 
      $<$<COMPILE_LANGUAGE:OBJC>:-std=gnu11> $<$<COMPILE_LANGUAGE:OBJCXX>:-std=c++20>)
    target_compile_definitions(qz_foundation_platform INTERFACE
      GNUSTEP GNUSTEP_BASE_LIBRARY=1 GNU_GUI_LIBRARY=1 GNU_RUNTIME=1 _NATIVE_OBJC_EXCEPTIONS)
    target_link_libraries(qz_foundation_platform INTERFACE ${QZ_GNUSTEP_BASE} -lobjc)
    target_link_libraries(qz_appkit_platform INTERFACE ${QZ_GNUSTEP_GUI})
    set(QZ_PKGCONFIG_LIBS_appkit "-lgnustep-gui -lgnustep-base -lobjc" PARENT_SCOPE)
    set(QZ_CONDITION_appkit [[
if(CMAKE_OBJC_COMPILER_ID AND NOT CMAKE_OBJC_COMPILER_ID STREQUAL "GNU")
  set(qz_NOT_FOUND_MESSAGE "The AppKit toolkit of qz was built for GCC's Objective-C, and this project compiles \
Objective-C with ${CMAKE_OBJC_COMPILER}. Configure it in a new build directory, with OBJC=gcc in the environment.")
  set(qz_FOUND FALSE)
  return()
endif()
# CMake has no flags for the run path of programs in Objective-C, except on macOS.
set(CMAKE_EXECUTABLE_RUNTIME_OBJC_FLAG "-Wl,-rpath,")
set(CMAKE_EXECUTABLE_RUNTIME_OBJC_FLAG_SEP ":")
]] PARENT_SCOPE)
  endif()
  if(QZ_INSTALL)
    foreach(kind shared static)  # each of the two libraries has its own list
      install(TARGETS qz_foundation_platform qz_appkit_platform EXPORT qz-appkit-${kind})
    endforeach()
  endif()
  set(${found} TRUE PARENT_SCOPE)
endfunction()

if("${QZ_APPKIT}" STREQUAL "AUTO")
  qz_find_appkit(QZ_APPKIT)
  if(NOT QZ_APPKIT)
    message(STATUS "No AppKit toolkit in this build: Objective-C++ or AppKit was not found (scripts/setup appkit)")
  endif()
elseif(QZ_APPKIT)
  qz_find_appkit(found)
  if(NOT found)
    message(FATAL_ERROR "Objective-C++ or AppKit was not found (scripts/setup appkit)")
  endif()
endif()
if(QZ_APPKIT)
  enable_language(OBJC OBJCXX)
  set(CMAKE_OBJCXX_STANDARD 20)
  set(CMAKE_OBJCXX_EXTENSIONS OFF)
  foreach(language OBJC OBJCXX)
    if(CMAKE_CXX_COMPILER_LAUNCHER AND NOT CMAKE_${language}_COMPILER_LAUNCHER)
      set(CMAKE_${language}_COMPILER_LAUNCHER ${CMAKE_CXX_COMPILER_LAUNCHER})
    endif()
  endforeach()
  list(APPEND QZ_TOOLKITS appkit)
  set(QZ_TITLE_appkit "windows of AppKit")
endif()
