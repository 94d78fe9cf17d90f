# SPDX-License-Identifier: MIT
# qz_library(NAME [HOT] [FOLDERS folders...] [LINKS targets...] [PRIVATE_LINKS targets...])
#
# Adds the library of the current folder: target qz_NAME, for users qz::NAME, from all .cpp, .mm and .m files
# in the folder and the FOLDERS. LINKS are the libraries that the folder may use (docs/layers.md). HOT is for the
# libraries in which tests spend their time: they are optimised even in builds without a build type.
function(qz_library name)
  cmake_parse_arguments(arg "HOT" "" "LINKS;PRIVATE_LINKS;FOLDERS" ${ARGN})
  set(patterns *.cpp *.mm *.m)
  foreach(folder ${arg_FOLDERS})
    list(APPEND patterns ${folder}/*.cpp)
  endforeach()
  file(GLOB sources CONFIGURE_DEPENDS ${patterns})
  list(FILTER sources EXCLUDE REGEX "/main\\.cpp$")
  add_library(qz_${name} STATIC ${sources})
  add_library(qz::${name} ALIAS qz_${name})
  set_target_properties(qz_${name} PROPERTIES EXPORT_NAME ${name})
  target_compile_features(qz_${name} PUBLIC cxx_std_20)
  target_include_directories(qz_${name} PUBLIC
    $<BUILD_INTERFACE:${PROJECT_SOURCE_DIR}/include> $<INSTALL_INTERFACE:include>)
  target_link_libraries(qz_${name} PUBLIC ${arg_LINKS}
    PRIVATE $<BUILD_INTERFACE:qz_private> ${arg_PRIVATE_LINKS})
  install(TARGETS qz_${name} EXPORT qz_walkthrough)
  if(arg_HOT)
    target_compile_options(qz_${name} PRIVATE $<$<CONFIG:>:-O1>)
  endif()
endfunction()
