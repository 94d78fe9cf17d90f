# SPDX-License-Identifier: MIT
# qz_library(NAME [HOT] [INTERNAL] [IN LIBRARY] [FOLDERS folders...] [LINKS targets...] [PRIVATE_LINKS targets...])
#
# Adds the library of the current folder: target qz_NAME, for users qz::NAME, from all .cpp, .mm and .m files
# in the folder and the FOLDERS. LINKS are the libraries that the folder may use (docs/layers.md). HOT is for the
# libraries in which tests spend their time: they are optimised even in builds without a build type.
#
# LIBRARY is the installed library of which the folder is a part: qz, or qz-NAME for the toolkit NAME
# (cmake/install.cmake). A folder without it is not installed. INTERNAL says that hosts do not see the part.
function(qz_library name)
  cmake_parse_arguments(arg "HOT;INTERNAL" "IN" "LINKS;PRIVATE_LINKS;FOLDERS" ${ARGN})
  set(patterns *.cpp *.mm *.m)
  foreach(folder ${arg_FOLDERS})
    list(APPEND patterns ${folder}/*.cpp)
  endforeach()
  file(GLOB sources CONFIGURE_DEPENDS ${patterns})
  list(FILTER sources EXCLUDE REGEX "/main\\.cpp$")
  add_library(qz_${name} STATIC ${sources})
  add_library(qz::${name} ALIAS qz_${name})
  # The shared libraries are made from the same object files.
  set_target_properties(qz_${name} PROPERTIES
    POSITION_INDEPENDENT_CODE ON CXX_VISIBILITY_PRESET hidden OBJC_VISIBILITY_PRESET hidden
    OBJCXX_VISIBILITY_PRESET hidden VISIBILITY_INLINES_HIDDEN ON)
  target_compile_features(qz_${name} PUBLIC cxx_std_20)
  target_include_directories(qz_${name} PUBLIC ${PROJECT_SOURCE_DIR}/include)
  target_link_libraries(qz_${name} PUBLIC ${arg_LINKS} PRIVATE qz_private ${arg_PRIVATE_LINKS})
  if(arg_HOT)
    target_compile_options(qz_${name} PRIVATE $<$<CONFIG:>:-O1>)
  endif()
  if(arg_IN)
    set_property(GLOBAL APPEND PROPERTY QZ_LIBRARIES ${arg_IN})
    set_property(GLOBAL APPEND PROPERTY QZ_PARTS_${arg_IN} ${name})
  endif()
  if(arg_INTERNAL)
    set_property(GLOBAL APPEND PROPERTY QZ_INTERNAL_PARTS ${name})
  endif()
endfunction()
